# run(WHAT COMMAND...): stops unless the command succeeds.
function(run what)
  execute_process(COMMAND ${ARGN} RESULT_VARIABLE status OUTPUT_VARIABLE output ERROR_VARIABLE output)
  if(status)
    message(FATAL_ERROR "${what} failed: ${status}\n${output}")
  endif()
endfunction()
