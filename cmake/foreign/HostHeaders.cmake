# Libraries that need no more than their headers: those of the building machine serve any target.
include(FindPackageHandleStandardArgs)

# bdmvnavigator_find_host_headers(PACKAGE TARGET FOLDERS...): an imported TARGET that sees these
# FOLDERS of /usr/include and nothing else there, where the headers of the wrong C library are.
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
