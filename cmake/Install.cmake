# What `cmake --install` puts where, by component: runtime (the library), development (header, static variant, CMake
# package, pkg-config file, manual page), tools (the command-line program, its completion and manual page), store (the
# configuration store, run time and development).
include(GNUInstallDirs)
include(CMakePackageConfigHelpers)

set(package_dir ${CMAKE_INSTALL_LIBDIR}/cmake/edid_composer)

set_target_properties(edid_composer_static PROPERTIES OUTPUT_NAME edid_composer)
install(
  TARGETS edid_composer edid_composer_static
  EXPORT edid_composer-targets
  LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT runtime NAMELINK_COMPONENT development
  ARCHIVE DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT development)
install(FILES include/edid_composer.h DESTINATION ${CMAKE_INSTALL_INCLUDEDIR} COMPONENT development)
install(
  EXPORT edid_composer-targets
  NAMESPACE edid_composer::
  DESTINATION ${package_dir}
  COMPONENT development)

configure_package_config_file(cmake/edid_composer-config.cmake.in edid_composer-config.cmake
                              INSTALL_DESTINATION ${package_dir})
write_basic_package_version_file(edid_composer-config-version.cmake COMPATIBILITY SameMajorVersion)
install(
  FILES ${CMAKE_CURRENT_BINARY_DIR}/edid_composer-config.cmake
        ${CMAKE_CURRENT_BINARY_DIR}/edid_composer-config-version.cmake
  DESTINATION ${package_dir}
  COMPONENT development)

# pkg-config files find the prefix from their own place, so that what is installed can be moved.
file(RELATIVE_PATH pc_prefix /prefix/${CMAKE_INSTALL_LIBDIR}/pkgconfig /prefix)
string(REGEX REPLACE "/$" "" pc_prefix "\${pcfiledir}/${pc_prefix}")
function(install_pkgconfig name component)
  configure_file(cmake/${name}.pc.in ${name}.pc @ONLY)
  install(
    FILES ${CMAKE_CURRENT_BINARY_DIR}/${name}.pc
    DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig
    COMPONENT ${component})
endfunction()
install_pkgconfig(edid_composer development)

function(install_manual page section component)
  install(
    FILES docs/man/${page}
    DESTINATION ${CMAKE_INSTALL_MANDIR}/man${section}
    COMPONENT ${component})
endfunction()
install_manual(edid_composer.3 3 development)

if(EDID_COMPOSER_HOST)
  install(
    TARGETS edid_config_store
    EXPORT edid_config_store-targets
    LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT store)
  install(FILES host/config_store/config_store.h DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}/edid_composer COMPONENT store)
  install(FILES host/config_store/platform.toml DESTINATION ${CMAKE_INSTALL_DATADIR}/edid_composer COMPONENT store)
  install(
    EXPORT edid_config_store-targets
    NAMESPACE edid_composer::
    DESTINATION ${package_dir}
    COMPONENT store)
  install_pkgconfig(edid_config_store store)
  install_manual(edid-platform.toml.5 5 store)

  # The program finds the libraries from its own place, so that any prefix will do. Packages go without.
  file(RELATIVE_PATH library_place /prefix/${CMAKE_INSTALL_BINDIR} /prefix/${CMAKE_INSTALL_LIBDIR})
  set_target_properties(edid_composer_cli PROPERTIES INSTALL_RPATH "$ORIGIN/${library_place}")
  install(TARGETS edid_composer_cli RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR} COMPONENT tools)
  install_manual(edid-composer.1 1 tools)
  install(
    FILES completions/edid-composer.bash
    DESTINATION ${CMAKE_INSTALL_DATADIR}/bash-completion/completions
    RENAME edid-composer
    COMPONENT tools)
endif()
