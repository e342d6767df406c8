# Runs a program and fails unless its standard output equals a file. A build
# date in the output ("Dec  6 2026") reads as <date>.
# -DCOMMAND=<program;args...> -DEXPECTED=<file> -DACTUAL=<file to keep the output in>
execute_process(COMMAND ${COMMAND} OUTPUT_VARIABLE output RESULT_VARIABLE status)
string(REGEX REPLACE "[A-Z][a-z][a-z] [ 1-3][0-9] [12][0-9][0-9][0-9]" "<date>" output "${output}")
file(READ "${EXPECTED}" expected)
if(NOT output STREQUAL expected)
  file(WRITE "${ACTUAL}" "${output}")
  message(FATAL_ERROR "output differs from ${EXPECTED} (exit status ${status}); see ${ACTUAL}")
endif()
