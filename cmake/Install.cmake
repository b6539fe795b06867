# What `cmake --install` lays down: shared libraries, the command, resources, headers, and the two ways to find them.
include(CMakePackageConfigHelpers)

set(ORX_INSTALL_INCLUDEDIR ${CMAKE_INSTALL_INCLUDEDIR}/orxtransform)
set(ORX_INSTALL_CMAKEDIR ${CMAKE_INSTALL_LIBDIR}/cmake/orxtransform)
set(ORX_INSTALL_DATADIR ${CMAKE_INSTALL_DATADIR}/orx)

set(shared_libraries qorxcore orxvtl orxsession orxparameter orxutil orxtransform orxtranslation)

# Libraries find each other in their own folder, the command finds them from its own.
file(RELATIVE_PATH libraries_from_command /${CMAKE_INSTALL_BINDIR} /${CMAKE_INSTALL_LIBDIR})
set_target_properties(${shared_libraries} PROPERTIES INSTALL_RPATH "$ORIGIN")
set_target_properties(orxt PROPERTIES INSTALL_RPATH "$ORIGIN/${libraries_from_command}")

install(TARGETS ${shared_libraries}
  EXPORT orxtransformTargets
  LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR}
  INCLUDES DESTINATION ${ORX_INSTALL_INCLUDEDIR})
install(TARGETS orxt RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR})
install(DIRECTORY ${PROJECT_SOURCE_DIR}/resources/ DESTINATION ${ORX_INSTALL_DATADIR})

# Which headers are public is read from the headers themselves, at the time of the installation.
install(CODE "set(ORX_SOURCE_DIR \"${PROJECT_SOURCE_DIR}\")\nset(ORX_INCLUDEDIR \"${ORX_INSTALL_INCLUDEDIR}\")")
install(SCRIPT ${PROJECT_SOURCE_DIR}/cmake/InstallHeaders.cmake)

install(EXPORT orxtransformTargets NAMESPACE orx:: DESTINATION ${ORX_INSTALL_CMAKEDIR})
configure_package_config_file(
  ${PROJECT_SOURCE_DIR}/cmake/orxtransformConfig.cmake.in ${PROJECT_BINARY_DIR}/orxtransformConfig.cmake
  INSTALL_DESTINATION ${ORX_INSTALL_CMAKEDIR}
  PATH_VARS ORX_INSTALL_DATADIR)
write_basic_package_version_file(${PROJECT_BINARY_DIR}/orxtransformConfigVersion.cmake
  COMPATIBILITY SameMinorVersion)
install(FILES
    ${PROJECT_BINARY_DIR}/orxtransformConfig.cmake
    ${PROJECT_BINARY_DIR}/orxtransformConfigVersion.cmake
  DESTINATION ${ORX_INSTALL_CMAKEDIR})

# The file finds its prefix from where it stands, so that an installed tree can be moved as a whole.
file(RELATIVE_PATH prefix_from_pkgconfig /${CMAKE_INSTALL_LIBDIR}/pkgconfig /)
configure_file(${PROJECT_SOURCE_DIR}/cmake/orxtransform.pc.in ${PROJECT_BINARY_DIR}/orxtransform.pc @ONLY)
install(FILES ${PROJECT_BINARY_DIR}/orxtransform.pc DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig)
