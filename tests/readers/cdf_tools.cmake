# The CDF distribution's own tools, built from its sources where these are at hand: provisioned for
# a build with -DAMBRIX_CDF=source, or fetched with -DAMBRIX_CDF_TOOLS=ON. They are linked with
# CDF 3.6.3 whatever library the module uses.
#
# Sets cdf_tools_folder to where they will be, or to nothing: also in builds with sanitizers, which would
# only find what is not ours.

option(AMBRIX_CDF_TOOLS "Fetch the sources of the CDF distribution's tools for the tests" OFF)

set(cdf_tools_folder "")
set(cdf_tools_source "${AMBRIX_CDF_CACHE}/cdf-3.6.3-source")
if(AMBRIX_CDF_TOOLS AND NOT AMBRIX_SANITIZE AND NOT EXISTS "${cdf_tools_source}")
  include(CdfProvision)
  cdf_fetch(source cdf-3.6.3-source)
endif()
if(AMBRIX_SANITIZE OR NOT EXISTS "${cdf_tools_source}/src/tools")
  return()
endif()

if(NOT TARGET cdf363)
  set(CDF_SOURCE_DIR "${cdf_tools_source}")
  add_subdirectory("${PROJECT_SOURCE_DIR}/cmake/cdf363" "${CMAKE_CURRENT_BINARY_DIR}/cdf363")
endif()
set(cdf_tools_folder "${CMAKE_CURRENT_BINARY_DIR}/cdf-tools")
set(src "${cdf_tools_source}/src/tools")
foreach(tool cdfvalidate cdfdump cdfcvt)
  add_executable(${tool} "${src}/${tool}.c" "${src}/toolbox1.c" "${src}/toolbox3.c")
  set_target_properties(${tool} PROPERTIES
    C_STANDARD 99
    C_EXTENSIONS ON
    UNITY_BUILD OFF
    EXPORT_COMPILE_COMMANDS OFF
    RUNTIME_OUTPUT_DIRECTORY "${cdf_tools_folder}")
  target_compile_options(${tool} PRIVATE -w)
  target_link_libraries(${tool} PRIVATE cdf363)
endforeach()
