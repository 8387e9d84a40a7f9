# qorn_add_test(<name> [SOURCES ...] [LINUX ...] [LIBRARIES ...] [WRAP ...] [LABELS ...])
#
# A test program of GoogleTest. Each of its tests becomes a CTest test in a process of its own, so
# that caches and singletons start fresh. WRAP names functions of other units that the program puts
# its own `__wrap_` versions in front of at link time.
#
# LINUX takes the sources that need Linux: for what they test, or since WRAP or one of the LIBRARIES
# puts functions in front of others for them, which the linker of macOS can't. There the program is
# made of SOURCES alone, and the others count as one skipped test. What needs more than a source to
# be left out stands in `if(NOT APPLE)`.

include_guard(GLOBAL)
include(GoogleTest)
if(NOT TARGET GTest::gtest_main)
  find_package(GTest REQUIRED)
endif()

# qorn_library_symbol(<variable> <name with libstdc++> <name with libc++>)
#
# The linker's name of a function whose signature holds a text: it differs with the library.
function(qorn_library_symbol variable of_libstdcxx of_libcxx)
  if(QORN_LIBCXX OR APPLE)
    set(${variable} ${of_libcxx} PARENT_SCOPE)
  else()
    set(${variable} ${of_libstdcxx} PARENT_SCOPE)
  endif()
endfunction()

# qorn_add_skipped_test(<name> <reason>)
function(qorn_add_skipped_test name reason)
  set(mark "[  SKIPPED ]")
  add_test(NAME ${name} COMMAND ${CMAKE_COMMAND} -E echo "${mark} ${reason}")
  set_tests_properties(${name} PROPERTIES SKIP_REGULAR_EXPRESSION "\\[  SKIPPED \\]")
endfunction()

function(qorn_add_test name)
  cmake_parse_arguments(PARSE_ARGV 1 arg "" "" "SOURCES;LINUX;LIBRARIES;WRAP;LABELS")
  if(APPLE)
    if(arg_LINUX)
      qorn_add_skipped_test(${name}.Linux "these tests are Linux's alone")
    elseif(arg_WRAP)
      message(FATAL_ERROR "${name}: the sources that need WRAP belong behind LINUX")
    endif()
    set(arg_LINUX)
    set(arg_WRAP)
    if(NOT arg_SOURCES)
      return()
    endif()
  endif()
  add_executable(${name} ${arg_SOURCES} ${arg_LINUX})
  if(QORN_SANITIZE)
    target_sources(${name} PRIVATE ${PROJECT_SOURCE_DIR}/tests/support/SanitizerOptions.cpp)
  endif()
  target_link_libraries(${name} PRIVATE
    qorn_test_support ${arg_LIBRARIES} GTest::gtest_main qorn_build_options)
  target_compile_definitions(${name} PRIVATE
    QORN_TEST_DATA="${PROJECT_SOURCE_DIR}/tests/data")
  foreach(symbol IN LISTS arg_WRAP)
    target_link_options(${name} PRIVATE LINKER:--wrap=${symbol})
  endforeach()
  if(arg_LABELS)
    set(labels LABELS "${arg_LABELS}")
  endif()
  gtest_discover_tests(${name}
    DISCOVERY_TIMEOUT 120
    PROPERTIES
      TIMEOUT 300
      SKIP_REGULAR_EXPRESSION "\\[  SKIPPED \\]"
      ${labels})
endfunction()
