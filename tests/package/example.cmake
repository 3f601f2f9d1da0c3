# Builds the project SOURCE in BUILD against the package in PREFIX and runs its test, which passes;
# then with the bug that the project contains, which makes the test fail with an output that matches
# CAUGHT.

include(${CMAKE_CURRENT_LIST_DIR}/run.cmake)

# build(BUG): BUG is ON or OFF.
function(build bug)
  run("configuring with SEED_BUG=${bug}"
    ${CMAKE_COMMAND} -S ${SOURCE} -B ${BUILD} -G "${GENERATOR}"
    ${OPTIONS} -DCMAKE_PREFIX_PATH=${PREFIX} -DSEED_BUG=${bug})
  run("building with SEED_BUG=${bug}" ${CMAKE_COMMAND} --build ${BUILD})
endfunction()

set(test ${CMAKE_CTEST_COMMAND} --output-on-failure --no-tests=error)

build(OFF)
execute_process(COMMAND ${test} WORKING_DIRECTORY ${BUILD}
  RESULT_VARIABLE status OUTPUT_VARIABLE output ERROR_VARIABLE output)
if(status)
  message(FATAL_ERROR "the test fails without the bug:\n${output}")
endif()

build(ON)
execute_process(COMMAND ${test} WORKING_DIRECTORY ${BUILD}
  RESULT_VARIABLE status OUTPUT_VARIABLE output ERROR_VARIABLE output)
if(NOT status OR NOT output MATCHES "${CAUGHT}")
  message(FATAL_ERROR "expected the test to fail with '${CAUGHT}', but it ended with ${status}:\n${output}")
endif()
