# With BRIMOL_BATCHES the sources of a target are compiled several at a time: a header that all of them
# include is read once. What a source forgets to include stays hidden then, and names of one file hide
# those of another: other builds look for that.

# brimol_targets_below(<folder> <variable>): the targets of the folder and those below it.
function(brimol_targets_below folder variable)
  get_directory_property(targets DIRECTORY "${folder}" BUILDSYSTEM_TARGETS)
  get_directory_property(folders DIRECTORY "${folder}" SUBDIRECTORIES)
  foreach(below IN LISTS folders)
    brimol_targets_below("${below}" more)
    list(APPEND targets ${more})
  endforeach()
  set(${variable} ${targets} PARENT_SCOPE)
endfunction()

# brimol_batch_sources(): called last, for all targets of the project.
function(brimol_batch_sources)
  find_program(BRIMOL_PYTHON python3 REQUIRED)
  brimol_targets_below("${PROJECT_SOURCE_DIR}" targets)
  set(lines "")
  foreach(target IN LISTS targets)
    get_target_property(sources ${target} SOURCES)
    get_target_property(folder ${target} SOURCE_DIR)
    set(line ${target})
    foreach(source IN LISTS sources)
      cmake_path(ABSOLUTE_PATH source BASE_DIRECTORY "${folder}" NORMALIZE)
      if(source MATCHES "\\.cpp$" AND EXISTS "${source}") # neither C nor what the build makes
        list(APPEND line "${source}")
      endif()
    endforeach()
    string(APPEND lines "${line}\n")
    set_target_properties(${target} PROPERTIES UNITY_BUILD ON UNITY_BUILD_MODE GROUP)
  endforeach()
  file(WRITE "${PROJECT_BINARY_DIR}/batches.txt" "${lines}")
  execute_process(
    COMMAND "${BRIMOL_PYTHON}" "${PROJECT_SOURCE_DIR}/scripts/batches.py"
    INPUT_FILE "${PROJECT_BINARY_DIR}/batches.txt"
    OUTPUT_FILE "${PROJECT_BINARY_DIR}/batches.cmake" COMMAND_ERROR_IS_FATAL ANY)
  include("${PROJECT_BINARY_DIR}/batches.cmake")
endfunction()
