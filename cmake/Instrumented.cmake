# Code a second time, as a sanitizer sees it, beside the plain one. Tests are compiled once and linked to both.
set(address_sanitizer -fsanitize=address,undefined)
set(thread_sanitizer -fsanitize=thread)

# add_instrumented(NAME SANITIZER FLAGS_FROM TARGET...): compiles the sources of the targets again, with a sanitizer and
# the flags of the interface library FLAGS_FROM, as the object library NAME.
function(add_instrumented name sanitizer flags)
  add_library(${name} OBJECT)
  foreach(target ${ARGN})
    get_target_property(folder ${target} SOURCE_DIR)
    get_target_property(sources ${target} SOURCES)
    get_target_property(definitions ${target} COMPILE_DEFINITIONS)
    list(TRANSFORM sources PREPEND ${folder}/ REGEX "^[^/$]")
    target_sources(${name} PRIVATE ${sources})
    if(definitions)
      set_source_files_properties(${sources} PROPERTIES COMPILE_DEFINITIONS "${definitions}")
    endif()
    target_include_directories(${name} PRIVATE $<TARGET_PROPERTY:${target},INCLUDE_DIRECTORIES>)
    add_dependencies(${name} ${target}) # Which generates some of the sources.
  endforeach()
  # A little optimisation makes it run three times as fast.
  target_compile_options(${name} PRIVATE -O1 -g1 -fno-omit-frame-pointer ${sanitizer} -fno-sanitize-recover=all)
  target_link_libraries(${name} PRIVATE ${flags})
endfunction()
