# Packages of what is installed, made by `cpack` in the build folder: an archive and, where the
# programs that tell its dependencies are at hand, a Debian package. Both carry the CDF library when
# it was provisioned; another one (CDF_ROOT) they need where it was found.
find_program(AMBRIX_SHLIBDEPS dpkg-shlibdeps)
find_program(AMBRIX_FILE file)
mark_as_advanced(AMBRIX_SHLIBDEPS AMBRIX_FILE)

set(CPACK_GENERATOR TGZ)
if(AMBRIX_SHLIBDEPS AND AMBRIX_FILE)
  list(APPEND CPACK_GENERATOR DEB)
endif()
set(CPACK_PACKAGE_CONTACT "ambrix developers <ambrix@localhost>")
set(CPACK_PACKAGE_VENDOR "ambrix developers")
set(CPACK_SYSTEM_NAME "${CMAKE_SYSTEM_NAME}-${CMAKE_SYSTEM_PROCESSOR}")
set(CPACK_PACKAGE_CHECKSUM SHA256)
set(CPACK_STRIP_FILES ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SECTION science)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)
set(CPACK_INSTALL_DEFAULT_DIRECTORY_PERMISSIONS
  OWNER_READ OWNER_WRITE OWNER_EXECUTE GROUP_READ GROUP_EXECUTE WORLD_READ WORLD_EXECUTE)
include(CPack)
