# WebAssembly (web/): what is different with Emscripten's compiler. There are no shared libraries, the return addresses
# are out of a program's reach, and one file is all that is made.
set(CMAKE_POSITION_INDEPENDENT_CODE OFF)
set(EDID_COMPOSER_HARDENING OFF)
set(EDID_COMPOSER_INSTALL OFF)

# The WebAssembly exceptions of browsers: smaller and faster than those that are emulated in JavaScript.
add_compile_options(-fwasm-exceptions)
add_link_options(-fwasm-exceptions)

# What consists of headers only is this machine's. Its folder as a whole, which the packages' own CMake files name,
# would bring its C library along: so there are links beside the build, and packages that have nothing but them.
set(header_links ${PROJECT_BINARY_DIR}/headers)
file(MAKE_DIRECTORY ${header_links})
foreach(header toml++ CLI nlohmann utf8 utf8.h)
  if(NOT EXISTS /usr/include/${header})
    message(FATAL_ERROR "/usr/include/${header} is missing "
                        "(Debian: libtomlplusplus-dev libcli11-dev nlohmann-json3-dev libutfcpp-dev)")
  endif()
  file(CREATE_LINK /usr/include/${header} ${header_links}/${header} SYMBOLIC)
endforeach()
include_directories(SYSTEM ${header_links})
set(CMAKE_FIND_ROOT_PATH_MODE_PACKAGE BOTH)
set(TOMLPLUSPLUS_INCLUDE_DIR ${header_links})
foreach(package CLI11::CLI11 nlohmann_json::nlohmann_json utf8cpp)
  string(REGEX REPLACE ".*:" "" name ${package})
  add_library(${package} INTERFACE IMPORTED)
  file(WRITE ${header_links}/${name}-config.cmake "")
  set(${name}_DIR ${header_links})
endforeach()
