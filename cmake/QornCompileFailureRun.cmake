# The body of a test made by qorn_add_compile_failure_test, which sets what is used here: compiler,
# flags, includes, definitions, source, expected.

set(ENV{LC_ALL} C)
list(TRANSFORM includes PREPEND -I)
list(TRANSFORM definitions PREPEND -D)
set(compile ${compiler} ${flags} ${definitions} ${includes} -fsyntax-only)

execute_process(COMMAND ${compile} ${source} RESULT_VARIABLE result ERROR_VARIABLE messages)
if(NOT result EQUAL 0)
  message(FATAL_ERROR "The right form does not compile:\n${messages}")
endif()

execute_process(COMMAND ${compile} -DQORN_WRONG_USE ${source}
  RESULT_VARIABLE result ERROR_VARIABLE messages)
if(result EQUAL 0)
  message(FATAL_ERROR "The wrong form compiles.")
endif()
if(NOT messages MATCHES "${expected}")
  message(FATAL_ERROR "The wrong form fails, but nothing matches '${expected}':\n${messages}")
endif()
