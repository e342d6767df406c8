# The coverage target: runs the whole suite, then reports line and branch
# coverage of host/, plugin/, commands/ and tools/, and fails when plugin/ and
# commands/ fall below 95% of their lines.
find_program(GCOVR gcovr REQUIRED)
set(_filters --filter "${PROJECT_SOURCE_DIR}/host/" --filter "${PROJECT_SOURCE_DIR}/plugin/"
             --filter "${PROJECT_SOURCE_DIR}/commands/" --filter "${PROJECT_SOURCE_DIR}/tools/")
add_custom_target(coverage
  COMMAND ${CMAKE_COMMAND} -E echo "== running the test suite"
  COMMAND find ${CMAKE_BINARY_DIR} -name "*.gcda" -delete
  COMMAND ${CMAKE_CTEST_COMMAND} --test-dir ${CMAKE_BINARY_DIR} --output-on-failure
  COMMAND ${CMAKE_COMMAND} -E echo "== host/, plugin/, commands/, tools/: lines and branches"
  COMMAND ${GCOVR} --root ${PROJECT_SOURCE_DIR} ${_filters} --exclude-throw-branches
          --exclude-unreachable-branches --print-summary ${CMAKE_BINARY_DIR}
  COMMAND ${CMAKE_COMMAND} -E echo "== plugin/ and commands/: at least 95% of lines"
  COMMAND ${GCOVR} --root ${PROJECT_SOURCE_DIR} --filter "${PROJECT_SOURCE_DIR}/plugin/"
          --filter "${PROJECT_SOURCE_DIR}/commands/" --exclude-throw-branches
          --exclude-unreachable-branches --print-summary --fail-under-line 95 ${CMAKE_BINARY_DIR}
  WORKING_DIRECTORY ${CMAKE_BINARY_DIR}
  USES_TERMINAL
  VERBATIM)
add_dependencies(coverage host_tests module_tests console_tests boundary_test tavix-host TavixStringCmds)
