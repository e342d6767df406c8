# A build that repeats byte for byte: no build folder's path in a binary, and
# the plug-in's build date from SOURCE_DATE_EPOCH when it is set (in the
# compiler's "Jan  8 2025" form, as TAVIX_BUILD_DATE); without it, the day of
# the build.
add_compile_options(-ffile-prefix-map=${CMAKE_SOURCE_DIR}=.
                    -ffile-prefix-map=${CMAKE_BINARY_DIR}=build)
if(DEFINED ENV{SOURCE_DATE_EPOCH})
  string(TIMESTAMP TAVIX_BUILD_DATE "%b %d %Y" UTC)  # CMake takes the time from SOURCE_DATE_EPOCH
  string(REGEX REPLACE "^([A-Z][a-z][a-z]) 0" "\\1  " TAVIX_BUILD_DATE "${TAVIX_BUILD_DATE}")
endif()
