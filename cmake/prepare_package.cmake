# Runs in cpack on the files staged for the Windows ZIPs, before they are
# packed. With a certificate and its key in TAVIX_SIGN_CERT and TAVIX_SIGN_KEY
# (PEM files; TAVIX_SIGN_TIMESTAMP_URL, when set, names a time-stamping
# server), it signs every binary with Authenticode by osslsigncode; without
# them the binaries stay unsigned. With SOURCE_DATE_EPOCH set, every file and
# folder takes that time, so that the ZIPs of two builds of one commit are
# the same byte for byte.
file(GLOB_RECURSE staged LIST_DIRECTORIES true "${CPACK_TEMPORARY_INSTALL_DIRECTORY}/*")

if(DEFINED ENV{TAVIX_SIGN_CERT} AND DEFINED ENV{TAVIX_SIGN_KEY})
  find_program(OSSLSIGNCODE osslsigncode REQUIRED)
  set(timestamp "")
  if(DEFINED ENV{TAVIX_SIGN_TIMESTAMP_URL})
    set(timestamp -t "$ENV{TAVIX_SIGN_TIMESTAMP_URL}")
  endif()
  foreach(file ${staged})
    if(NOT file MATCHES "\\.(dll|hll|exe)$")
      continue()
    endif()
    execute_process(
      COMMAND ${OSSLSIGNCODE} sign -certs "$ENV{TAVIX_SIGN_CERT}" -key "$ENV{TAVIX_SIGN_KEY}"
              -n "TavixStringCmds" -h sha256 ${timestamp} -in "${file}" -out "${file}.signed"
      RESULT_VARIABLE status OUTPUT_QUIET)
    if(NOT status EQUAL 0)
      message(FATAL_ERROR "cannot sign ${file}")
    endif()
    file(RENAME "${file}.signed" "${file}")
    message(STATUS "signed ${file}")
  endforeach()
endif()

if(DEFINED ENV{SOURCE_DATE_EPOCH})
  foreach(path ${staged} "${CPACK_TEMPORARY_INSTALL_DIRECTORY}")
    execute_process(COMMAND touch -h -d "@$ENV{SOURCE_DATE_EPOCH}" "${path}")
  endforeach()
endif()
