# What `cmake --install` puts where, by component: runtime (the library), development (header, static variant, CMake
# package, pkg-config file, manual page), store and store_development (the configuration store, likewise), tools (the
# command-line program, its completion and manual page).
include(GNUInstallDirs)
include(CMakePackageConfigHelpers)

set(package_dir ${CMAKE_INSTALL_LIBDIR}/cmake/edid_composer)

# edid_composer_install_library(TARGET FILE RUNTIME_COMPONENT DEVELOPMENT_COMPONENT)
function(edid_composer_install_library target file runtime development)
  edid_composer_variants(${target} variants)
  install(
    TARGETS ${variants}
    EXPORT ${file}-targets
    LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT ${runtime} NAMELINK_COMPONENT ${development}
    ARCHIVE DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT ${development})
  install(
    EXPORT ${file}-targets
    NAMESPACE edid_composer::
    DESTINATION ${package_dir}
    COMPONENT ${development})

  # The prefix stands in it as it is: pkg-config puts the folder of a sysroot before it. It is known when it is
  # installed.
  set(prefix "@CMAKE_INSTALL_PREFIX@")
  configure_file(cmake/${file}.pc.in ${file}.pc.in @ONLY)
  install(CODE "configure_file(\"${PROJECT_BINARY_DIR}/${file}.pc.in\" \"${PROJECT_BINARY_DIR}/${file}.pc\" @ONLY)"
          COMPONENT ${development})
  install(
    FILES ${PROJECT_BINARY_DIR}/${file}.pc
    DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig
    COMPONENT ${development})
endfunction()

function(edid_composer_install_manual page section component)
  install(
    FILES docs/man/${page}
    DESTINATION ${CMAKE_INSTALL_MANDIR}/man${section}
    COMPONENT ${component})
endfunction()

edid_composer_install_library(edid_composer edid_composer runtime development)
install(FILES include/edid_composer.h DESTINATION ${CMAKE_INSTALL_INCLUDEDIR} COMPONENT development)
edid_composer_install_manual(edid_composer.3 3 development)

configure_package_config_file(cmake/edid_composer-config.cmake.in edid_composer-config.cmake
                              INSTALL_DESTINATION ${package_dir})
write_basic_package_version_file(edid_composer-config-version.cmake COMPATIBILITY SameMajorVersion)
install(
  FILES ${CMAKE_CURRENT_BINARY_DIR}/edid_composer-config.cmake
        ${CMAKE_CURRENT_BINARY_DIR}/edid_composer-config-version.cmake
  DESTINATION ${package_dir}
  COMPONENT development)

if(EDID_COMPOSER_HOST)
  # Who links it statically links what it is written in as well.
  set(cxx_libraries ${CMAKE_CXX_IMPLICIT_LINK_LIBRARIES})
  list(REMOVE_ITEM cxx_libraries ${CMAKE_C_IMPLICIT_LINK_LIBRARIES})
  list(REMOVE_DUPLICATES cxx_libraries)
  list(TRANSFORM cxx_libraries PREPEND "-l")
  list(JOIN cxx_libraries " " cxx_libraries)
  if(NOT EDID_COMPOSER_SHARED)
    set(libs " ${cxx_libraries}")
  endif()

  edid_composer_install_library(edid_composer_config_store edid_config_store store store_development)
  install(FILES host/config_store/config_store.h DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}/edid_composer
          COMPONENT store_development)
  install(FILES host/config_store/platform.toml DESTINATION ${CMAKE_INSTALL_DATADIR}/edid_composer
          COMPONENT store_development)
  edid_composer_install_manual(edid-platform.toml.5 5 store_development)
endif()

if(EDID_COMPOSER_PROGRAM)
  # The program finds the libraries from its own place, so that any prefix will do. Packages go without.
  file(RELATIVE_PATH library_place /prefix/${CMAKE_INSTALL_BINDIR} /prefix/${CMAKE_INSTALL_LIBDIR})
  set_target_properties(edid_composer_cli PROPERTIES INSTALL_RPATH "$ORIGIN/${library_place}")
  install(TARGETS edid_composer_cli RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR} COMPONENT tools)
  edid_composer_install_manual(edid-composer.1 1 tools)
  install(
    FILES completions/edid-composer.bash
    DESTINATION ${CMAKE_INSTALL_DATADIR}/bash-completion/completions
    RENAME edid-composer
    COMPONENT tools)
endif()
