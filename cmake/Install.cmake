# What is installed beside the targets, which their own folders install: find_package(ambrix), the
# documents and the example. Everything refers to its neighbours by relative paths, so that the
# installed tree can be moved.
include(CMakePackageConfigHelpers)

set(ambrix_package "${CMAKE_INSTALL_LIBDIR}/cmake/ambrix")
install(EXPORT ambrix NAMESPACE ambrix:: FILE ambrixConfig.cmake DESTINATION "${ambrix_package}")
write_basic_package_version_file("${CMAKE_BINARY_DIR}/generated/ambrixConfigVersion.cmake"
  COMPATIBILITY SameMinorVersion)
install(FILES "${CMAKE_BINARY_DIR}/generated/ambrixConfigVersion.cmake"
  DESTINATION "${ambrix_package}")

# For those who build without CMake. The library lies in a folder of its own, where programs look.
configure_file(cmake/ambrix.pc.in "${CMAKE_BINARY_DIR}/generated/ambrix.pc" @ONLY)
install(FILES "${CMAKE_BINARY_DIR}/generated/ambrix.pc"
  DESTINATION "${CMAKE_INSTALL_LIBDIR}/pkgconfig")

install(FILES LICENSE NOTICE CHANGELOG.md DESTINATION "${CMAKE_INSTALL_DOCDIR}")
install(FILES README.md DESTINATION "${CMAKE_INSTALL_DOCDIR}" OPTIONAL)
install(DIRECTORY docs DESTINATION "${CMAKE_INSTALL_DOCDIR}"
  FILES_MATCHING PATTERN "*.md" PATTERN "*.json" PATTERN "*.png" PATTERN "*.svg"
  PATTERN templates EXCLUDE)
install(DIRECTORY examples DESTINATION "${CMAKE_INSTALL_DOCDIR}")
