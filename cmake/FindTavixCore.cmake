# Finds a TavixCore SDK that ships only its headers and its library (on
# Windows, TavixCore.dll's import library TavixCore.lib), without a CMake
# package. Set TAVIXCORE_ROOT to the SDK's folder; the headers are looked for
# in include/tavixcore or include, the library in lib. Defines the imported
# target TavixCore::TavixCore.
find_path(TavixCore_INCLUDE_DIR hstring.h
          HINTS ${TAVIXCORE_ROOT} PATH_SUFFIXES include/tavixcore include NO_DEFAULT_PATH)
find_library(TavixCore_LIBRARY NAMES TavixCore TavixCore.so
             HINTS ${TAVIXCORE_ROOT} PATH_SUFFIXES lib NO_DEFAULT_PATH)
include(FindPackageHandleStandardArgs)
find_package_handle_standard_args(TavixCore REQUIRED_VARS TavixCore_LIBRARY TavixCore_INCLUDE_DIR)
if(TavixCore_FOUND AND NOT TARGET TavixCore::TavixCore)
  add_library(TavixCore::TavixCore UNKNOWN IMPORTED)
  if(WIN32)
    # What is linked is the import library; the DLL itself comes with the host.
    set_target_properties(TavixCore::TavixCore PROPERTIES IMPORTED_IMPLIB "${TavixCore_LIBRARY}")
  endif()
  set_target_properties(TavixCore::TavixCore PROPERTIES
    IMPORTED_LOCATION "${TavixCore_LIBRARY}"
    INTERFACE_INCLUDE_DIRECTORIES "${TavixCore_INCLUDE_DIR}")
endif()
