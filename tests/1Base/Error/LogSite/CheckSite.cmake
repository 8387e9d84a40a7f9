# Looks at what the function `site` of an object file refers to, code or data, outside of itself:
# nothing at all where CALLS is off, something of the error module where it is on. The function
# stands in a section of its own.

execute_process(COMMAND ${OBJDUMP} --syms --reloc --section=.text.site ${OBJECT}
  OUTPUT_VARIABLE contents COMMAND_ERROR_IS_FATAL ANY)
if(NOT contents MATCHES "[ \t]site\n")
  message(FATAL_ERROR "There is no function `site` in ${OBJECT}:\n${contents}")
endif()
string(REGEX MATCHALL "R_[A-Z0-9_]+ +[^\n]+" references "${contents}")

if(CALLS)
  if(NOT references MATCHES "5Error")
    message(FATAL_ERROR "The call has vanished:\n${contents}")
  endif()
elseif(references)
  message(FATAL_ERROR "The call has left something behind:\n${contents}")
endif()
