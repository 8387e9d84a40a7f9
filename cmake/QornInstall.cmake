# What `cmake --install` brings, as two components: `library`, the product and its Java class, and
# `development`, the floors with their headers, CMake's package and pkg-config's files. Nothing
# installed names a place of the machine that built it, so the tree may be moved.

include_guard(GLOBAL)
include(CMakePackageConfigHelpers)
include(GNUInstallDirs)

set(QORN_INSTALL_HEADERS ${CMAKE_INSTALL_INCLUDEDIR}/qorn)
set(QORN_INSTALL_CMAKE ${CMAKE_INSTALL_LIBDIR}/cmake/qorn)

if(QORN_BUILD_BRIDGE)
  # The folder in which Debian's Java machines look for such libraries.
  set(jni ${CMAKE_INSTALL_LIBDIR}/jni)
  install(TARGETS QORNOpenOffice DESTINATION ${jni} COMPONENT library)
  if(NOT APPLE)
    install(FILES $<TARGET_FILE_DIR:QORNOpenOffice>/libQORNOpenOffice.so
      DESTINATION ${jni} COMPONENT library)
  endif()
  install(FILES ${PROJECT_BINARY_DIR}/java/qorn.jar
    DESTINATION ${CMAKE_INSTALL_DATADIR}/java COMPONENT library)
endif()

set(folders 0Platform 1Base 2System 3Util)
if(APPLE)
  list(REMOVE_ITEM folders 0Platform)
endif()
list(TRANSFORM folders PREPEND ${PROJECT_SOURCE_DIR}/src/)
install(DIRECTORY ${folders}
  DESTINATION ${QORN_INSTALL_HEADERS} COMPONENT development
  FILES_MATCHING PATTERN *.h PATTERN _Imp EXCLUDE)
# Included by a public header.
install(FILES ${PROJECT_SOURCE_DIR}/src/1Base/StdUtil/_Imp/StdUtilDecimal.h
  DESTINATION ${QORN_INSTALL_HEADERS}/1Base/StdUtil/_Imp COMPONENT development)

# What the archives were built with, to the number from which on its names change.
string(REGEX MATCH "^[0-9]+\\.[0-9]+" QORN_BOOST_VERSION "${Boost_VERSION}")
string(REGEX MATCH "^[0-9]+" QORN_ICU_VERSION "${ICU_VERSION}")
if(QORN_ICU_VERSION)
  math(EXPR QORN_ICU_NEXT_VERSION "${QORN_ICU_VERSION} + 1")
endif()

# Each stands on the ones before it.
set(QORN_COMPONENTS 0platform 1base 2system 3util foundation)
foreach(component IN LISTS QORN_COMPONENTS)
  set_target_properties(qorn_${component} PROPERTIES EXPORT_NAME ${component})
  install(TARGETS qorn_${component} EXPORT qorn-${component} COMPONENT development)
  # A set for each, so that whoever wants the lower ones needs nothing of the upper.
  install(EXPORT qorn-${component}
    NAMESPACE qorn:: DESTINATION ${QORN_INSTALL_CMAKE} COMPONENT development)
endforeach()
target_include_directories(qorn_0platform INTERFACE
  $<INSTALL_INTERFACE:${QORN_INSTALL_HEADERS}>)
if(NOT APPLE)
  target_include_directories(qorn_0platform INTERFACE
    $<INSTALL_INTERFACE:${QORN_INSTALL_HEADERS}/0Platform>)
endif()

set(generated ${PROJECT_BINARY_DIR}/installed)
configure_package_config_file(cmake/qorn-config.cmake.in ${generated}/qorn-config.cmake
  INSTALL_DESTINATION ${QORN_INSTALL_CMAKE})
write_basic_package_version_file(${generated}/qorn-config-version.cmake
  COMPATIBILITY SameMinorVersion)
install(FILES ${generated}/qorn-config.cmake ${generated}/qorn-config-version.cmake
  DESTINATION ${QORN_INSTALL_CMAKE} COMPONENT development)
if(NOT APPLE)
  install(FILES cmake/FindPlist.cmake DESTINATION ${QORN_INSTALL_CMAKE} COMPONENT development)
endif()

include(QornPkgConfig)
foreach(component IN LISTS QORN_COMPONENTS)
  qorn_configure_pkg_config(${component} ${generated}/qorn-${component}.pc)
  install(FILES ${generated}/qorn-${component}.pc
    DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig COMPONENT development)
endforeach()
