# Builds the library of SOURCE in BUILD with a compiler that refuses what old ones lack. Its assertions
# name their files as ever.
file(REMOVE_RECURSE ${BUILD})
set(wrapper ${BUILD}/compiler/c++)
file(WRITE ${wrapper} "#!/bin/sh
for argument; do
  case $argument in
  -fmacro-prefix-map* | -fdebug-prefix-map* | -fno-semantic-interposition)
    echo \"c++: error: unrecognized command line option '$argument'\" >&2
    exit 1 ;;
  esac
done
exec '${COMPILER}' \"$@\"
")
execute_process(COMMAND chmod +x ${wrapper})

# Without the flags of the build: a sanitizer adds paths, as debug information does.
list(APPEND OPTIONS
  -DCMAKE_CXX_COMPILER=${wrapper} -DCMAKE_BUILD_TYPE=None -DCMAKE_C_FLAGS= -DCMAKE_CXX_FLAGS=
  -DBDMVNAVIGATOR_WARNINGS_AS_ERRORS=ON
  -DBDMVNAVIGATOR_BUILD_PORT=OFF
  -DBDMVNAVIGATOR_BUILD_KITS=OFF
  -DBDMVNAVIGATOR_BUILD_BENCHMARKS=OFF
  -DBDMVNAVIGATOR_BUILD_DESKPLAYER=OFF
  -DBDMVNAVIGATOR_BUILD_EXAMPLES=OFF
  -DBDMVNAVIGATOR_BUILD_TESTS=OFF)
foreach(step "-S;${SOURCE};-B;${BUILD};-G;${GENERATOR};${OPTIONS}" "--build;${BUILD}")
  execute_process(COMMAND ${CMAKE_COMMAND} ${step}
    RESULT_VARIABLE status OUTPUT_VARIABLE output ERROR_VARIABLE output)
  if(status)
    message(FATAL_ERROR "failed: ${step}\n${output}")
  endif()
endforeach()

file(STRINGS ${BUILD}/libbdmvnavigator.a files REGEX "[a-z]/[a-z]+\\.cpp")
list(SORT files)
set(expected
  bd/threadmutex.cpp bdmv/bdmvnavigator/navigatorevent.cpp bdmv/database/uomasktable.cpp)
if(NOT files STREQUAL expected)
  message(FATAL_ERROR "the archive names the files ${files}\nexpected: ${expected}")
endif()
