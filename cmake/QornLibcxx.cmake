# With QORN_LIBCXX: the system's archives hold the types of another standard library, so those of
# Boost and GoogleTest are built here, into the targets that find_package would make. Headers that
# hold all of their code are the system's.

include_guard(GLOBAL)
if(NOT CMAKE_CXX_COMPILER_ID MATCHES Clang)
  message(FATAL_ERROR "libc++ needs clang: use the preset \"libcxx\"")
endif()
set(QORN_BOOST_SOURCE ${PROJECT_BINARY_DIR}/boost CACHE PATH "What scripts/fetch-boost fetched")
set(QORN_GOOGLETEST_SOURCE /usr/src/googletest CACHE PATH "The sources of GoogleTest")
if(NOT EXISTS ${QORN_BOOST_SOURCE}/libs)
  message(FATAL_ERROR
    "Boost's sources are missing; \"scripts/fetch-boost ${QORN_BOOST_SOURCE}\" fetches them")
endif()

add_compile_options(-stdlib=libc++)
add_link_options(-stdlib=libc++)
find_package(Boost 1.81 REQUIRED)
find_package(Threads REQUIRED)

# qorn_add_boost(<name> SOURCES ... [DEFINITIONS ...]): the archive Boost::<name>.
function(qorn_add_boost name)
  cmake_parse_arguments(PARSE_ARGV 1 arg "" "" "SOURCES;DEFINITIONS")
  set(folder ${QORN_BOOST_SOURCE}/libs/${name}/src)
  list(TRANSFORM arg_SOURCES PREPEND ${folder}/)
  add_library(qorn_boost_${name} STATIC ${arg_SOURCES})
  add_library(Boost::${name} ALIAS qorn_boost_${name})
  set_target_properties(qorn_boost_${name} PROPERTIES
    ARCHIVE_OUTPUT_DIRECTORY ${PROJECT_BINARY_DIR}/lib)
  string(TOUPPER ${name} upper)
  target_compile_features(qorn_boost_${name} PUBLIC cxx_std_17)
  target_compile_definitions(qorn_boost_${name}
    PUBLIC BOOST_${upper}_NO_LIB BOOST_${upper}_STATIC_LINK
    PRIVATE BOOST_${upper}_SOURCE ${arg_DEFINITIONS})
  target_include_directories(qorn_boost_${name} PRIVATE ${folder})
  target_link_libraries(qorn_boost_${name} PUBLIC Boost::headers Threads::Threads)
endfunction()

# The definitions are what Boost's own build finds on Debian.
qorn_add_boost(filesystem
  SOURCES
    codecvt_error_category.cpp directory.cpp exception.cpp operations.cpp path.cpp path_traits.cpp
    portability.cpp unique_path.cpp utf8_codecvt_facet.cpp
  DEFINITIONS
    BOOST_FILESYSTEM_HAS_FDOPENDIR_NOFOLLOW
    BOOST_FILESYSTEM_HAS_INIT_PRIORITY
    BOOST_FILESYSTEM_HAS_POSIX_AT_APIS
    BOOST_FILESYSTEM_HAS_STATX
    BOOST_FILESYSTEM_HAS_STAT_ST_BLKSIZE
    BOOST_FILESYSTEM_HAS_STAT_ST_MTIM
    BOOST_FILESYSTEM_NO_CXX20_ATOMIC_REF)
qorn_add_boost(thread
  SOURCES future.cpp pthread/once.cpp pthread/thread.cpp)

if(QORN_BUILD_TESTS)
  set(BUILD_GMOCK OFF)
  set(INSTALL_GTEST OFF)
  add_subdirectory(${QORN_GOOGLETEST_SOURCE} ${PROJECT_BINARY_DIR}/googletest EXCLUDE_FROM_ALL)
endif()
