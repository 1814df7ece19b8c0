# SPDX-License-Identifier: Apache-2.0
# What our programs are besides their sources.
#
# A program that is started thousands of times a day should not look for its libraries each time:
# half of a short run is the dynamic loader. Where the host has static libraries, link them.
include(CheckCXXSourceCompiles)

set(CMAKE_REQUIRED_LINK_OPTIONS -static)
check_cxx_source_compiles("#include <string>\nint main(int c, char**) { return std::to_string(c).empty(); }"
                          QUARN_HAS_STATIC_LIBRARIES)
unset(CMAKE_REQUIRED_LINK_OPTIONS)

# What Windows shows of a program's file, and what it has to know before it starts it.
function(quarn_add_resources target about)
  set(program ${target}${CMAKE_EXECUTABLE_SUFFIX})
  set(manifest ${PROJECT_SOURCE_DIR}/packaging/windows.manifest)
  set(script ${CMAKE_CURRENT_BINARY_DIR}/${target}.rc)
  configure_file(${PROJECT_SOURCE_DIR}/packaging/windows.rc.in ${script} @ONLY)
  target_sources(${target} PRIVATE ${script})
  set_source_files_properties(${script} PROPERTIES OBJECT_DEPENDS ${manifest})
endfunction()

function(quarn_static_program target)
  if(QUARN_HAS_STATIC_LIBRARIES AND NOT QUARN_SANITIZE)
    target_link_options(${target} PRIVATE $<$<CONFIG:Release>:-static>)
  endif()
endfunction()

# quarn_program(target about): one of the programs that we hand out; `about` is what a user may be
# told of it in a line.
function(quarn_program target about)
  quarn_static_program(${target})
  if(WIN32)
    # The same source gives the same bytes on any day.
    target_link_options(${target} PRIVATE -Wl,--no-insert-timestamp $<$<CONFIG:Release>:-s>)
    quarn_add_resources(${target} "${about}")
  endif()
endfunction()
