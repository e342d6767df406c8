# The coverage target: runs the whole suite, then reports line and branch
# coverage of tavixcore/, module/ and console/, and fails when module/ falls
# below 95% of its lines.
find_program(GCOVR gcovr REQUIRED)
set(_filters --filter "${PROJECT_SOURCE_DIR}/tavixcore/" --filter "${PROJECT_SOURCE_DIR}/module/"
             --filter "${PROJECT_SOURCE_DIR}/console/")
add_custom_target(coverage
  COMMAND ${CMAKE_COMMAND} -E echo "== running the test suite"
  COMMAND find ${CMAKE_BINARY_DIR} -name "*.gcda" -delete
  COMMAND ${CMAKE_CTEST_COMMAND} --test-dir ${CMAKE_BINARY_DIR} --output-on-failure
  COMMAND ${CMAKE_COMMAND} -E echo "== tavixcore/, module/, console/: lines and branches"
  COMMAND ${GCOVR} --root ${PROJECT_SOURCE_DIR} ${_filters} --exclude-throw-branches
          --exclude-unreachable-branches --print-summary ${CMAKE_BINARY_DIR}
  COMMAND ${CMAKE_COMMAND} -E echo "== module/: at least 95% of lines"
  COMMAND ${GCOVR} --root ${PROJECT_SOURCE_DIR} --filter "${PROJECT_SOURCE_DIR}/module/"
          --exclude-throw-branches --exclude-unreachable-branches --print-summary
          --fail-under-line 95 ${CMAKE_BINARY_DIR}
  WORKING_DIRECTORY ${CMAKE_BINARY_DIR}
  USES_TERMINAL
  VERBATIM)
add_dependencies(coverage host_tests module_tests console_tests boundary_test tavix-host TavixStringCmds)
