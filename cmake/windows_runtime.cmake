# Copies the mingw-w64 C++ runtime DLLs beside the built programs, so that
# they run without any extra DLL search path. One shared runtime also lets
# exceptions cross from the module to its host.
foreach(dll libstdc++-6.dll libgcc_s_seh-1.dll libwinpthread-1.dll)
  execute_process(COMMAND ${CMAKE_CXX_COMPILER} -print-file-name=${dll}
                  OUTPUT_VARIABLE found OUTPUT_STRIP_TRAILING_WHITESPACE)
  if(NOT EXISTS "${found}")
    message(FATAL_ERROR "cannot find ${dll} of the mingw-w64 runtime")
  endif()
  file(COPY "${found}" DESTINATION ${CMAKE_RUNTIME_OUTPUT_DIRECTORY})
endforeach()
