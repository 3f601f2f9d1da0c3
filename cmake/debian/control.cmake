# Corrects what CPack cannot be told. CPack runs this after it has built the packages.
#
# A package with a shared library calls ldconfig through a trigger: once, however many libraries are
# installed. CPack 3.25 makes it call ldconfig itself. Nor has that version a setting for Multi-Arch; the
# files of a library's packages are in folders of their architecture, or equal on all.
foreach(package IN LISTS CPACK_PACKAGE_FILES)
  get_filename_component(name ${package} NAME_WE)
  if(NOT name MATCHES "^lib")
    continue()
  endif()
  set(tree ${CPACK_TEMPORARY_DIRECTORY}/${name})
  execute_process(COMMAND dpkg-deb --raw-extract ${package} ${tree} COMMAND_ERROR_IS_FATAL ANY)

  set(control ${tree}/DEBIAN)
  if(EXISTS ${control}/shlibs)
    file(REMOVE ${control}/postinst ${control}/postrm)
    file(WRITE ${control}/triggers "activate-noawait ldconfig\n")
  endif()
  file(READ ${control}/control fields)
  string(REPLACE "\nPackage:" "\nMulti-Arch: same\nPackage:" fields "${fields}")
  file(WRITE ${control}/control "${fields}")

  execute_process(
    COMMAND dpkg-deb --root-owner-group -Z${CPACK_DEBIAN_COMPRESSION_TYPE} --build ${tree} ${package}
    OUTPUT_QUIET COMMAND_ERROR_IS_FATAL ANY)
endforeach()
