# Header-only libraries: those of the build machine work for any target.
include(FindPackageHandleStandardArgs)

# bdmvnavigator_find_host_headers(PACKAGE TARGET FOLDERS...): an imported TARGET that sees only these
# FOLDERS of /usr/include, because the rest includes the headers of the wrong C library. The version is
# in the package's configuration for the build machine.
macro(bdmvnavigator_find_host_headers package target)
  set(${package}_HEADERS TRUE)
  foreach(folder ${ARGN})
    if(EXISTS /usr/include/${folder})
      file(MAKE_DIRECTORY ${CMAKE_BINARY_DIR}/host-headers)
      file(CREATE_LINK /usr/include/${folder} ${CMAKE_BINARY_DIR}/host-headers/${folder} SYMBOLIC)
    else()
      set(${package}_HEADERS ${package}_HEADERS-NOTFOUND)
    endif()
  endforeach()
  file(GLOB ${package}_version_files
    /usr/share/cmake/${package}/*[Vv]ersion.cmake /usr/lib/*/cmake/${package}/*[Vv]ersion.cmake)
  foreach(version_file IN LISTS ${package}_version_files)
    include(${version_file})
    string(REGEX REPLACE " .*" "" ${package}_VERSION ${PACKAGE_VERSION}) # without "(64bit)"
  endforeach()
  find_package_handle_standard_args(${package} REQUIRED_VARS ${package}_HEADERS)
  if(${package}_FOUND AND NOT TARGET ${target})
    add_library(${target} INTERFACE IMPORTED)
    target_include_directories(${target} INTERFACE ${CMAKE_BINARY_DIR}/host-headers)
  endif()
endmacro()
