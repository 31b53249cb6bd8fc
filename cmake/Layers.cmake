# Layers: folders that see only the folders they may.
#
# Includes are written from the repository's root ("gateway/errors.h"), but the root itself is on no
# layer's include path. Each folder instead has an include root of its own, a folder holding nothing
# but a link to it, so that including a folder that was not granted fails to compile.

# ambrix_root(NAME): an INTERFACE target ambrix_root_NAME that grants includes from folder NAME.
function(ambrix_root name)
  set(root "${CMAKE_BINARY_DIR}/layers/${name}")
  file(MAKE_DIRECTORY "${root}")
  file(CREATE_LINK "${PROJECT_SOURCE_DIR}/${name}" "${root}/${name}" SYMBOLIC)
  add_library(ambrix_root_${name} INTERFACE)
  target_include_directories(ambrix_root_${name} INTERFACE "${root}")
endfunction()

# ambrix_layer(NAME [SEES folder...]): object library ambrix_NAME from the sources of this folder
# and those in it. It sees itself, the folders named, the CDF header and Boost; it links with nothing.
function(ambrix_layer name)
  cmake_parse_arguments(PARSE_ARGV 1 arg "" "" "SEES")
  ambrix_root(${name})
  file(GLOB sources CONFIGURE_DEPENDS 
    "${CMAKE_CURRENT_SOURCE_DIR}/*.cc" "${CMAKE_CURRENT_SOURCE_DIR}/*/*.cc")
  if(NOT sources)
    return()  # a folder of headers only
  endif()
  add_library(ambrix_${name} OBJECT ${sources})
  set_target_properties(ambrix_${name} PROPERTIES
    LINKER_LANGUAGE CXX
    POSITION_INDEPENDENT_CODE ON
    CXX_VISIBILITY_PRESET hidden
    VISIBILITY_INLINES_HIDDEN ON)
  list(TRANSFORM arg_SEES PREPEND ambrix_root_ OUTPUT_VARIABLE seen)
  target_link_libraries(ambrix_${name} PRIVATE
    ambrix_options ambrix_coverage ambrix_root_${name} ${seen} CDF::headers Boost::headers)
  set_property(GLOBAL APPEND PROPERTY AMBRIX_LAYERS ${name})
endfunction()

# ambrix_source_sees(SOURCE folder...): grants further folders to one source file only.
function(ambrix_source_sees source)
  list(TRANSFORM ARGN PREPEND "${CMAKE_BINARY_DIR}/layers/" OUTPUT_VARIABLE roots)
  set_property(SOURCE ${source} APPEND PROPERTY INCLUDE_DIRECTORIES ${roots})
endfunction()
