# Header-only libraries: those of the build machine work for any target.
include(FindPackageHandleStandardArgs)

# bdmvnavigator_find_host_headers(PACKAGE TARGET FOLDERS...): an imported TARGET that sees only these
# FOLDERS of /usr/include, because the rest includes the headers of the wrong C library.
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
  find_package_handle_standard_args(${package} REQUIRED_VARS ${package}_HEADERS)
  if(${package}_FOUND AND NOT TARGET ${target})
    add_library(${target} INTERFACE IMPORTED)
    target_include_directories(${target} INTERFACE ${CMAKE_BINARY_DIR}/host-headers)
  endif()
endmacro()
