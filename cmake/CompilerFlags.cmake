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

# The library itself: a C ABI outside, no exceptions, no run-time type information, nothing visible but what is exported.
add_library(edid_composer_library_flags INTERFACE)
target_compile_options(
  edid_composer_library_flags INTERFACE -fno-exceptions -fno-rtti -fno-threadsafe-statics -fvisibility=hidden
                                        -fvisibility-inlines-hidden -fstack-protector-strong)
# For a small library. Cold code stays after the hot code of its function: a part of its own would cost each function a
# second unwind entry. Calls within a file go where they say: what is exported is not for a host to replace. And nothing
# here runs long enough for aligned code to pay.
target_compile_options(
  edid_composer_library_flags
  INTERFACE $<$<CXX_COMPILER_ID:GNU>:-fno-reorder-blocks-and-partition
            -fno-semantic-interposition
            -fno-align-functions
            -fno-align-loops
            -fno-align-jumps>)
if(NOT EDID_COMPOSER_SANITIZE)
  target_compile_options(
    edid_composer_library_flags
    INTERFACE $<$<NOT:$<OR:$<CONFIG:Debug>,$<BOOL:$<TARGET_PROPERTY:INSTRUMENTED>>>>:-U_FORTIFY_SOURCE
              -D_FORTIFY_SOURCE=2>)
endif()
target_link_libraries(edid_composer_library_flags INTERFACE edid_composer_warnings)
