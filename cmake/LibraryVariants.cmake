# Shared and static variant of a library. BUILD_SHARED_LIBS turned off leaves the static one, which then has both names;
# so does a target that has no shared libraries.
get_property(EDID_COMPOSER_SHARED GLOBAL PROPERTY TARGET_SUPPORTS_SHARED_LIBS)
if(DEFINED BUILD_SHARED_LIBS AND NOT BUILD_SHARED_LIBS)
  set(EDID_COMPOSER_SHARED OFF)
endif()

# edid_composer_add_library(TARGET FILE SOURCE...): libFILE.so as TARGET and libFILE.a as TARGET_static, which hosts
# know as edid_composer::FILE and edid_composer::FILE_static.
function(edid_composer_add_library target file)
  add_library(${target}_static STATIC ${ARGN})
  set_target_properties(${target}_static PROPERTIES OUTPUT_NAME ${file} EXPORT_NAME ${file}_static)
  add_library(edid_composer::${file}_static ALIAS ${target}_static)
  if(EDID_COMPOSER_SHARED)
    add_library(${target} SHARED ${ARGN})
    set_target_properties(${target} PROPERTIES OUTPUT_NAME ${file} EXPORT_NAME ${file} VERSION ${PROJECT_VERSION}
                                               SOVERSION ${PROJECT_VERSION_MAJOR})
    add_library(edid_composer::${file} ALIAS ${target})
  else()
    add_library(${target} ALIAS ${target}_static)
    add_library(edid_composer::${file} ALIAS ${target}_static)
  endif()
endfunction()

# edid_composer_variants(TARGET VARIABLE): the targets that edid_composer_add_library() has made.
function(edid_composer_variants target variable)
  set(variants ${target}_static)
  if(EDID_COMPOSER_SHARED)
    list(APPEND variants ${target})
  endif()
  set(${variable} ${variants} PARENT_SCOPE)
endfunction()
