# SPDX-License-Identifier: Apache-2.0
# A program that is started thousands of times a day should not look for its libraries each time:
# half of a short run is the dynamic loader. Where the host has static libraries, link them.
include(CheckCXXSourceCompiles)

set(CMAKE_REQUIRED_LINK_OPTIONS -static)
check_cxx_source_compiles("#include <string>\nint main(int c, char**) { return std::to_string(c).empty(); }"
                          QUARN_HAS_STATIC_LIBRARIES)
unset(CMAKE_REQUIRED_LINK_OPTIONS)

function(quarn_static_program target)
  if(QUARN_HAS_STATIC_LIBRARIES AND NOT QUARN_SANITIZE)
    target_link_options(${target} PRIVATE $<$<CONFIG:Release>:-static>)
  endif()
endfunction()
