# qorn_add_compile_failure_test(<name> SOURCE <file> EXPECT <regex> [LIBRARIES ...] [OPTIONS ...])
#
# A test that a wrong use does not compile. The source holds the wrong form under
# `#ifdef QORN_WRONG_USE` and the right one, as like it as can be, under `#else`:
#
#     #ifdef QORN_WRONG_USE
#         auto const joined = list + list;
#     #else
#         auto const joined = parameter + list;
#     #endif
#
# The test passes only if the right form compiles and the wrong one fails with a message that matches
# EXPECT, so a misspelt name or a missing header does not pass for the refusal that is meant. GCC and
# clang word their messages differently: EXPECT names what is common to both, or an alternative.
# LIBRARIES are targets whose include folders and definitions the source needs, OPTIONS are the
# compiler's.

include_guard(GLOBAL)

function(qorn_add_compile_failure_test name)
  cmake_parse_arguments(PARSE_ARGV 1 arg "" "SOURCE;EXPECT" "LIBRARIES;OPTIONS")
  set(usage qorn_compile_failure_${name})
  add_library(${usage} INTERFACE)
  target_link_libraries(${usage} INTERFACE ${arg_LIBRARIES})

  set(flags ${CMAKE_CXX17_EXTENSION_COMPILE_OPTION} ${arg_OPTIONS})
  if(CMAKE_OSX_SYSROOT)
    list(APPEND flags -isysroot ${CMAKE_OSX_SYSROOT})
  endif()
  set(run ${CMAKE_CURRENT_BINARY_DIR}/${name}-$<CONFIG>.cmake)
  file(GENERATE OUTPUT ${run} CONTENT "
set(compiler [==[${CMAKE_CXX_COMPILER}]==])
set(flags [==[${flags}]==])
set(includes [==[$<TARGET_PROPERTY:${usage},INTERFACE_INCLUDE_DIRECTORIES>]==])
set(definitions [==[$<TARGET_PROPERTY:${usage},INTERFACE_COMPILE_DEFINITIONS>]==])
set(source [==[${CMAKE_CURRENT_SOURCE_DIR}/${arg_SOURCE}]==])
set(expected [==[${arg_EXPECT}]==])
include([==[${PROJECT_SOURCE_DIR}/cmake/QornCompileFailureRun.cmake]==])
")
  add_test(NAME CompileFailure.${name} COMMAND ${CMAKE_COMMAND} -P ${run})
  set_tests_properties(CompileFailure.${name} PROPERTIES TIMEOUT 300)
endfunction()
