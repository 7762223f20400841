# Run by cpack on what it is about to pack: makes the installed files what Debian expects of a package. In any other
# prefix they stay as `cmake --install` puts them there.
find_program(gzip gzip REQUIRED)
find_program(strip strip REQUIRED)

foreach(component ${CPACK_COMPONENTS_ALL})
  set(tree ${CPACK_TEMPORARY_DIRECTORY}/${component}/usr)
  string(TOUPPER ${component} upper_component)
  set(copyright ${tree}/share/doc/${CPACK_DEBIAN_${upper_component}_PACKAGE_NAME}/copyright)
  configure_file(${CPACK_RESOURCE_FILE_LICENSE} ${copyright} COPYONLY)
  file(CHMOD ${copyright} PERMISSIONS OWNER_READ OWNER_WRITE GROUP_READ WORLD_READ)

  # Libraries are in the system's places, where programs find them by themselves.
  file(GLOB programs ${tree}/bin/*)
  foreach(program ${programs})
    file(RPATH_REMOVE FILE ${program})
  endforeach()

  file(GLOB_RECURSE archives ${tree}/*.a)
  foreach(archive ${archives})
    execute_process(COMMAND ${strip} --strip-debug --enable-deterministic-archives ${archive}
                    COMMAND_ERROR_IS_FATAL ANY)
  endforeach()

  file(GLOB manuals ${tree}/share/man/man*/*)
  foreach(manual ${manuals})
    execute_process(COMMAND ${gzip} -9n ${manual} COMMAND_ERROR_IS_FATAL ANY)
  endforeach()
endforeach()
