# SPDX-License-Identifier: Apache-2.0
# How every target of the house is compiled, and the two functions that declare one. Nothing here
# reaches a target of somebody else's that is linked with ours, but that it needs C++20.

set(CMAKE_CXX_STANDARD 20)
set(CMAKE_CXX_STANDARD_REQUIRED ON)
set(CMAKE_CXX_EXTENSIONS OFF)
if(PROJECT_IS_TOP_LEVEL)
  set(CMAKE_EXPORT_COMPILE_COMMANDS ON)
endif()

add_library(quarn_flags INTERFACE)
target_compile_options(quarn_flags INTERFACE
  # The same source gives the same bytes wherever the tree and the build folder lie.
  "-ffile-prefix-map=${PROJECT_SOURCE_DIR}/=" "-ffile-prefix-map=${PROJECT_BINARY_DIR}/=build/"
  -Wall -Wextra -Wpedantic -Wconversion -Wshadow $<$<BOOL:${QUARN_WERROR}>:-Werror>
  -Wcast-qual -Wextra-semi -Wformat=2 -Wold-style-cast -Woverloaded-virtual -Wundef
  $<$<CXX_COMPILER_ID:GNU>:-Wduplicated-branches$<SEMICOLON>-Wduplicated-cond>
  # The first one holds a rule: a switch over all of an enumeration has no default.
  $<$<CXX_COMPILER_ID:Clang>:-Wcovered-switch-default$<SEMICOLON>-Wcomma$<SEMICOLON>-Wreserved-identifier$<SEMICOLON>-Wunreachable-code-aggressive>
  # g++ 12 takes a plain std::string "+" for an overlapping copy once it is inlined.
  $<$<CXX_COMPILER_ID:GNU>:-Wno-restrict>
  # Some assertions say in words what can't be: !"We shouldn't be here".
  $<$<CXX_COMPILER_ID:Clang>:-Wno-string-conversion>)

if(QUARN_SANITIZE)
  target_compile_options(quarn_flags INTERFACE
    -fsanitize=address,undefined -fno-sanitize-recover=all -fno-omit-frame-pointer)
  # Who links with our libraries needs their runtime.
  target_link_options(quarn_flags INTERFACE -fsanitize=address,undefined -fno-sanitize-recover=all)
endif()

# quarn_library(room SOURCES file... DEPENDS room...): one library of the house, quarn::room to all
# others. DEPENDS is the whole list of rooms that it may include from.
function(quarn_library room)
  cmake_parse_arguments(ARG "" "" "SOURCES;DEPENDS" ${ARGN})
  list(TRANSFORM ARG_DEPENDS PREPEND quarn::)
  set(target quarn_${room})
  add_library(${target} STATIC ${ARG_SOURCES})
  add_library(quarn::${room} ALIAS ${target})
  target_compile_features(${target} PUBLIC cxx_std_20)
  target_include_directories(${target} PUBLIC $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}>)
  target_link_libraries(${target} PUBLIC ${ARG_DEPENDS} PRIVATE $<BUILD_INTERFACE:quarn_flags>)
  # The fuzzing engine steers by what the libraries do, not only by what its target does.
  if(QUARN_SANITIZE AND CMAKE_CXX_COMPILER_ID STREQUAL "Clang")
    target_compile_options(${target} PRIVATE -fsanitize=fuzzer-no-link)
  endif()
  if(QUARN_SHAKE_ORDER)
    target_compile_definitions(${target} PUBLIC QUARN_SHAKE_ORDER)
  endif()
endfunction()

# quarn_test_program(name [CASES_APART] [OPTIMISED] SOURCES file... LIBRARIES room...): one GoogleTest
# program and one ctest entry, or one for each of its cases where these are long and many cores can
# share them. Two thousand short cases take less time than two thousand starts of a program.
#
# Tests are compiled without optimisation, on headers that are read once: that takes a third of the
# time, and what is tested are the libraries, which keep theirs. OPTIMISED is for programs that
# spend minutes in what headers hold, which is compiled like the test. NOT_ON_WINDOWS names cases that
# hold the program against what the C library of POSIX systems does.
function(quarn_test_program name)
  cmake_parse_arguments(ARG "CASES_APART;OPTIMISED" "" "SOURCES;LIBRARIES;NOT_ON_WINDOWS" ${ARGN})
  list(TRANSFORM ARG_LIBRARIES PREPEND quarn::)
  add_executable(${name} ${ARG_SOURCES})
  target_link_libraries(${name} PRIVATE ${ARG_LIBRARIES} quarn_flags GTest::gmock GTest::gtest_main)
  if(NOT ARG_OPTIMISED)
    target_compile_options(${name} PRIVATE -O0)
    target_precompile_headers(${name} REUSE_FROM quarn_test_headers)
  endif()
  # What asks for more memory than there is gets a refusal, as it does without the sanitizers.
  set(environment "ASAN_OPTIONS=allocator_may_return_null=1")
  if(ARG_CASES_APART)
    gtest_discover_tests(${name} DISCOVERY_MODE PRE_TEST PROPERTIES ENVIRONMENT "${environment}")
  else()
    set(filter "")
    if(WIN32 AND ARG_NOT_ON_WINDOWS)
      list(JOIN ARG_NOT_ON_WINDOWS ":" filter)
      set(filter "--gtest_filter=-${filter}")
    endif()
    add_test(NAME ${name} COMMAND ${name} --gtest_brief=1 ${filter})
    set_tests_properties(${name} PROPERTIES ENVIRONMENT "${environment}")
  endif()
endfunction()
