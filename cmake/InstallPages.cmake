# SPDX-License-Identifier: Apache-2.0
# Pages for `man` and completions for shells, where a host has these. `pages` and `completed` are the
# lists of the page files and of the programs.
foreach(page IN LISTS pages)
  string(REGEX MATCH "[0-9]$" section ${page})
  install(FILES ${PROJECT_SOURCE_DIR}/manual/${page}
    COMPONENT programs DESTINATION ${CMAKE_INSTALL_MANDIR}/man${section})
endforeach()
# A page of two names. It is there twice, as no link outlives that pages are compressed.
install(FILES ${PROJECT_SOURCE_DIR}/manual/quarn-ar.1 RENAME quarn-ranlib.1
  COMPONENT programs DESTINATION ${CMAKE_INSTALL_MANDIR}/man1)

# Shells look for a command's completion under the command's name; zsh reads the names from the file,
# in another folder of the system's than of anybody else's.
set(completions ${PROJECT_SOURCE_DIR}/completions)
foreach(program IN LISTS completed)
  install(FILES ${completions}/quarn.bash COMPONENT programs RENAME ${program}
    DESTINATION ${CMAKE_INSTALL_DATADIR}/bash-completion/completions)
  install(FILES ${completions}/quarn.fish COMPONENT programs RENAME ${program}.fish
    DESTINATION ${CMAKE_INSTALL_DATADIR}/fish/vendor_completions.d)
endforeach()
set(zsh_functions site-functions)
if(CMAKE_INSTALL_PREFIX STREQUAL "/usr" AND EXISTS /etc/debian_version)
  set(zsh_functions vendor-completions)
endif()
install(FILES ${completions}/_quarn COMPONENT programs
  DESTINATION ${CMAKE_INSTALL_DATADIR}/zsh/${zsh_functions})
