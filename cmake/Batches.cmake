# Compiles sources in batches, each of sources of one folder, so that the headers and templates of
# JSON, options and tests are compiled once for a batch. Names in unnamed namespaces need only differ
# within a folder, which is so in the package for Octave, too.

set(ambrix_batch_size 8)

# Assigns each source of a target to a batch.
function(ambrix_batches target)
  get_target_property(sources ${target} SOURCES)
  list(FILTER sources EXCLUDE REGEX "\\$<")
  get_target_property(base ${target} SOURCE_DIR)
  foreach(source ${sources})
    cmake_path(ABSOLUTE_PATH source BASE_DIRECTORY "${base}" NORMALIZE)
    cmake_path(GET source PARENT_PATH folder)
    cmake_path(RELATIVE_PATH folder BASE_DIRECTORY "${PROJECT_SOURCE_DIR}")
    string(MAKE_C_IDENTIFIER "${folder}" folder)
    math(EXPR number "0${count_${folder}} / ${ambrix_batch_size}" OUTPUT_FORMAT DECIMAL)
    math(EXPR count_${folder} "0${count_${folder}} + 1")
    set_property(SOURCE "${source}" TARGET_DIRECTORY ${target}
      PROPERTY UNITY_GROUP "${folder}_${number}")
  endforeach()
  set_target_properties(${target} PROPERTIES UNITY_BUILD_MODE GROUP)
endfunction()

# The same for all targets of a folder and the folders in it.
function(ambrix_batches_below folder)
  get_property(targets DIRECTORY "${folder}" PROPERTY BUILDSYSTEM_TARGETS)
  foreach(target ${targets})
    get_target_property(batched ${target} UNITY_BUILD)
    if(batched)
      ambrix_batches(${target})
    endif()
  endforeach()
  get_property(subfolders DIRECTORY "${folder}" PROPERTY SUBDIRECTORIES)
  foreach(subfolder ${subfolders})
    ambrix_batches_below("${subfolder}")
  endforeach()
endfunction()
