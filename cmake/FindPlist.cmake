# libplist, which reads property lists: the target Plist::plist. It brings no package file for CMake,
# and who builds this project need not have pkg-config.

find_path(Plist_INCLUDE_DIR plist/plist.h)
find_library(Plist_LIBRARY plist-2.0)
mark_as_advanced(Plist_INCLUDE_DIR Plist_LIBRARY)

include(FindPackageHandleStandardArgs)
find_package_handle_standard_args(Plist
  REQUIRED_VARS Plist_LIBRARY Plist_INCLUDE_DIR
  REASON_FAILURE_MESSAGE "libplist 2.2 or newer reads a bundle's Info.plist (Debian: libplist-dev)")

if(Plist_FOUND AND NOT TARGET Plist::plist)
  add_library(Plist::plist UNKNOWN IMPORTED)
  set_target_properties(Plist::plist PROPERTIES
    IMPORTED_LOCATION ${Plist_LIBRARY}
    INTERFACE_INCLUDE_DIRECTORIES ${Plist_INCLUDE_DIR})
endif()
