# Adds the documents that only a Debian package has to the files of each package. CPack runs this before it
# builds the packages.
set(root ${CMAKE_CURRENT_LIST_DIR}/../..)
set(version ${CPACK_PACKAGE_VERSION}-${CPACK_DEBIAN_PACKAGE_RELEASE})
string(TIMESTAMP date "%a, %d %b %Y %H:%M:%S +0000" UTC) # SOURCE_DATE_EPOCH, if that is set

set(compressed)
foreach(component IN LISTS CPACK_COMPONENTS_ALL)
  string(TOUPPER ${component} upper)
  set(staged ${CPACK_TEMPORARY_INSTALL_DIRECTORY}/${component}/usr/share)
  set(folder ${staged}/doc/${CPACK_DEBIAN_${upper}_PACKAGE_NAME})
  configure_file(${root}/CHANGELOG.md ${folder}/changelog COPYONLY)
  configure_file(${CMAKE_CURRENT_LIST_DIR}/changelog.Debian.in ${folder}/changelog.Debian @ONLY)
  file(GLOB files ${folder}/changelog* ${staged}/man/man?/*)
  list(APPEND compressed ${files})
endforeach()

execute_process(COMMAND gzip -9 --no-name ${compressed} RESULT_VARIABLE status)
if(status)
  message(FATAL_ERROR "gzip failed: ${status}")
endif()
