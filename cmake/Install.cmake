# SPDX-License-Identifier: Apache-2.0
# What an installation holds, in two parts: the programs with their pages, and all that programs
# which link the libraries are built with. Nothing in it says where it lies, so that the whole may be moved.
include(GNUInstallDirs)
include(CMakePackageConfigHelpers)

set(folder ${CMAKE_INSTALL_LIBDIR}/cmake/quarn)

# The libraries, lowest first, and what pkg-config says of each.
set(rooms alloclib checking support tabledrivenparser messages elfext arlib)
set(about_alloclib "Regions of memory for quarn's libraries")
set(about_checking "Run-time checking levels for quarn's libraries")
set(about_support "Files, paths and patterns for quarn's libraries")
set(about_tabledrivenparser "Command lines from tables, with via files")
set(about_messages "Catalogues of messages, severities and styles")
set(about_elfext "ELF objects and their build attributes")
set(about_arlib "Archives of object code, read and written")

# Programs.
install(TARGETS quarn quarn-ar COMPONENT programs)
set(completed quarn quarn-ar quarn-ranlib)
set(pages quarn.1 quarn-ar.1 quarn-archive.5 quarn-attributes.7)
if(TARGET quarn-json)
  list(APPEND pages quarn-json.1)
  list(APPEND completed quarn-json)
  install(TARGETS quarn-json COMPONENT programs)
  install(FILES ${PROJECT_SOURCE_DIR}/docs/quarn-json.schema.json
    COMPONENT programs DESTINATION ${CMAKE_INSTALL_DATADIR}/quarn)
endif()
install(FILES "$<TARGET_FILE_DIR:quarn-ar>/quarn-ranlib${CMAKE_EXECUTABLE_SUFFIX}"
  COMPONENT programs DESTINATION ${CMAKE_INSTALL_BINDIR})
install(FILES ${CMAKE_CURRENT_LIST_DIR}/QuarnArchiver.cmake ${PROJECT_SOURCE_DIR}/docs/problem-matcher.json
  COMPONENT programs DESTINATION ${CMAKE_INSTALL_DATADIR}/quarn)
if(WIN32)
  include(${CMAKE_CURRENT_LIST_DIR}/InstallDocuments.cmake)
else()
  include(${CMAKE_CURRENT_LIST_DIR}/InstallPages.cmake)
endif()

# Headers and libraries.
foreach(room IN LISTS rooms)
  set_target_properties(quarn_${room} PROPERTIES EXPORT_NAME ${room})
  install(TARGETS quarn_${room} EXPORT quarn-libraries COMPONENT development
    INCLUDES DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}/quarn)
  install(DIRECTORY ${PROJECT_SOURCE_DIR}/${room}/interface COMPONENT development
    DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}/quarn/${room} FILES_MATCHING PATTERN "*.h")
endforeach()

# For CMake.
configure_package_config_file(${CMAKE_CURRENT_LIST_DIR}/quarn-config.cmake.in
  ${PROJECT_BINARY_DIR}/quarn-config.cmake INSTALL_DESTINATION ${folder} PATH_VARS CMAKE_INSTALL_BINDIR CMAKE_INSTALL_DATADIR)
write_basic_package_version_file(${PROJECT_BINARY_DIR}/quarn-config-version.cmake
  COMPATIBILITY SameMajorVersion)
install(FILES ${PROJECT_BINARY_DIR}/quarn-config.cmake ${PROJECT_BINARY_DIR}/quarn-config-version.cmake
  COMPONENT development DESTINATION ${folder})
install(EXPORT quarn-libraries NAMESPACE quarn:: COMPONENT development DESTINATION ${folder})

# For pkg-config, which knows where it found the file.
cmake_path(SET here NORMALIZE ${CMAKE_INSTALL_PREFIX}/${CMAKE_INSTALL_LIBDIR}/pkgconfig)
cmake_path(RELATIVE_PATH CMAKE_INSTALL_PREFIX BASE_DIRECTORY ${here} OUTPUT_VARIABLE prefix)
foreach(room IN LISTS rooms)
  set(about ${about_${room}})
  # Each library's target knows what it is linked with.
  get_target_property(libraries quarn_${room} INTERFACE_LINK_LIBRARIES)
  list(FILTER libraries INCLUDE REGEX "^quarn::")
  list(TRANSFORM libraries REPLACE "^quarn::" "quarn-")
  list(JOIN libraries " " requires)
  configure_file(${CMAKE_CURRENT_LIST_DIR}/quarn-room.pc.in ${PROJECT_BINARY_DIR}/quarn-${room}.pc @ONLY)
  install(FILES ${PROJECT_BINARY_DIR}/quarn-${room}.pc
    COMPONENT development DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig)
endforeach()
