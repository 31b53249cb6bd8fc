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

install(FILES LICENSE NOTICE CHANGELOG.md DESTINATION "${CMAKE_INSTALL_DOCDIR}")
install(FILES README.md DESTINATION "${CMAKE_INSTALL_DOCDIR}" OPTIONAL)
install(DIRECTORY docs DESTINATION "${CMAKE_INSTALL_DOCDIR}"
  FILES_MATCHING PATTERN "*.md" PATTERN "*.json" PATTERN "*.png" PATTERN "*.svg"
  PATTERN templates EXCLUDE)
install(DIRECTORY examples DESTINATION "${CMAKE_INSTALL_DOCDIR}")
