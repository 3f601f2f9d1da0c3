# The installed program finds its page relative to itself.
file(REMOVE_RECURSE ${FOLDER})
file(COPY ${PREFIX}/bin/bdmv-deskplayer DESTINATION ${FOLDER}/bin)
set(page ${FOLDER}/share/bdmvnavigator/timeline.html)

function(run_program)
  execute_process(
    COMMAND ${EMULATOR} ${FOLDER}/bin/bdmv-deskplayer ${DISC} --only FirstPictureDelivered
      --format html
    OUTPUT_VARIABLE output ERROR_VARIABLE errors RESULT_VARIABLE status)
  set(output "${output}" PARENT_SCOPE)
  set(errors "${errors}" PARENT_SCOPE)
  set(status "${status}" PARENT_SCOPE)
endfunction()

run_program()
set(expected "bdmv-deskplayer: ${page}: cannot open page; build it with scripts/page, or name another \
with --page\n")
if(NOT status EQUAL 2 OR NOT errors STREQUAL expected)
  message(FATAL_ERROR "without a page: status ${status}, ${errors}")
endif()

file(WRITE ${page} "head\n<!--recordings-->\ntail\n")
run_program()
if(NOT status EQUAL 0 OR NOT output MATCHES "^head\n<script .*FirstPicture.*</script>\ntail\n$")
  message(FATAL_ERROR "with a page: status ${status}, ${errors}${output}")
endif()

# The page itself is installed if it was built.
if(EXISTS ${BUILT_PAGE} AND NOT EXISTS ${PREFIX}/share/bdmvnavigator/timeline.html)
  message(FATAL_ERROR "the page is not installed")
endif()
