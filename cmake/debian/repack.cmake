# Run by CPack when it has packed: takes out the scripts by which a Debian package updates the cache of
# libraries. CPack means libraries in subfolders, too, which are in no such cache.
if(NOT CPACK_GENERATOR STREQUAL "DEB")
  return()
endif()
set(content "${CPACK_TEMPORARY_DIRECTORY}-content")
foreach(package IN LISTS CPACK_PACKAGE_FILES)
  file(REMOVE_RECURSE "${content}")
  execute_process(COMMAND dpkg-deb --raw-extract "${package}" "${content}"
    COMMAND_ERROR_IS_FATAL ANY)
  file(REMOVE "${content}/DEBIAN/postinst" "${content}/DEBIAN/postrm")
  execute_process(COMMAND dpkg-deb --root-owner-group --build "${content}" "${package}"
    COMMAND_ERROR_IS_FATAL ANY OUTPUT_QUIET)
endforeach()
