# The output of the desk player that the README shows is what the desk player prints; "..." replaces
# omitted lines.
execute_process(
  COMMAND ${DESKPLAYER} ${SOURCE}/examples/discs/sample
    --session ${SOURCE}/examples/sessions/evening.session
  OUTPUT_VARIABLE output ERROR_QUIET RESULT_VARIABLE result)
if(result)
  message(FATAL_ERROR "the desk player exited with ${result}")
endif()

file(STRINGS ${SOURCE}/README.md lines REGEX "^([0-9:.]+  [A-Z]|\\.\\.\\.$)")
list(LENGTH lines count)
if(count LESS 10)
  message(FATAL_ERROR "the README shows no output")
endif()
foreach(line IN LISTS lines)
  if(line STREQUAL "...")
    continue()
  endif()
  string(FIND "${output}" "${line}\n" at)
  if(at EQUAL -1)
    message(FATAL_ERROR "the README shows a line that the desk player does not print there: ${line}")
  endif()
  string(SUBSTRING "${output}" ${at} -1 output)
endforeach()
