# qorn_add_script_test(<name> [TIMEOUT <seconds>] [LABELS ...] [ENVIRONMENT <variable>=<value>...])
#
# One CTest test for each function of <name>.sh whose name begins with a capital. A line that begins
# with "[  SKIPPED ]" skips it; a failure may quote one.

include_guard(GLOBAL)

function(qorn_add_script_test name)
  cmake_parse_arguments(PARSE_ARGV 1 arg "" "TIMEOUT" "LABELS;ENVIRONMENT")
  if(NOT arg_TIMEOUT)
    set(arg_TIMEOUT 300)
  endif()
  set(script ${CMAKE_CURRENT_SOURCE_DIR}/${name}.sh)
  set_property(DIRECTORY APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS ${script})
  file(STRINGS ${script} cases REGEX "^[A-Z][A-Za-z0-9]*\\(\\) {")
  list(TRANSFORM cases REPLACE "\\(\\).*" "")
  foreach(case IN LISTS cases)
    add_test(NAME ${name}.${case} COMMAND bash ${script} ${case})
    set_tests_properties(${name}.${case} PROPERTIES
      SKIP_REGULAR_EXPRESSION "(^|\n)\\[  SKIPPED \\]"
      TIMEOUT ${arg_TIMEOUT}
      LABELS "${arg_LABELS}"
      ENVIRONMENT "${arg_ENVIRONMENT}")
  endforeach()
endfunction()
