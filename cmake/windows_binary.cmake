# How this project's Windows binaries are made beyond compiling and linking:
# a version resource (Explorer's Details, and what scanners look for) and an
# image version, both from the project's version; and no manifest in a DLL,
# where it means nothing.
find_program(TAVIX_RC NAMES llvm-rc llvm-rc-14 REQUIRED)
foreach(rule CMAKE_C_CREATE_SHARED_LIBRARY CMAKE_CXX_CREATE_SHARED_LIBRARY
             CMAKE_C_CREATE_SHARED_MODULE CMAKE_CXX_CREATE_SHARED_MODULE)
  string(REPLACE "/MANIFEST:EMBED" "/MANIFEST:NO" ${rule} "${${rule}}")
endforeach()
set(version ${PROJECT_VERSION_MAJOR}.${PROJECT_VERSION_MINOR})
foreach(rule CMAKE_C_CREATE_SHARED_LIBRARY CMAKE_CXX_CREATE_SHARED_LIBRARY
             CMAKE_C_CREATE_SHARED_MODULE CMAKE_CXX_CREATE_SHARED_MODULE CMAKE_C_LINK_EXECUTABLE
             CMAKE_CXX_LINK_EXECUTABLE)
  string(REPLACE "/version:<TARGET_VERSION_MAJOR>.<TARGET_VERSION_MINOR>" "/version:${version}"
                 ${rule} "${${rule}}")
endforeach()

# Gives target, whose file is file_name, a version resource with description.
function(tavix_windows_binary target file_name description)
  get_target_property(type ${target} TYPE)
  set(file_type 0x2)  # a DLL
  if(type STREQUAL "EXECUTABLE")
    set(file_type 0x1)
  endif()
  set(rc ${CMAKE_CURRENT_BINARY_DIR}/${target}.rc)
  set(res ${CMAKE_CURRENT_BINARY_DIR}/${target}.res)
  configure_file(${CMAKE_CURRENT_FUNCTION_LIST_DIR}/version.rc.in ${rc} @ONLY)
  add_custom_command(OUTPUT ${res} COMMAND ${TAVIX_RC} -no-preprocess -FO ${res} -- ${rc}
                     DEPENDS ${rc} VERBATIM)
  set_source_files_properties(${res} PROPERTIES EXTERNAL_OBJECT TRUE GENERATED TRUE)
  target_sources(${target} PRIVATE ${res})
endfunction()
