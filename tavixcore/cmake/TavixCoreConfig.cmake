# The TavixCore SDK's CMake package: find_package(TavixCore CONFIG) gives the
# imported target TavixCore::TavixCore, with its headers and library.
include(${CMAKE_CURRENT_LIST_DIR}/TavixCoreTargets.cmake)
