# SPDX-License-Identifier: Apache-2.0
# What `cmake --install` puts where, with a pkg-config file and a CMake package.
include(CMakePackageConfigHelpers)

install(TARGETS kelvo-ims EXPORT kelvo-ims-targets LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR})
if(TARGET kelvo-ims-host)
  install(TARGETS kelvo-ims-host EXPORT kelvo-ims-targets
    LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR} NAMELINK_SKIP)
endif()
install(DIRECTORY include/ DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}/kelvo-ims
  FILES_MATCHING PATTERN "*.h")

# The contract with the service, and who may have a part in it.
install(DIRECTORY dbus/interfaces/ DESTINATION ${CMAKE_INSTALL_DATADIR}/dbus-1/interfaces
  FILES_MATCHING PATTERN "*.xml")
install(FILES dbus/org.kelvo.ims.conf DESTINATION ${CMAKE_INSTALL_DATADIR}/dbus-1/system.d)

install(EXPORT kelvo-ims-targets NAMESPACE kelvo-ims::
  DESTINATION ${CMAKE_INSTALL_LIBDIR}/cmake/kelvo-ims)
configure_package_config_file(cmake/kelvo-ims-config.cmake.in kelvo-ims-config.cmake
  INSTALL_DESTINATION ${CMAKE_INSTALL_LIBDIR}/cmake/kelvo-ims)
write_basic_package_version_file(kelvo-ims-config-version.cmake COMPATIBILITY SameMajorVersion)
install(FILES
  ${PROJECT_BINARY_DIR}/kelvo-ims-config.cmake
  ${PROJECT_BINARY_DIR}/kelvo-ims-config-version.cmake
  DESTINATION ${CMAKE_INSTALL_LIBDIR}/cmake/kelvo-ims)

# Found from where the file lies, so that an installation can be moved.
file(RELATIVE_PATH prefix_from_pkgconfig
  ${CMAKE_INSTALL_FULL_LIBDIR}/pkgconfig ${CMAKE_INSTALL_PREFIX})
configure_file(cmake/kelvo-ims.pc.in kelvo-ims.pc @ONLY)
install(FILES ${PROJECT_BINARY_DIR}/kelvo-ims.pc DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig)

if(IMS_BUILD_TOOLS)
  install(TARGETS imsctl ims-sim RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR})
  install(FILES docs/group-document.schema.json DESTINATION ${CMAKE_INSTALL_DATADIR}/kelvo-ims)
endif()
