# Headers, library, CMake package and pkg-config file.

include(CMakePackageConfigHelpers)

install(TARGETS aldermoor EXPORT AldermoorTargets
  LIBRARY COMPONENT Runtime NAMELINK_COMPONENT Development
  FILE_SET HEADERS COMPONENT Development)

set(package_dir ${CMAKE_INSTALL_LIBDIR}/cmake/Aldermoor)
install(EXPORT AldermoorTargets
  NAMESPACE aldermoor:: DESTINATION ${package_dir} COMPONENT Development)
configure_package_config_file(
  cmake/AldermoorConfig.cmake.in ${PROJECT_BINARY_DIR}/AldermoorConfig.cmake
  INSTALL_DESTINATION ${package_dir})
write_basic_package_version_file(
  ${PROJECT_BINARY_DIR}/AldermoorConfigVersion.cmake COMPATIBILITY SameMinorVersion)
install(FILES
  ${PROJECT_BINARY_DIR}/AldermoorConfig.cmake ${PROJECT_BINARY_DIR}/AldermoorConfigVersion.cmake
  DESTINATION ${package_dir} COMPONENT Development)

configure_file(cmake/aldermoor.pc.in ${PROJECT_BINARY_DIR}/aldermoor.pc @ONLY)
install(FILES ${PROJECT_BINARY_DIR}/aldermoor.pc
  DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig COMPONENT Development)
