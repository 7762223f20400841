# Read by cpack first: packages are made of builds for Debian's prefix only, which decides on the folder of the
# libraries.
if(NOT CPACK_INSTALL_PREFIX STREQUAL "/usr")
  message(FATAL_ERROR "Packages are made of a build for /usr, not for ${CPACK_INSTALL_PREFIX}: cmake --preset package")
endif()
