# For one of the targets of scripts/test_targets.sh: Debian's cross compiler, and programs run by qemu-user. Given by
# EDID_COMPOSER_TARGET, the GNU triplet, and EDID_COMPOSER_PACKAGES, the prefix of what is found by find_package().
set(CMAKE_TRY_COMPILE_PLATFORM_VARIABLES EDID_COMPOSER_TARGET EDID_COMPOSER_PACKAGES)
string(REGEX MATCH "^[^-]+" CMAKE_SYSTEM_PROCESSOR ${EDID_COMPOSER_TARGET})
set(CMAKE_SYSTEM_NAME Linux)

if(EDID_COMPOSER_TARGET MATCHES "-musl$")
  # Runs here as it is. Debian has no C++ compiler for it: see the script.
  find_program(CMAKE_C_COMPILER musl-gcc REQUIRED)
  set(CMAKE_CXX_COMPILER ${CMAKE_CURRENT_LIST_DIR}/musl_cxx.sh)
  set(BUILD_SHARED_LIBS OFF CACHE BOOL "Static programs need no loader of musl's")
else()
  set(CMAKE_C_COMPILER ${EDID_COMPOSER_TARGET}-gcc)
  set(CMAKE_CXX_COMPILER ${EDID_COMPOSER_TARGET}-g++)
endif()

if(NOT CMAKE_SYSTEM_PROCESSOR STREQUAL "x86_64")
  string(REGEX REPLACE "^i[3-6]86$" "i386" emulated ${CMAKE_SYSTEM_PROCESSOR})
  set(CMAKE_CROSSCOMPILING_EMULATOR qemu-${emulated} -L /usr/${EDID_COMPOSER_TARGET})
endif()
set(EDID_COMPOSER_EMULATOR "${CMAKE_CROSSCOMPILING_EMULATOR}" CACHE INTERNAL "For what is run without ctest")

set(CMAKE_FIND_ROOT_PATH ${EDID_COMPOSER_PACKAGES} /usr/${EDID_COMPOSER_TARGET})
set(CMAKE_FIND_ROOT_PATH_MODE_PROGRAM NEVER)
set(CMAKE_FIND_ROOT_PATH_MODE_LIBRARY ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_INCLUDE ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_PACKAGE ONLY)
# Debian keeps the files of this one where only programs for this machine look for them; they are headers only.
file(GLOB utf8cpp_DIR ${EDID_COMPOSER_PACKAGES}/usr/lib/*/cmake/utf8cpp)
