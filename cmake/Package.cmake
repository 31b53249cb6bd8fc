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
set(CPACK_PACKAGE_VENDOR "ambrix developers")
set(CPACK_SYSTEM_NAME "${CMAKE_SYSTEM_NAME}-${CMAKE_SYSTEM_PROCESSOR}")
set(CPACK_PACKAGE_CHECKSUM SHA256)
set(CPACK_STRIP_FILES ON)  # what is built here, not the CDF library
set(CPACK_INSTALL_DEFAULT_DIRECTORY_PERMISSIONS
  OWNER_READ OWNER_WRITE OWNER_EXECUTE GROUP_READ GROUP_EXECUTE WORLD_READ WORLD_EXECUTE)

# The Debian package. What it has beyond an installation, and who makes it, is known when it is made.
# The CDF library is free to use and to copy, but not to be sold: Debian calls that non-free.
if(TARGET cdf_shared OR TARGET cdf363)
  set(CPACK_DEBIAN_PACKAGE_SECTION non-free/science)
else()
  set(CPACK_DEBIAN_PACKAGE_SECTION contrib/science)
endif()
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "Reads and writes CDF files of space physics")
set(CPACK_PACKAGE_DESCRIPTION "\
The tool shows, prints, checks and converts files in NASA's Common Data
Format, and lets any program drive the module's 91 commands through a pipe.
.
The module itself is here, too, and the library that loads it into C++
programs.")
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)
if(TARGET ambrix_inflate)
  set(CPACK_DEBIAN_PACKAGE_RECOMMENDS libisal2)  # loaded if it is there
endif()
set(CPACK_PROJECT_CONFIG_FILE "${PROJECT_SOURCE_DIR}/cmake/debian/packager.cmake")
set(CPACK_PRE_BUILD_SCRIPTS "${PROJECT_SOURCE_DIR}/cmake/debian/layout.cmake")
set(CPACK_POST_BUILD_SCRIPTS "${PROJECT_SOURCE_DIR}/cmake/debian/repack.cmake")
include(CPack)
