# Runs a program and fails unless its standard output equals a file.
# -DCOMMAND=<program;args...> -DEXPECTED=<file>
execute_process(COMMAND ${COMMAND} OUTPUT_VARIABLE output RESULT_VARIABLE status)
file(READ "${EXPECTED}" expected)
if(NOT output STREQUAL expected)
  file(WRITE "${CMAKE_CURRENT_BINARY_DIR}/actual_output.txt" "${output}")
  message(FATAL_ERROR "output differs from ${EXPECTED} (exit status ${status}); "
                      "see ${CMAKE_CURRENT_BINARY_DIR}/actual_output.txt")
endif()
