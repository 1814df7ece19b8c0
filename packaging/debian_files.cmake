# SPDX-License-Identifier: Apache-2.0
# What each Debian package holds beside the installation: licence, changes, and what lintian is to
# accept; pages and changes are compressed. CPack runs this over the folders that it will pack.
function(compress)
  execute_process(COMMAND gzip -9nf ${ARGV} COMMAND_ERROR_IS_FATAL ANY)
endfunction()

# SOURCE_DATE_EPOCH says which day today is.
string(TIMESTAMP now "%a, %d %b %Y %H:%M:%S +0000" UTC)

foreach(component IN LISTS CPACK_COMPONENTS_ALL)
  string(TOUPPER ${component} key)
  set(package ${CPACK_DEBIAN_${key}_PACKAGE_NAME})
  set(share ${CPACK_TEMPORARY_DIRECTORY}/${component}/usr/share)
  set(doc ${share}/doc/${package})
  file(COPY ${CMAKE_CURRENT_LIST_DIR}/copyright DESTINATION ${doc})
  file(COPY_FILE ${CMAKE_CURRENT_LIST_DIR}/../CHANGELOG.md ${doc}/NEWS.md)
  file(WRITE ${doc}/changelog "${package} (${CPACK_PACKAGE_VERSION}) unstable; urgency=medium\n\n\
  * NEWS.md.gz tells what is new.\n\n -- ${CPACK_PACKAGE_CONTACT}  ${now}\n")
  compress(${doc}/NEWS.md ${doc}/changelog)

  file(GLOB pages ${share}/man/man*/*)
  if(pages)
    compress(${pages})
  endif()

  set(overrides ${CMAKE_CURRENT_LIST_DIR}/${package}.lintian-overrides)
  if(EXISTS ${overrides})
    file(MAKE_DIRECTORY ${share}/lintian/overrides)
    file(COPY_FILE ${overrides} ${share}/lintian/overrides/${package})
  endif()
endforeach()
