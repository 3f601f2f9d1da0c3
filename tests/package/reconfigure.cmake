# Configures the project SOURCE in BUILD with the kits, then without them and whatever uses them.
file(REMOVE_RECURSE ${BUILD})
foreach(kits ON OFF)
  execute_process(
    COMMAND ${CMAKE_COMMAND} -S ${SOURCE} -B ${BUILD} -G "${GENERATOR}" ${OPTIONS}
      -DBDMVNAVIGATOR_BUILD_KITS=${kits}
      -DBDMVNAVIGATOR_BUILD_BENCHMARKS=OFF
      -DBDMVNAVIGATOR_BUILD_DESKPLAYER=OFF
      -DBDMVNAVIGATOR_BUILD_EXAMPLES=OFF
      -DBDMVNAVIGATOR_BUILD_TESTS=OFF
    RESULT_VARIABLE status OUTPUT_VARIABLE output ERROR_VARIABLE output)
  if(status)
    message(FATAL_ERROR "configuring with BDMVNAVIGATOR_BUILD_KITS=${kits} failed:\n${output}")
  endif()
endforeach()
