# Runs a program and fails unless its standard output equals a file's text, or
# what a second program prints. A build date in the output ("Dec  6 2026")
# reads as <date>.
# -DCOMMAND=<program;args...> -DEXPECTED=<file> or -DEXPECTED_COMMAND=<program;args...>
# -DACTUAL=<file to keep the output in when it differs>
execute_process(COMMAND ${COMMAND} OUTPUT_VARIABLE output RESULT_VARIABLE status)
string(REGEX REPLACE "[A-Z][a-z][a-z] [ 1-3][0-9] [12][0-9][0-9][0-9]" "<date>" output "${output}")
if(DEFINED EXPECTED_COMMAND)
  list(GET EXPECTED_COMMAND 0 reference)
  if(NOT EXISTS "${reference}")
    message("${reference} is not built yet: nothing to compare with")
    return()
  endif()
  execute_process(COMMAND ${EXPECTED_COMMAND} OUTPUT_VARIABLE expected)
  set(EXPECTED "what ${reference} prints")
else()
  file(READ "${EXPECTED}" expected)
endif()
if(NOT output STREQUAL expected)
  file(WRITE "${ACTUAL}" "${output}")
  message(FATAL_ERROR "output differs from ${EXPECTED} (exit status ${status}); see ${ACTUAL}")
endif()
