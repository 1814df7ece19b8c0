# SPDX-License-Identifier: Apache-2.0
# How every target of the house is compiled, and the two functions that declare one.

set(CMAKE_CXX_STANDARD 20)
set(CMAKE_CXX_STANDARD_REQUIRED ON)
set(CMAKE_CXX_EXTENSIONS OFF)
set(CMAKE_EXPORT_COMPILE_COMMANDS ON)

# The same source gives the same bytes wherever the tree and the build folder lie.
add_compile_options("-ffile-prefix-map=${CMAKE_SOURCE_DIR}/=" "-ffile-prefix-map=${CMAKE_BINARY_DIR}/=build/")

add_library(quarn_warnings INTERFACE)
target_compile_options(quarn_warnings INTERFACE
  -Wall -Wextra -Wpedantic -Wconversion -Wshadow -Werror
  -Wcast-qual -Wextra-semi -Wformat=2 -Wold-style-cast -Woverloaded-virtual -Wundef
  $<$<CXX_COMPILER_ID:GNU>:-Wduplicated-branches$<SEMICOLON>-Wduplicated-cond>
  # The first one holds a rule: a switch over all of an enumeration has no default.
  $<$<CXX_COMPILER_ID:Clang>:-Wcovered-switch-default$<SEMICOLON>-Wcomma$<SEMICOLON>-Wreserved-identifier$<SEMICOLON>-Wunreachable-code-aggressive>
  # g++ 12 takes a plain std::string "+" for an overlapping copy once it is inlined.
  $<$<CXX_COMPILER_ID:GNU>:-Wno-restrict>
  # Some assertions say in words what can't be: !"We shouldn't be here".
  $<$<CXX_COMPILER_ID:Clang>:-Wno-string-conversion>)

if(QUARN_SANITIZE)
  add_compile_options(-fsanitize=address,undefined -fno-sanitize-recover=all -fno-omit-frame-pointer)
  add_link_options(-fsanitize=address,undefined -fno-sanitize-recover=all)
endif()

# quarn_library(name SOURCES file... DEPENDS library...): one library of the house. DEPENDS is
# the whole list of rooms that it may include from.
function(quarn_library name)
  cmake_parse_arguments(ARG "" "" "SOURCES;DEPENDS" ${ARGN})
  add_library(${name} STATIC ${ARG_SOURCES})
  target_include_directories(${name} PUBLIC ${CMAKE_SOURCE_DIR})
  target_link_libraries(${name} PUBLIC ${ARG_DEPENDS} PRIVATE quarn_warnings)
  # The fuzzing engine steers by what the libraries do, not only by what its target does.
  if(QUARN_SANITIZE AND CMAKE_CXX_COMPILER_ID STREQUAL "Clang")
    target_compile_options(${name} PRIVATE -fsanitize=fuzzer-no-link)
  endif()
  if(QUARN_SHAKE_ORDER)
    target_compile_definitions(${name} PUBLIC QUARN_SHAKE_ORDER)
  endif()
endfunction()

# quarn_test_program(name [CASES_APART] [OPTIMISED] SOURCES file... LIBRARIES library...): one GoogleTest
# program and one ctest entry, or one for each of its cases where these are long and many cores can
# share them. Two thousand short cases take less time than two thousand starts of a program.
#
# Tests are compiled without optimisation, on headers that are read once: that takes a third of the
# time, and what is tested are the libraries, which keep theirs. OPTIMISED is for programs that
# spend minutes in what headers hold, which is compiled like the test.
function(quarn_test_program name)
  cmake_parse_arguments(ARG "CASES_APART;OPTIMISED" "" "SOURCES;LIBRARIES" ${ARGN})
  add_executable(${name} ${ARG_SOURCES})
  target_link_libraries(${name} PRIVATE ${ARG_LIBRARIES} quarn_warnings GTest::gmock GTest::gtest_main)
  if(NOT ARG_OPTIMISED)
    target_compile_options(${name} PRIVATE -O0)
    target_precompile_headers(${name} REUSE_FROM test_headers)
  endif()
  # What asks for more memory than there is gets a refusal, as it does without the sanitizers.
  set(environment "ASAN_OPTIONS=allocator_may_return_null=1")
  if(ARG_CASES_APART)
    gtest_discover_tests(${name} DISCOVERY_MODE PRE_TEST PROPERTIES ENVIRONMENT "${environment}")
  else()
    add_test(NAME ${name} COMMAND ${name} --gtest_brief=1)
    set_tests_properties(${name} PROPERTIES ENVIRONMENT "${environment}")
  endif()
endfunction()
