# cmake -DPROGRAM=<program> -DSOURCE=<its source> -P CheckExample.cmake
#
# Fails unless the program prints what its source says: the lines of the comment behind "// Prints:",
# each indented by five blanks.

cmake_minimum_required(VERSION 3.25)

file(READ ${SOURCE} text)
if(NOT text MATCHES "\n// Prints:\n((//     [^\n]*\n)+)")
  message(FATAL_ERROR "${SOURCE} does not say what it prints")
endif()
string(REGEX REPLACE "(^|\n)//     " "\\1" expected "${CMAKE_MATCH_1}")

execute_process(COMMAND ${PROGRAM}
  OUTPUT_VARIABLE actual
  RESULT_VARIABLE status)
if(NOT status EQUAL 0)
  message(FATAL_ERROR "${PROGRAM} ended with ${status}")
endif()
if(NOT actual STREQUAL expected)
  message(FATAL_ERROR "${PROGRAM} printed\n${actual}instead of\n${expected}")
endif()
