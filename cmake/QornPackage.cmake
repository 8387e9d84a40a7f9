# The Debian packages that `cmake --build <build> --target package` makes, one of each component: a
# host that runs the extension needs no compiler, and who builds on the floors needs no Java.

include_guard(GLOBAL)
if(APPLE)
  return()
endif()

set(CPACK_GENERATOR DEB)
set(CPACK_VERBATIM_VARIABLES ON)
set(CPACK_STRIP_FILES ON)
set(CPACK_PACKAGE_CONTACT "QORN developers <qorn@example.org>")
set(CPACK_PACKAGING_INSTALL_PREFIX /usr)
set(CPACK_COMPONENTS_ALL development)
if(QORN_BUILD_BRIDGE)
  list(APPEND CPACK_COMPONENTS_ALL library)
endif()
set(CPACK_PRE_BUILD_SCRIPTS ${PROJECT_SOURCE_DIR}/cmake/QornPackageTree.cmake)

set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_COMPRESSION_TYPE xz)

set(CPACK_DEBIAN_LIBRARY_PACKAGE_NAME libqorn-jni)
set(CPACK_DEBIAN_LIBRARY_PACKAGE_SECTION java)
set(CPACK_DEBIAN_LIBRARY_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_LIBRARY_PACKAGE_SUGGESTS "default-jre-headless | java11-runtime-headless")
set(CPACK_COMPONENT_LIBRARY_DESCRIPTION
  "The library with the native methods, and the Java class that declares them.")

set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_NAME libqorn-dev)
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_SECTION libdevel)
string(CONCAT CPACK_DEBIAN_DEVELOPMENT_PACKAGE_DEPENDS
  "libboost${QORN_BOOST_VERSION}-dev, libboost-filesystem${QORN_BOOST_VERSION}-dev, "
  "libboost-thread${QORN_BOOST_VERSION}-dev, "
  "libicu-dev (>= ${QORN_ICU_VERSION}), libicu-dev (<< ${QORN_ICU_NEXT_VERSION}~), "
  "libplist-dev (>= 2.2)")
set(CPACK_COMPONENT_DEVELOPMENT_DESCRIPTION
  "Headers and static libraries of the foundation in C++17 beneath the library, with the files
by which CMake and pkg-config find them.")

include(CPack)
