# Warnings for everything that is built here, and the sanitizers.
add_library(edid_composer_warnings INTERFACE)
target_compile_options(
  edid_composer_warnings INTERFACE -Wall -Wextra -Wpedantic -Wshadow -Wconversion
                                   $<$<COMPILE_LANGUAGE:CXX>:-Wnon-virtual-dtor>)
if(EDID_COMPOSER_WERROR)
  target_compile_options(edid_composer_warnings INTERFACE -Werror)
endif()

if(EDID_COMPOSER_SANITIZE)
  add_compile_options(-fsanitize=address,undefined -fno-sanitize-recover=all -fno-omit-frame-pointer)
  add_link_options(-fsanitize=address,undefined)
endif()

if(EDID_COMPOSER_FUZZ)
  add_compile_options(-fsanitize=fuzzer-no-link)
endif()

# The library itself: a C ABI outside, no exceptions, no run-time type information, nothing visible but what is
# exported.
add_library(edid_composer_library_flags INTERFACE)
target_compile_options(edid_composer_library_flags INTERFACE -fno-exceptions -fno-rtti -fno-threadsafe-statics
                                                             -fvisibility=hidden -fvisibility-inlines-hidden)
target_link_libraries(edid_composer_library_flags INTERFACE edid_composer_warnings)
