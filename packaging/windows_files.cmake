# SPDX-License-Identifier: Apache-2.0
# CPack runs this over the folder that becomes the zip file for Windows. The same commit gives the same
# bytes: SOURCE_DATE_EPOCH says which day all files are of.
if(DEFINED ENV{SOURCE_DATE_EPOCH})
  file(GLOB_RECURSE entries LIST_DIRECTORIES true ${CPACK_TEMPORARY_DIRECTORY}/*)
  execute_process(COMMAND touch -d @$ENV{SOURCE_DATE_EPOCH} ${entries} COMMAND_ERROR_IS_FATAL ANY)
endif()
