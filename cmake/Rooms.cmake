# SPDX-License-Identifier: Apache-2.0
# The picture of the rooms in docs/architecture.md is drawn from the build's own graph.

# quarn_write_rooms(file): a line for each folder that has targets so far, its name and those of the
# folders that its targets are linked with.
function(quarn_write_rooms file)
  get_property(folders DIRECTORY ${PROJECT_SOURCE_DIR} PROPERTY SUBDIRECTORIES)
  set(lines "")
  foreach(folder IN LISTS folders)
    get_property(targets DIRECTORY ${folder} PROPERTY BUILDSYSTEM_TARGETS)
    set(rooms "")
    foreach(target IN LISTS targets)
      get_target_property(libraries ${target} LINK_LIBRARIES)
      foreach(library IN LISTS libraries)
        if(TARGET ${library})
          get_target_property(place ${library} SOURCE_DIR)
          list(APPEND rooms ${place})
        endif()
      endforeach()
    endforeach()
    list(REMOVE_ITEM rooms ${folder} ${PROJECT_SOURCE_DIR})
    list(REMOVE_DUPLICATES rooms)
    set(line ${folder} ${rooms})
    list(TRANSFORM line REPLACE "^.*/" "")
    list(JOIN line " " line)
    string(APPEND lines "${line}\n")
  endforeach()
  file(WRITE ${file} "${lines}")
endfunction()
quarn_write_rooms(${PROJECT_BINARY_DIR}/rooms.txt)

# `--target map` draws the picture anew.
find_package(Python3 3.8 COMPONENTS Interpreter)
set(QUARN_DRAW_ROOMS ${Python3_EXECUTABLE} ${PROJECT_SOURCE_DIR}/scripts/draw_rooms
  ${PROJECT_BINARY_DIR}/rooms.txt ${PROJECT_SOURCE_DIR}/docs/architecture.md)
if(Python3_FOUND)
  add_custom_target(map COMMAND ${QUARN_DRAW_ROOMS} VERBATIM)
endif()
