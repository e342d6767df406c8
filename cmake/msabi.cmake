# Builds for Windows in the Microsoft C++ ABI with clang and lld-link, on
# mingw-w64's C headers and UCRT import libraries, without any C++ standard
# library: msabi/ provides <new> and the runtime's static part. wine runs
# what was built.
set(CMAKE_SYSTEM_NAME Windows)
set(CMAKE_SYSTEM_PROCESSOR AMD64)
set(CMAKE_C_COMPILER clang)
set(CMAKE_CXX_COMPILER clang++)
set(CMAKE_C_COMPILER_TARGET x86_64-pc-windows-msvc)
set(CMAKE_CXX_COMPILER_TARGET x86_64-pc-windows-msvc)
set(CMAKE_LINKER lld-link)
set(CMAKE_AR llvm-ar)
set(TAVIX_MINGW_ROOT /usr/x86_64-w64-mingw32 CACHE PATH "mingw-w64's C headers and import libraries")

execute_process(COMMAND ${CMAKE_CXX_COMPILER} -print-resource-dir
                OUTPUT_VARIABLE _resource OUTPUT_STRIP_TRAILING_WHITESPACE)
# -fgnuc-version: mingw-w64's headers do not parse without it. Hardened as the
# Microsoft toolchain hardens by default: stack cookies (/GS) and
# control-flow guard; CodeView debug information for PDBs.
set(_flags "-fgnuc-version=12 -nostdinc -isystem ${CMAKE_CURRENT_LIST_DIR}/../msabi/include \
-isystem ${_resource}/include -isystem ${TAVIX_MINGW_ROOT}/include -D_UCRT \
-fstack-protector-strong -Xclang -cfguard -fno-threadsafe-statics -gcodeview \
-Wno-unused-command-line-argument")
set(CMAKE_C_FLAGS_INIT "${_flags}")
set(CMAKE_CXX_FLAGS_INIT "${_flags}")
# No default libraries: the UCRT's import libraries and msabi/ stand in for
# them; the entry points are msabi/'s. Control-flow guard's tables and CET
# shadow-stack compatibility; a PDB named in the binary without its folder;
# a timestamp derived from the content (/Brepro), and paths in the PDB taken
# from one fixed base rather than the build folder, so that a build repeats
# byte for byte wherever it is made.
set(_link "-fuse-ld=lld-link -nostdlib -Xlinker /nodefaultlib -Xlinker /guard:cf \
-Xlinker /cetcompat -Xlinker /debug -Xlinker /pdbaltpath:%_PDB% -Xlinker /Brepro \
-Xlinker /pdbsourcepath:C:/TavixStringCmds")
set(CMAKE_EXE_LINKER_FLAGS_INIT "${_link} -Xlinker /entry:mainCRTStartup")
set(CMAKE_SHARED_LINKER_FLAGS_INIT "${_link} -Xlinker /entry:_DllMainCRTStartup")
set(CMAKE_MODULE_LINKER_FLAGS_INIT "${_link} -Xlinker /entry:_DllMainCRTStartup")
set(CMAKE_C_STANDARD_LIBRARIES "${TAVIX_MINGW_ROOT}/lib/libucrt.a ${TAVIX_MINGW_ROOT}/lib/libkernel32.a")
set(CMAKE_CXX_STANDARD_LIBRARIES "${CMAKE_C_STANDARD_LIBRARIES}")
# The runtime library flags CMake would add name a runtime that is not here.
set(CMAKE_MSVC_RUNTIME_LIBRARY "")
# The compiler checks cannot link before msabi/ is built.
set(CMAKE_TRY_COMPILE_TARGET_TYPE STATIC_LIBRARY)

set(CMAKE_CROSSCOMPILING_EMULATOR env WINEDEBUG=-all WINEDLLOVERRIDES=mscoree,mshtml= wine)
set(TAVIX_MSABI ON)
