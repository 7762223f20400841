# How code that is installed is compiled and linked, be it library, store or program. All of it stands before the user's
# own flags: of two that contradict each other, compilers and linkers take the last.
option(EDID_COMPOSER_HARDENING "Stack protector, checked calls and containers, control-flow protection, no lazy binding"
       ON)

include(CheckCXXCompilerFlag)
include(CheckPIESupported)
check_pie_supported(LANGUAGES CXX)

# Files name no folder of the machine that built them. Debug builds do, where debuggers look for the source.
set(EDID_COMPOSER_SHIPPED_FLAGS "")
set(mapped macro)
if(NOT CMAKE_BUILD_TYPE STREQUAL "Debug")
  list(APPEND mapped debug)
endif()
foreach(map ${mapped})
  foreach(folder ${PROJECT_SOURCE_DIR} ${PROJECT_BINARY_DIR})
    string(APPEND EDID_COMPOSER_SHIPPED_FLAGS "\"-f${map}-prefix-map=${folder}=.\" ")
  endforeach()
endforeach()

set(EDID_COMPOSER_SHIPPED_LINK_FLAGS "")
# Sanitizers have their own ways with stacks and calls.
if(EDID_COMPOSER_HARDENING AND NOT EDID_COMPOSER_SANITIZE)
  string(APPEND EDID_COMPOSER_SHIPPED_FLAGS "-fstack-protector-strong -include \"${CMAKE_CURRENT_LIST_DIR}/fortify.h\" ")
  foreach(flag -fcf-protection -mbranch-protection=standard) # Of x86 and of 64-bit ARM.
    string(MAKE_C_IDENTIFIER "EDID_COMPOSER_HAS${flag}" has_flag)
    check_cxx_compiler_flag(${flag} ${has_flag})
    if(${has_flag})
      set(EDID_COMPOSER_JUMP_PROTECTION ${flag})
      string(APPEND EDID_COMPOSER_SHIPPED_FLAGS "${flag} ")
    endif()
  endforeach()
  string(APPEND EDID_COMPOSER_SHIPPED_LINK_FLAGS "-Wl,-z,relro,-z,now,-z,noexecstack ")
endif()

# For the folder that it is called in. FLAGS: what the code there asks for besides.
macro(edid_composer_ships_from_here flags)
  string(PREPEND CMAKE_CXX_FLAGS "${EDID_COMPOSER_SHIPPED_FLAGS}${flags} ")
  string(PREPEND CMAKE_SHARED_LINKER_FLAGS "${EDID_COMPOSER_SHIPPED_LINK_FLAGS}")
  string(PREPEND CMAKE_EXE_LINKER_FLAGS "${EDID_COMPOSER_SHIPPED_LINK_FLAGS}")
endmacro()
# Containers of the C++ run-time library, which the library itself does without, end the process on an index out of
# range.
set(EDID_COMPOSER_CHECKED_CONTAINERS "")
if(EDID_COMPOSER_HARDENING)
  set(EDID_COMPOSER_CHECKED_CONTAINERS -D_GLIBCXX_ASSERTIONS)
endif()

# edid_composer_optimise_less(TARGET|SOURCE NAME FLAG...): for what would take long to compile and runs for a moment.
# Not where the user has chosen how much to optimise.
function(edid_composer_optimise_less kind name)
  if(NOT CMAKE_CXX_FLAGS MATCHES "(^| )-O" AND CMAKE_CXX_FLAGS_RELWITHDEBINFO STREQUAL "-O2 -g -DNDEBUG")
    set_property(${kind} ${name} APPEND PROPERTY COMPILE_OPTIONS "$<$<CONFIG:RelWithDebInfo>:${ARGN}>")
  endif()
endfunction()
