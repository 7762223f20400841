# Run by cpack on what it is about to pack: makes the installed files what Debian expects of a package. In any other
# prefix they stay as `cmake --install` puts them there.
find_program(gzip gzip REQUIRED)
find_program(strip strip REQUIRED)

# With SOURCE_DATE_EPOCH, its date.
string(TIMESTAMP date "%a, %d %b %Y %H:%M:%S +0000" UTC)
set(changes "${CPACK_PACKAGE_NAME} (${CPACK_PACKAGE_VERSION}) unstable; urgency=medium

  * Version ${CPACK_PACKAGE_VERSION}.

 -- ${CPACK_PACKAGE_CONTACT}  ${date}
")

foreach(component ${CPACK_COMPONENTS_ALL})
  set(tree ${CPACK_TEMPORARY_DIRECTORY}/${component}/usr)
  string(TOUPPER ${component} upper_component)
  set(documents ${tree}/share/doc/${CPACK_DEBIAN_${upper_component}_PACKAGE_NAME})
  configure_file(${CPACK_RESOURCE_FILE_LICENSE} ${documents}/copyright COPYONLY)
  file(WRITE ${documents}/changelog "${changes}")
  file(CHMOD ${documents}/copyright ${documents}/changelog PERMISSIONS OWNER_READ OWNER_WRITE GROUP_READ WORLD_READ)

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

  file(GLOB compressed ${tree}/share/man/man*/* ${documents}/changelog)
  foreach(file ${compressed})
    execute_process(COMMAND ${gzip} -9n ${file} COMMAND_ERROR_IS_FATAL ANY)
  endforeach()
endforeach()
