# Run by CPack before it packs: what a Debian package has beyond an installation, or otherwise.
if(NOT CPACK_GENERATOR STREQUAL "DEB")
  return()
endif()
set(share "${CPACK_TEMPORARY_DIRECTORY}${CPACK_PACKAGING_INSTALL_PREFIX}/share")
set(doc "${share}/doc/${CPACK_PACKAGE_NAME}")

function(compress file)
  execute_process(COMMAND gzip --best --no-name "${file}" COMMAND_ERROR_IS_FATAL ANY)
endfunction()

# Debian has the licence itself; the terms of all that is inside are told in one file.
file(READ "${CMAKE_CURRENT_LIST_DIR}/copyright" copyright)
file(READ "${doc}/NOTICE" notice)
string(APPEND copyright "${notice}")
if(EXISTS "${doc}/CDF_copyright.txt")
  file(READ "${doc}/CDF_copyright.txt" terms)
  file(COPY "${CMAKE_CURRENT_LIST_DIR}/overrides/ambrix" DESTINATION "${share}/lintian/overrides")
  string(APPEND copyright "
------------------------------------------------------------------------------------------------
The CDF library
${terms}")
endif()
file(WRITE "${doc}/copyright" "${copyright}")
file(REMOVE "${doc}/LICENSE")

string(TIMESTAMP now "%a, %d %b %Y %H:%M:%S +0000" UTC)
file(WRITE "${doc}/changelog" "${CPACK_PACKAGE_NAME} (${CPACK_PACKAGE_VERSION}) unstable; urgency=medium

  * Version ${CPACK_PACKAGE_VERSION}; CHANGELOG.md beside this file tells what is new.

 -- ${CPACK_DEBIAN_PACKAGE_MAINTAINER}  ${now}
")
compress("${doc}/changelog")
compress("${share}/man/man1/ambrix.1")
