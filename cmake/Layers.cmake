# Layers: folders that see only the folders they may.
#
# Includes are written from the repository's root ("gateway/errors.h"), but the root itself is on no
# layer's include path. Each folder instead has an include root of its own, a folder holding nothing
# but links into it, so that including from a folder that was not granted fails to compile. A room is
# a folder within another that is a layer of its own.

# ambrix_root(NAME [ROOMS room...]): an INTERFACE target that grants includes from folder NAME, its
# rooms apart.
function(ambrix_root name)
  cmake_parse_arguments(PARSE_ARGV 1 arg "" "" "ROOMS")
  string(REPLACE / _ target "${name}")
  set(root "${CMAKE_BINARY_DIR}/layers/${target}")
  file(REMOVE_RECURSE "${root}")
  file(MAKE_DIRECTORY "${root}/${name}")
  file(GLOB contents CONFIGURE_DEPENDS RELATIVE "${PROJECT_SOURCE_DIR}/${name}"
    "${PROJECT_SOURCE_DIR}/${name}/*")
  list(REMOVE_ITEM contents ${arg_ROOMS} CMakeLists.txt)
  foreach(content ${contents})
    file(CREATE_LINK "${PROJECT_SOURCE_DIR}/${name}/${content}" "${root}/${name}/${content}" SYMBOLIC)
  endforeach()
  add_library(ambrix_root_${target} INTERFACE)
  target_include_directories(ambrix_root_${target} INTERFACE "${root}")
endfunction()

# ambrix_layer(NAME [SEES folder...] [ROOMS room...]): object library ambrix_NAME from the sources of
# this folder and of the folders in it, its rooms apart. It sees itself, the folders named, the CDF
# header and Boost; it links with nothing.
function(ambrix_layer name)
  cmake_parse_arguments(PARSE_ARGV 1 arg "" "" "SEES;ROOMS")
  ambrix_root(${name} ROOMS ${arg_ROOMS})
  string(REPLACE / _ target "${name}")
  file(GLOB sources CONFIGURE_DEPENDS
    "${CMAKE_CURRENT_SOURCE_DIR}/*.cc" "${CMAKE_CURRENT_SOURCE_DIR}/*/*.cc")
  foreach(room ${arg_ROOMS})
    list(FILTER sources EXCLUDE REGEX "/${room}/[^/]*$")
  endforeach()
  if(NOT sources)
    return()  # a folder of headers only
  endif()
  add_library(ambrix_${target} OBJECT ${sources})
  set_target_properties(ambrix_${target} PROPERTIES
    LINKER_LANGUAGE CXX
    POSITION_INDEPENDENT_CODE ON
    CXX_VISIBILITY_PRESET hidden
    VISIBILITY_INLINES_HIDDEN ON)
  list(TRANSFORM arg_SEES PREPEND ambrix_root_ OUTPUT_VARIABLE seen)
  target_link_libraries(ambrix_${target} PRIVATE
    ambrix_options ambrix_coverage ambrix_root_${target} ${seen} CDF::headers Boost::headers)
  set_property(GLOBAL APPEND PROPERTY AMBRIX_LAYERS ${target})
endfunction()
