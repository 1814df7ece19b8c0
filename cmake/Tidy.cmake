# SPDX-License-Identifier: Apache-2.0
# `--target tidy` runs clang-tidy over the product's sources.
find_program(RUN_CLANG_TIDY NAMES run-clang-tidy run-clang-tidy-14)
if(RUN_CLANG_TIDY)
  add_custom_target(tidy
    COMMAND ${RUN_CLANG_TIDY} -quiet -extra-arg=-Wno-unknown-warning-option -p ${CMAKE_BINARY_DIR}
            "${CMAKE_SOURCE_DIR}/(alloclib|arlib|checking|elfext|messages|quarn|support|tabledrivenparser)/.*"
    USES_TERMINAL VERBATIM)
endif()
