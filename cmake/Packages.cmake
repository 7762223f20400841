# Debian packages, one for each component: `cpack` in a build folder that was configured for the prefix /usr, as the
# preset "package" does. Needs `file` and `dpkg-dev`.
set(EDID_COMPOSER_PACKAGER
    "libedid_composer contributors"
    CACHE STRING "Who makes the packages, as Debian wants it: NAME <ADDRESS>")

set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGE_NAME libedid-composer)
set(CPACK_PACKAGE_VENDOR "libedid_composer contributors")
set(CPACK_PACKAGE_CONTACT "${EDID_COMPOSER_PACKAGER}")
set(CPACK_PACKAGE_VERSION ${PROJECT_VERSION})
set(CPACK_RESOURCE_FILE_LICENSE ${PROJECT_SOURCE_DIR}/LICENSE)
set(CPACK_STRIP_FILES ON)
set(CPACK_SET_DESTDIR ON) # Into the prefix that the build was configured for.
set(CPACK_PROJECT_CONFIG_FILE ${PROJECT_SOURCE_DIR}/cmake/PackagePrefix.cmake)
set(CPACK_PRE_BUILD_SCRIPTS ${PROJECT_SOURCE_DIR}/cmake/PackageTree.cmake)
set(CPACK_POST_BUILD_SCRIPTS ${PROJECT_SOURCE_DIR}/cmake/PackageScripts.cmake)
set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS ${CMAKE_LIBRARY_OUTPUT_DIRECTORY})
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS ON)
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)
set(CPACK_COMPONENTS_ALL "")

# edid_composer_package(COMPONENT PACKAGE SECTION WHAT DEPENDS...): a package, and what it is: the second half of its
# first line. It depends on packages of its own version.
function(edid_composer_package component package section what)
  string(TOUPPER ${component} upper)
  set(depends ${ARGN})
  list(TRANSFORM depends APPEND " (= ${PROJECT_VERSION})")
  list(JOIN depends ", " depends)
  set(CPACK_COMPONENTS_ALL ${CPACK_COMPONENTS_ALL} ${component} PARENT_SCOPE)
  set(CPACK_DEBIAN_${upper}_PACKAGE_NAME ${package} PARENT_SCOPE)
  set(CPACK_DEBIAN_${upper}_PACKAGE_SECTION ${section} PARENT_SCOPE)
  set(CPACK_DEBIAN_${upper}_PACKAGE_DEPENDS "${depends}" PARENT_SCOPE)
  set(CPACK_COMPONENT_${upper}_DESCRIPTION
      "EDID composer for HDMI inputs: ${what}.
A repeater, a set-top box or a capture box presents an EDID on its input.
libedid_composer makes it, of the display's EDID and a configuration."
      PARENT_SCOPE)
endfunction()

set(library "")
set(store "")
if(EDID_COMPOSER_SHARED)
  set(library libedid-composer${PROJECT_VERSION_MAJOR})
  edid_composer_package(runtime ${library} libs "shared library")
  # The loader is told with a trigger, not by a script that would do so for the running system, whatever is installed
  # into.
  set(CPACK_DEBIAN_RUNTIME_PACKAGE_CONTROL_EXTRA ${PROJECT_SOURCE_DIR}/cmake/triggers)
endif()
edid_composer_package(development libedid-composer-dev libdevel "development files" ${library})

if(EDID_COMPOSER_HOST)
  if(EDID_COMPOSER_SHARED)
    set(store libedid-config-store${PROJECT_VERSION_MAJOR})
    edid_composer_package(store ${store} libs "configuration store")
    set(CPACK_DEBIAN_STORE_PACKAGE_CONTROL_EXTRA ${PROJECT_SOURCE_DIR}/cmake/triggers)
  endif()
  edid_composer_package(store_development libedid-config-store-dev libdevel "configuration store's files for compilers"
                        ${store} libedid-composer-dev)
endif()

if(EDID_COMPOSER_PROGRAM)
  edid_composer_package(tools edid-composer utils "command-line program" ${library} ${store})
  set(CPACK_DEBIAN_TOOLS_PACKAGE_SUGGESTS libedid-config-store-dev)
endif()
include(CPack)
