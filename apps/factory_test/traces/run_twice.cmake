# Plays a trace twice: the same frames, and the same results file, byte for byte.
# cmake -DREPLAY=<program> -DAPP=<program> -DTRACE=<file> -DFOLDER=<folder> -DSIZE=<w>x<h> -P run_twice.cmake
file(MAKE_DIRECTORY "${FOLDER}")
set(other)
foreach(run first second)
  file(REMOVE "${FOLDER}/${run}.json")
  execute_process(
    COMMAND "${REPLAY}" --dir "${FOLDER}/${run}" --screen ${SIZE} ${other} "${TRACE}" -- "${APP}"
            --results "${FOLDER}/${run}.json" --shell "sleep 9" COMMAND_ERROR_IS_FATAL ANY)
  set(other --against "${FOLDER}/first")
endforeach()
file(READ "${FOLDER}/first.json" first)
file(READ "${FOLDER}/second.json" second)
if(NOT first STREQUAL second)
  message(FATAL_ERROR "the results differ:\n${first}\n${second}")
endif()
string(REGEX MATCHALL "\"verdict\": \"(PASS|FAIL)\"" verdicts "${first}")
list(LENGTH verdicts count)
if(NOT count EQUAL 19)
  message(FATAL_ERROR "${count} verdicts, 19 were given")
endif()
