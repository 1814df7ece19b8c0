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

# quarn_unit_test(name SOURCES file... LIBRARIES library...): one GoogleTest program, one ctest
# entry for each of its cases.
function(quarn_unit_test name)
  cmake_parse_arguments(ARG "" "" "SOURCES;LIBRARIES" ${ARGN})
  add_executable(${name} ${ARG_SOURCES})
  target_link_libraries(${name} PRIVATE ${ARG_LIBRARIES} quarn_warnings GTest::gmock GTest::gtest_main)
  # What asks for more memory than there is gets a refusal, as it does without the sanitizers.
  gtest_discover_tests(${name} DISCOVERY_MODE PRE_TEST
    PROPERTIES ENVIRONMENT "ASAN_OPTIONS=allocator_may_return_null=1")
endfunction()
