# Plays a run twice: the same frames, and the same results, byte for byte; then resumes it.
# cmake -DREPLAY=<program> -DAPP=<program> -DTRACE=<file> -DFOLDER=<folder> -DDEVICE=<name>
#       [-DSCREEN=<width>x<height>] -P run_twice.cmake
set(size)
if(SCREEN)
  set(size --screen ${SCREEN})
endif()
file(MAKE_DIRECTORY "${FOLDER}")
set(other)
foreach(run first second)
  file(REMOVE "${FOLDER}/${run}.json")
  execute_process(
    COMMAND "${REPLAY}" --dir "${FOLDER}/${run}" --device ${DEVICE} ${size} --exit-code 3 ${other} "${TRACE}" -- "${APP}"
            --results "${FOLDER}/${run}.json" --junit "${FOLDER}/${run}.xml" --shell "sleep 9" COMMAND_ERROR_IS_FATAL ANY)
  set(other --against "${FOLDER}/first")
endforeach()
foreach(kind json xml)
  file(READ "${FOLDER}/first.${kind}" first)
  file(READ "${FOLDER}/second.${kind}" second)
  if(NOT first STREQUAL second)
    message(FATAL_ERROR "the results differ:\n${first}\n${second}")
  endif()
endforeach()
file(READ "${FOLDER}/first.json" results)
string(REGEX MATCHALL "\"verdict\": \"(PASS|FAIL)\"" verdicts "${results}")
list(LENGTH verdicts count)
file(STRINGS "${TRACE}" pages REGEX "^include keys/")
list(LENGTH pages given)
math(EXPR given "${given} - 1") # one page is left without
if(NOT count EQUAL given)
  message(FATAL_ERROR "${count} verdicts, ${given} were given")
endif()
get_filename_component(traces "${TRACE}" DIRECTORY)
execute_process(
  COMMAND "${REPLAY}" --dir "${FOLDER}/resumed" --device ${DEVICE} ${size} --exit-code 3 "${traces}/resumed.trace" -- "${APP}"
          --results "${FOLDER}/first.json" COMMAND_ERROR_IS_FATAL ANY)
