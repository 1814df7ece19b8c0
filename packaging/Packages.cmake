# SPDX-License-Identifier: Apache-2.0
# For Windows one folder in a zip file, programs and pages, to be unpacked anywhere.
if(WIN32)
  set(CPACK_GENERATOR ZIP)
  set(CPACK_COMPONENTS_ALL programs)
  set(CPACK_ARCHIVE_COMPONENT_INSTALL ON)
  set(CPACK_COMPONENTS_GROUPING ALL_COMPONENTS_IN_ONE)
  set(CPACK_PACKAGE_FILE_NAME "quarn-${PROJECT_VERSION}-windows-x86_64")
  set(CPACK_INCLUDE_TOPLEVEL_DIRECTORY ON)
  set(CPACK_COMPONENT_INCLUDE_TOPLEVEL_DIRECTORY ON)
  set(CPACK_PRE_BUILD_SCRIPTS ${CMAKE_CURRENT_LIST_DIR}/windows_files.cmake)
  include(CPack)
  return()
endif()

# Packages for Debian and its kin: `quarn`, the programs with their pages, and `quarn-dev`, what
# programs that link the libraries are built with. scripts/package makes and checks them.
set(QUARN_CONTACT "The maintainers of quarn <quarn@example.org>" CACHE STRING "Who answers for the packages")

set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGE_CONTACT ${QUARN_CONTACT})
set(CPACK_COMPONENTS_ALL programs development)
set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)
set(CPACK_INSTALL_DEFAULT_DIRECTORY_PERMISSIONS
  OWNER_READ OWNER_WRITE OWNER_EXECUTE GROUP_READ GROUP_EXECUTE WORLD_READ WORLD_EXECUTE)
set(CPACK_STRIP_FILES ON)
set(CPACK_PRE_BUILD_SCRIPTS ${CMAKE_CURRENT_LIST_DIR}/debian_files.cmake)

set(CPACK_DEBIAN_PROGRAMS_PACKAGE_NAME quarn)
set(CPACK_DEBIAN_PROGRAMS_PACKAGE_SECTION devel)
set(CPACK_DEBIAN_PROGRAMS_PACKAGE_SHLIBDEPS ON)
set(CPACK_COMPONENT_PROGRAMS_DESCRIPTION "archive tool for object code
It creates, inspects and maintains static libraries. Of ELF objects it reads
the symbols and publishes them; members that are builds of one module it tells
apart by their build attributes. The old archive survives every failure, and
any number of runs may work on one library at once. quarn-json tells of
libraries as JSON, for other programs.")

set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_NAME quarn-dev)
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_SECTION libdevel)
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_RECOMMENDS quarn)
set(CPACK_COMPONENT_DEVELOPMENT_DESCRIPTION "libraries of the archive tool quarn
C++20 libraries that read and write archives, read ELF objects and their build
attributes, parse command lines from tables, and word messages: static
libraries and headers, with files for CMake and pkg-config.")

include(CPack)
