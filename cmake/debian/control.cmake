# Corrects the package with the shared library. CPack runs this after it has built the packages.
#
# Such a package calls ldconfig through a trigger: once, however many libraries are installed with it. CPack
# 3.25 adds scripts that call it instead, and cannot write the field Multi-Arch.
foreach(package IN LISTS CPACK_PACKAGE_FILES)
  get_filename_component(name ${package} NAME_WE)
  set(tree ${CPACK_TEMPORARY_DIRECTORY}/${name})
  set(control ${tree}/DEBIAN)
  execute_process(COMMAND dpkg-deb --raw-extract ${package} ${tree} COMMAND_ERROR_IS_FATAL ANY)
  if(NOT EXISTS ${control}/shlibs)
    continue()
  endif()

  file(REMOVE ${control}/postinst ${control}/postrm)
  file(WRITE ${control}/triggers "activate-noawait ldconfig\n")
  file(READ ${control}/control fields)
  string(REPLACE "\nPackage:" "\nMulti-Arch: same\nPackage:" fields "${fields}")
  file(WRITE ${control}/control "${fields}")
  execute_process(
    COMMAND dpkg-deb --root-owner-group -Z${CPACK_DEBIAN_COMPRESSION_TYPE} --build ${tree} ${package}
    OUTPUT_QUIET COMMAND_ERROR_IS_FATAL ANY)
endforeach()
