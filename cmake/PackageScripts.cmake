# Run by cpack on the packages that it has made: takes its scripts out, which only call ldconfig; the trigger does that.
find_program(dpkg_deb dpkg-deb REQUIRED)

foreach(package ${CPACK_PACKAGE_FILES})
  set(tree ${package}.tree)
  execute_process(COMMAND ${dpkg_deb} --raw-extract ${package} ${tree} COMMAND_ERROR_IS_FATAL ANY)
  if(EXISTS ${tree}/DEBIAN/postinst)
    file(REMOVE ${tree}/DEBIAN/postinst ${tree}/DEBIAN/postrm)
    execute_process(COMMAND ${dpkg_deb} --root-owner-group --build ${tree} ${package} COMMAND_ERROR_IS_FATAL ANY
                    OUTPUT_QUIET)
  endif()
  file(REMOVE_RECURSE ${tree})
endforeach()
