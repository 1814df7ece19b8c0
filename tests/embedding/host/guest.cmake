# SPDX-License-Identifier: Apache-2.0
# What the host of this project may expect of it: check_guest() ends the configuration where the
# host's own settings have changed, or where there is more than what the host asked for.

# collect_targets(result folder): the targets of a folder and of all below it.
function(collect_targets result folder)
  get_property(targets DIRECTORY ${folder} PROPERTY BUILDSYSTEM_TARGETS)
  get_property(below DIRECTORY ${folder} PROPERTY SUBDIRECTORIES)
  foreach(child IN LISTS below)
    collect_targets(some ${child})
    list(APPEND targets ${some})
  endforeach()
  set(${result} ${targets} PARENT_SCOPE)
endfunction()

function(check_guest)
  if(NOT CMAKE_CXX_STANDARD EQUAL 17 OR DEFINED CMAKE_CXX_EXTENSIONS OR CMAKE_EXPORT_COMPILE_COMMANDS)
    message(FATAL_ERROR "the host compiles in another way than it said")
  endif()
  get_property(options DIRECTORY PROPERTY COMPILE_OPTIONS)
  get_property(flags TARGET quarn::arlib PROPERTY INTERFACE_COMPILE_OPTIONS)
  if(options OR flags)
    message(FATAL_ERROR "options for the host's own sources: ${options} ${flags}")
  endif()

  collect_targets(targets ${QUARN_TREE})
  list(FILTER targets EXCLUDE REGEX "^quarn([_-]|$)")
  if(targets)
    message(FATAL_ERROR "targets under names that could be the host's: ${targets}")
  endif()
  if(TARGET quarn_test_support OR QUARN_TESTS OR QUARN_BENCHMARKS OR QUARN_WERROR OR QUARN_INSTALL)
    message(FATAL_ERROR "tests, benchmarks, errors or an installation that nobody asked for")
  endif()
endfunction()
