# Install rules: the static library with its headers, a CMake package with a
# version file, a pkg-config file and the tool.
include(GNUInstallDirs)
include(CMakePackageConfigHelpers)

set(ROBOTCONFIG_INSTALLED_TARGETS robotconfig)
if(TARGET robotconfig_checker)
  list(APPEND ROBOTCONFIG_INSTALLED_TARGETS robotconfig_checker robotconfig_model)
endif()
install(TARGETS ${ROBOTCONFIG_INSTALLED_TARGETS} EXPORT robotconfigTargets
  ARCHIVE DESTINATION ${CMAKE_INSTALL_LIBDIR}
  INCLUDES DESTINATION ${CMAKE_INSTALL_INCLUDEDIR})
install(DIRECTORY ${PROJECT_SOURCE_DIR}/robotconfig
  DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}
  FILES_MATCHING PATTERN "*.h")

set(ROBOTCONFIG_CMAKE_DIR ${CMAKE_INSTALL_LIBDIR}/cmake/robotconfig)
install(EXPORT robotconfigTargets NAMESPACE robotconfig:: DESTINATION ${ROBOTCONFIG_CMAKE_DIR})
configure_package_config_file(${PROJECT_SOURCE_DIR}/cmake/robotconfigConfig.cmake.in
  ${PROJECT_BINARY_DIR}/robotconfigConfig.cmake INSTALL_DESTINATION ${ROBOTCONFIG_CMAKE_DIR})
write_basic_package_version_file(${PROJECT_BINARY_DIR}/robotconfigConfigVersion.cmake
  COMPATIBILITY SameMajorVersion)
install(FILES ${PROJECT_BINARY_DIR}/robotconfigConfig.cmake ${PROJECT_BINARY_DIR}/robotconfigConfigVersion.cmake
  DESTINATION ${ROBOTCONFIG_CMAKE_DIR})

# The prefix is found from the file's own place, so that --prefix given at
# install time (not only at configure time) is right.
file(RELATIVE_PATH ROBOTCONFIG_PC_TO_PREFIX "/p/${CMAKE_INSTALL_LIBDIR}/pkgconfig" "/p")
configure_file(${PROJECT_SOURCE_DIR}/cmake/robotconfig.pc.in ${PROJECT_BINARY_DIR}/robotconfig.pc @ONLY)
install(FILES ${PROJECT_BINARY_DIR}/robotconfig.pc DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig)

if(TARGET robotcfg)
  install(TARGETS robotcfg RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR})
  install(FILES ${PROJECT_SOURCE_DIR}/docs/robotcfg.1 DESTINATION ${CMAKE_INSTALL_MANDIR}/man1)
endif()
