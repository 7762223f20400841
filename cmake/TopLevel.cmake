# What a parent project would decide, where there is none.
include(CTest)
set(CMAKE_EXPORT_COMPILE_COMMANDS ON)
set(CMAKE_RUNTIME_OUTPUT_DIRECTORY ${PROJECT_BINARY_DIR}/bin)
set(CMAKE_LIBRARY_OUTPUT_DIRECTORY ${PROJECT_BINARY_DIR}/lib)
set(CMAKE_ARCHIVE_OUTPUT_DIRECTORY ${PROJECT_BINARY_DIR}/lib)
# Programs find their libraries from their own place, wherever the build folder is.
set(CMAKE_BUILD_RPATH_USE_ORIGIN ON)

option(BUILD_SHARED_LIBS "Build shared libraries too, not static ones only" ON)

# Optimised, unless somebody has said how: with a build type, or with flags.
get_property(several_types GLOBAL PROPERTY GENERATOR_IS_MULTI_CONFIG)
if(NOT several_types AND NOT CMAKE_BUILD_TYPE AND NOT CMAKE_CXX_FLAGS MATCHES "(^| )-O")
  set_property(CACHE CMAKE_BUILD_TYPE PROPERTY VALUE RelWithDebInfo)
endif()
