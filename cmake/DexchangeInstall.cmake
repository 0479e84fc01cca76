include(CMakePackageConfigHelpers)

install(TARGETS dexchange EXPORT dexchangeTargets
  LIBRARY DESTINATION "${CMAKE_INSTALL_LIBDIR}"
  INCLUDES DESTINATION "${CMAKE_INSTALL_INCLUDEDIR}/dexchange")
install(EXPORT dexchangeTargets NAMESPACE dexchange::
  DESTINATION "${CMAKE_INSTALL_LIBDIR}/cmake/dexchange")

configure_package_config_file(cmake/dexchangeConfig.cmake.in
  "${CMAKE_CURRENT_BINARY_DIR}/dexchangeConfig.cmake"
  INSTALL_DESTINATION "${CMAKE_INSTALL_LIBDIR}/cmake/dexchange")
write_basic_package_version_file("${CMAKE_CURRENT_BINARY_DIR}/dexchangeConfigVersion.cmake"
  COMPATIBILITY SameMajorVersion)
install(FILES "${CMAKE_CURRENT_BINARY_DIR}/dexchangeConfig.cmake"
  "${CMAKE_CURRENT_BINARY_DIR}/dexchangeConfigVersion.cmake"
  DESTINATION "${CMAKE_INSTALL_LIBDIR}/cmake/dexchange")

# The pkg-config file locates its prefix from its own folder, so an installed tree may be moved.
file(RELATIVE_PATH DEXCHANGE_PC_TO_PREFIX
  "${CMAKE_INSTALL_FULL_LIBDIR}/pkgconfig" "${CMAKE_INSTALL_PREFIX}")
configure_file(cmake/dexchange.pc.in "${CMAKE_CURRENT_BINARY_DIR}/dexchange.pc" @ONLY)
install(FILES "${CMAKE_CURRENT_BINARY_DIR}/dexchange.pc" DESTINATION "${CMAKE_INSTALL_LIBDIR}/pkgconfig")
