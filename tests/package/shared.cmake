# Builds the project SOURCE in BUILD with BUILD_SHARED_LIBS, installs it in PREFIX and examines the
# shared library.

include(${CMAKE_CURRENT_LIST_DIR}/run.cmake)

# The runtime of a sanitizer is always undefined in a shared library.
if(NOT INSTRUMENTED)
  list(APPEND OPTIONS -DCMAKE_SHARED_LINKER_FLAGS=-Wl,-z,defs)
endif()
run("configuring" ${CMAKE_COMMAND} -S ${SOURCE} -B ${BUILD} -G "${GENERATOR}" ${OPTIONS}
  -DBUILD_SHARED_LIBS=ON
  -DCMAKE_UNITY_BUILD=ON
  -DBDMVNAVIGATOR_BUILD_PORT=${PORT}
  -DBDMVNAVIGATOR_BUILD_KITS=OFF
  -DBDMVNAVIGATOR_BUILD_BENCHMARKS=OFF
  -DBDMVNAVIGATOR_BUILD_DESKPLAYER=OFF
  -DBDMVNAVIGATOR_BUILD_EXAMPLES=OFF
  -DBDMVNAVIGATOR_BUILD_TESTS=OFF)
run("building" ${CMAKE_COMMAND} --build ${BUILD})
file(REMOVE_RECURSE ${PREFIX})
run("installing" ${CMAKE_COMMAND} --install ${BUILD} --prefix ${PREFIX})

# A linker finds the library by the first name, a program by the second.
set(library ${PREFIX}/${SHARED_LIBRARY})
foreach(name "" .${MAJOR_VERSION} .${VERSION})
  if(NOT EXISTS ${library}${name})
    message(FATAL_ERROR "${library}${name} is missing")
  endif()
endforeach()
execute_process(COMMAND ${READELF} -dW ${library} OUTPUT_VARIABLE dynamic)
if(NOT dynamic MATCHES "SONAME[^\n]*\\[libbdmvnavigator\\.so\\.${MAJOR_VERSION}\\]")
  message(FATAL_ERROR "another SONAME than libbdmvnavigator.so.${MAJOR_VERSION}:\n${dynamic}")
endif()

# Nothing but the platform interface and what other libraries define is left undefined. Their symbols
# have a version or begin with an underscore.
execute_process(COMMAND ${NM} -D --undefined-only ${library} OUTPUT_VARIABLE symbols)
string(REGEX MATCHALL " U [A-Za-z][^\n]*" symbols "${symbols}")
list(FILTER symbols EXCLUDE REGEX "@")
list(TRANSFORM symbols REPLACE "^ U " "")
if(INSTRUMENTED) # the runtime of a sanitizer defines functions of the system without a version
  list(FILTER symbols INCLUDE REGEX "^(Assert|KEVRO_.+|g_.+)$")
endif()
set(platform
  Assert KEVRO_Log_IsEnabled KEVRO_Log_VWrite KEVRO_Osa_TaskAtomicAdd g_u1Bduopmask)
if(NOT symbols STREQUAL platform)
  message(FATAL_ERROR "undefined: ${symbols}\nexpected: ${platform}")
endif()
