# The Windows build's own tests, beside the script cases.

# The module's binary interface: its export table, the DLLs and the TavixCore
# names it imports, the virtual table slots of the classes hosts call through,
# and the layouts of what it holds by value, in both ABIs.
find_program(TAVIX_READOBJ NAMES llvm-readobj llvm-readobj-14 REQUIRED)
find_program(TAVIX_UNDNAME NAMES llvm-undname llvm-undname-14 REQUIRED)
add_test(NAME export_audit
         COMMAND bash ${CMAKE_CURRENT_SOURCE_DIR}/pe_audit.sh exports $<TARGET_FILE:TavixStringCmds>)
add_test(NAME dll_audit
         COMMAND bash ${CMAKE_CURRENT_SOURCE_DIR}/pe_audit.sh imports $<TARGET_FILE:TavixStringCmds>)
add_test(NAME import_audit
         COMMAND bash ${CMAKE_CURRENT_SOURCE_DIR}/import_audit.sh pe $<TARGET_FILE:TavixStringCmds>
                 ${CMAKE_CURRENT_SOURCE_DIR}/expected/imports.txt)
set_tests_properties(export_audit dll_audit import_audit PROPERTIES
  ENVIRONMENT "READOBJ=${TAVIX_READOBJ};UNDNAME=${TAVIX_UNDNAME}")
add_test(NAME slot_audit COMMAND bash ${CMAKE_CURRENT_SOURCE_DIR}/slot_audit.sh)
add_test(NAME layout_audit COMMAND bash ${CMAKE_CURRENT_SOURCE_DIR}/layout_audit.sh)
set_tests_properties(slot_audit layout_audit PROPERTIES
  ENVIRONMENT "CLANGXX=${CMAKE_CXX_COMPILER};MINGW_INCLUDE=${TAVIX_MINGW_ROOT}/include")

# Every script case file prints, as JSON, byte for byte what the Linux console
# prints. Skipped until the Linux console is built at TAVIX_LINUX_HOST.
set(TAVIX_LINUX_HOST ${PROJECT_SOURCE_DIR}/build/default/bin/tavix-host
    CACHE FILEPATH "The Linux console whose output the Windows one must match")
foreach(case_file ${case_files})
  get_filename_component(topic ${case_file} NAME_WE)
  add_test(NAME same_as_linux.${topic}
           COMMAND ${CMAKE_COMMAND} "-DCOMMAND=${host_command};--json;${case_file}"
                   "-DEXPECTED_COMMAND=${TAVIX_LINUX_HOST};--json;${case_file}"
                   -DACTUAL=${CMAKE_CURRENT_BINARY_DIR}/actual_${topic}.json
                   -P ${PROJECT_SOURCE_DIR}/cmake/compare_output.cmake)
  set_tests_properties(same_as_linux.${topic} PROPERTIES SKIP_REGULAR_EXPRESSION "not built yet")
endforeach()

# The console with names outside the code page, load errors in words and long paths.
add_test(NAME windows_console
         COMMAND bash ${CMAKE_CURRENT_SOURCE_DIR}/windows_console.sh $<TARGET_FILE:TavixStringCmds>
                 ${host_command})

# Shipping as the Microsoft toolchain ships: hardened, versioned, with symbols;
# no hidden state per thread in the module; and a smashed stack stops the process.
foreach(binary TavixStringCmds TavixCore tavix-host)
  add_test(NAME shipping_audit.${binary}
           COMMAND bash ${CMAKE_CURRENT_SOURCE_DIR}/pe_audit.sh shipping $<TARGET_FILE:${binary}>)
  set_tests_properties(shipping_audit.${binary} PROPERTIES ENVIRONMENT "READOBJ=${TAVIX_READOBJ}")
endforeach()
add_test(NAME thread_state_audit
         COMMAND bash ${CMAKE_CURRENT_SOURCE_DIR}/pe_audit.sh thread-state $<TARGET_FILE:TavixStringCmds>)
set_tests_properties(thread_state_audit PROPERTIES ENVIRONMENT "READOBJ=${TAVIX_READOBJ}")
add_executable(stack_smash_test stack_smash_test.cpp)
add_test(NAME stack_smash_test COMMAND stack_smash_test)

# The boundary test again, with the host program and TavixCore taking their
# exception runtime from vcruntime140.dll (which wine provides), while the
# module keeps the UCRT's: both runtimes in one process, throwing across. The
# import library names only the exception runtime's entries.
find_program(TAVIX_DLLTOOL NAMES llvm-dlltool llvm-dlltool-14 REQUIRED)
set(vcruntime_def ${CMAKE_CURRENT_BINARY_DIR}/vcruntime140.def)
set(vcruntime_lib ${CMAKE_CURRENT_BINARY_DIR}/vcruntime140.lib)
file(WRITE ${vcruntime_def} "LIBRARY vcruntime140.dll\nEXPORTS\n_CxxThrowException\n"
                            "__CxxFrameHandler3\n__C_specific_handler\n")
add_custom_command(OUTPUT ${vcruntime_lib}
                   COMMAND ${TAVIX_DLLTOOL} -m i386:x86-64 -d ${vcruntime_def} -l ${vcruntime_lib}
                   DEPENDS ${vcruntime_def})
add_custom_target(vcruntime140_import DEPENDS ${vcruntime_lib})
get_target_property(core_sources TavixCore SOURCES)
list(FILTER core_sources INCLUDE REGEX "\\.cpp$")
list(TRANSFORM core_sources PREPEND ${PROJECT_SOURCE_DIR}/tavixcore/)
add_library(TavixCore_vcruntime SHARED ${core_sources})
target_include_directories(TavixCore_vcruntime PUBLIC ${PROJECT_SOURCE_DIR}/tavixcore/include)
target_compile_definitions(TavixCore_vcruntime PRIVATE TAVIXCORE_BUILDING)
target_link_libraries(TavixCore_vcruntime PRIVATE ${vcruntime_lib})
add_dependencies(TavixCore_vcruntime vcruntime140_import)
set_target_properties(TavixCore_vcruntime PROPERTIES
  OUTPUT_NAME TavixCore PREFIX ""
  RUNTIME_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/bin/vcruntime
  ARCHIVE_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/lib/vcruntime
  PDB_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/bin/vcruntime)
add_executable(boundary_test_vcruntime boundary_test.cpp)
target_link_libraries(boundary_test_vcruntime PRIVATE ${vcruntime_lib} tavix_test_support)
add_dependencies(boundary_test_vcruntime TavixCore_vcruntime TavixStringCmds vcruntime140_import)
set_target_properties(boundary_test_vcruntime PROPERTIES
  RUNTIME_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/bin/vcruntime)
add_test(NAME boundary_test.vcruntime
         COMMAND boundary_test_vcruntime $<TARGET_FILE:TavixStringCmds> --vcruntime)
