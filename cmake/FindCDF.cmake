# Finds the CDF library (version 3, C interface), or provides it.
#
# Looked for in this order; a place that was named must hold it, else configuration stops:
#   1. -DCDF_ROOT=... or the environment variable CDF_ROOT: a folder with include/ and lib/
#   2. the environment variables CDF_BASE, or CDF_INC and CDF_LIB, as the official distribution's
#      definition files set them
#   3. the system's usual places
#   4. provisioned: 3.9.1 on Linux x86-64, otherwise 3.6.3 built from source
# AMBRIX_CDF=provision skips 1 to 3; AMBRIX_CDF=source does too, and builds 3.6.3.
#
# Targets: CDF::headers (the header only) and CDF::cdf (header and library).
# Variables: CDF_VERSION, CDF_SAMPLES_DIR (the distribution's sample files; empty if not known),
# CDF_IS_SHARED.

include("${CMAKE_CURRENT_LIST_DIR}/CdfSearch.cmake")
include("${CMAKE_CURRENT_LIST_DIR}/CdfProvision.cmake")

set(CDF_ROOT "" CACHE PATH "Folder of a CDF installation: include/cdf.h and lib/libcdf.*")
set(AMBRIX_CDF_CACHE "${PROJECT_SOURCE_DIR}/build/cdf" CACHE PATH "Where CDF is provisioned")
mark_as_advanced(AMBRIX_CDF_CACHE)

if(NOT AMBRIX_CDF MATCHES "^(auto|provision|source)$")
  message(FATAL_ERROR "AMBRIX_CDF is '${AMBRIX_CDF}'; it may be auto, provision or source.")
endif()

set(cdf_found FALSE)
if(AMBRIX_CDF STREQUAL "auto")
  cdf_search()
endif()
if(NOT cdf_found)
  cdf_provision()
endif()

add_library(CDF::headers INTERFACE IMPORTED GLOBAL)
target_include_directories(CDF::headers SYSTEM INTERFACE "${cdf_include}")
add_library(CDF::cdf INTERFACE IMPORTED GLOBAL)
target_link_libraries(CDF::cdf INTERFACE CDF::headers ${cdf_link})
set(CDF_SAMPLES_DIR "${cdf_samples}" CACHE PATH "Sample files of the CDF distribution" FORCE)
set(CDF_VERSION "${cdf_version}" CACHE STRING "Version of the CDF library" FORCE)
mark_as_advanced(CDF_SAMPLES_DIR CDF_VERSION)
list(GET cdf_link 0 cdf_target)
get_target_property(cdf_type ${cdf_target} TYPE)
set(CDF_IS_SHARED FALSE)
if(cdf_type STREQUAL "SHARED_LIBRARY")
  set(CDF_IS_SHARED TRUE)
endif()
set(CDF_FOUND TRUE)
message(STATUS "CDF ${CDF_VERSION}: ${cdf_place}")
