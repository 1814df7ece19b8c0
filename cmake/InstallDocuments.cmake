# SPDX-License-Identifier: Apache-2.0
# Documents beside the programs, where a host has no place for manual pages: licence, documents, and the
# manual for a browser, if mandoc is there to make it. `pages` is the list of the page files.
install(FILES ${PROJECT_SOURCE_DIR}/LICENSE ${PROJECT_SOURCE_DIR}/README.md ${PROJECT_SOURCE_DIR}/CHANGELOG.md
  COMPONENT programs DESTINATION .)
install(DIRECTORY ${PROJECT_SOURCE_DIR}/docs COMPONENT programs DESTINATION . FILES_MATCHING PATTERN "*.md")

find_program(MANDOC mandoc DOC "Turns manual pages into pages for a browser")
if(NOT MANDOC)
  return()
endif()
set(browser_pages "")
foreach(page IN LISTS pages)
  set(from ${PROJECT_SOURCE_DIR}/manual/${page})
  set(to ${PROJECT_BINARY_DIR}/manual/${page}.html)
  add_custom_command(OUTPUT ${to} DEPENDS ${from} COMMAND ${MANDOC} -T html ${from} > ${to} VERBATIM)
  list(APPEND browser_pages ${to})
endforeach()
file(MAKE_DIRECTORY ${PROJECT_BINARY_DIR}/manual)
add_custom_target(browser_pages ALL DEPENDS ${browser_pages})
install(FILES ${browser_pages} COMPONENT programs DESTINATION manual)
