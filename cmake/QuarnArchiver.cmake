# SPDX-License-Identifier: Apache-2.0
# Makes quarn-ar the archiver of a project for C, CXX and ASM. Any of these lines will do:
#
#   include(QuarnArchiver)                                          behind find_package(quarn)
#   include(/usr/share/quarn/QuarnArchiver.cmake)                   in a project or a toolchain file
#   cmake -DCMAKE_PROJECT_TOP_LEVEL_INCLUDES=.../QuarnArchiver.cmake    for a project as it is, from CMake 3.24 on
#
# It holds for the folder that includes it and for those below. Diagnostics begin with the archive,
# as editors want them; QUARN_DIAG_STYLE chooses another style.

# CMake tries compilers in projects of its own, which know none of the settings and want no archiver.
get_property(_quarn_is_trial GLOBAL PROPERTY IN_TRY_COMPILE)
if(_quarn_is_trial)
  return()
endif()

# In front of the languages: what CMake knows of a compiler replaces the rules for link-time
# optimisation, and this is read again behind it.
if(NOT CMAKE_USER_MAKE_RULES_OVERRIDE)
  set(CMAKE_USER_MAKE_RULES_OVERRIDE "${CMAKE_CURRENT_LIST_FILE}")
endif()

find_program(QUARN_AR quarn-ar REQUIRED DOC "The archiver"
  HINTS "${CMAKE_CURRENT_LIST_DIR}/../../bin")
find_program(QUARN_RANLIB quarn-ranlib REQUIRED DOC "The archiver under its other name"
  HINTS "${CMAKE_CURRENT_LIST_DIR}/../../bin")
set(QUARN_DIAG_STYLE gnu CACHE STRING "How the archiver's diagnostics look: gnu, ide or zev")

# For rules of the project's own.
set(CMAKE_AR "${QUARN_AR}")
set(CMAKE_RANLIB "${QUARN_RANLIB}")

# Each write makes the symbol table, so there is nothing left to finish. A target's own options
# (STATIC_LIBRARY_OPTIONS) come last and win.
set(_quarn_ar "\"${QUARN_AR}\" --diag_style=${QUARN_DIAG_STYLE}")
foreach(_quarn_language IN ITEMS C CXX)
  foreach(_quarn_kind IN ITEMS "" _IPO)
    set(_quarn_rule CMAKE_${_quarn_language}_ARCHIVE)
    set(${_quarn_rule}_CREATE${_quarn_kind} "${_quarn_ar} qc <TARGET> <LINK_FLAGS> <OBJECTS>")
    set(${_quarn_rule}_APPEND${_quarn_kind} "${_quarn_ar} q <TARGET> <LINK_FLAGS> <OBJECTS>")
    set(${_quarn_rule}_FINISH${_quarn_kind} "")
  endforeach()
endforeach()
# For assemblers CMake has one rule, before which it doesn't remove the old archive.
set(CMAKE_ASM_CREATE_STATIC_LIBRARY
  "\"${CMAKE_COMMAND}\" -E rm -f <TARGET>" "${_quarn_ar} qc <TARGET> <LINK_FLAGS> <OBJECTS>")
unset(_quarn_ar)
unset(_quarn_is_trial)
unset(_quarn_rule)
