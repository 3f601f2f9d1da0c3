# Installs into an empty prefix.
file(REMOVE_RECURSE ${PREFIX})
execute_process(
  COMMAND ${CMAKE_COMMAND} --install ${BUILD} --prefix ${PREFIX}
  RESULT_VARIABLE result)
if(result)
  message(FATAL_ERROR "the installation failed")
endif()

# All headers lie under one root.
file(GLOB roots RELATIVE ${PREFIX}/include ${PREFIX}/include/*)
if(NOT roots STREQUAL "bdmvnavigator")
  message(FATAL_ERROR "include/ contains ${roots} instead of bdmvnavigator alone")
endif()

# The others of their kit are installed, see the tests of the components.
foreach(header IN LISTS PRIVATE_HEADERS)
  if(EXISTS ${PREFIX}/include/bdmvnavigator/${header})
    message(FATAL_ERROR "${header} is installed")
  endif()
endforeach()
