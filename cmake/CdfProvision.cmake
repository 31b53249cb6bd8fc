# Provides the CDF library when none is installed (see FindCDF.cmake).

# Fetches part of it (source or library) into AMBRIX_CDF_CACHE unless it is there already.
function(cdf_fetch part folder)
  if(EXISTS "${AMBRIX_CDF_CACHE}/${folder}" AND EXISTS "${AMBRIX_CDF_CACHE}/samples")
    return()
  endif()
  find_program(AMBRIX_PYTHON3 python3)
  mark_as_advanced(AMBRIX_PYTHON3)
  set(reason "python3 was not found.")
  if(AMBRIX_PYTHON3)
    message(STATUS "CDF: not installed here; fetching it (${part})")
    execute_process(
      COMMAND "${AMBRIX_PYTHON3}" "${PROJECT_SOURCE_DIR}/cmake/provision/provision_cdf.py"
        "${AMBRIX_CDF_CACHE}" ${part}
      RESULT_VARIABLE status OUTPUT_QUIET ERROR_VARIABLE reason)
    if(status EQUAL 0)
      return()
    endif()
  endif()
  message(FATAL_ERROR "The CDF library could not be fetched from the Python package index.\n"
    "${reason}\n"
    "What to do: run script/bootstrap and be online for the first build; or install the CDF "
    "library yourself and configure with -DCDF_ROOT=FOLDER, where FOLDER holds include/cdf.h and "
    "lib/libcdf.*")
endfunction()

# 3.9.1, copied into the build tree beside the programs so that the tree can be moved.
macro(cdf_provision_library)
  cdf_fetch(library cdf-3.9.1)
  set(cdf_place "${AMBRIX_CDF_CACHE}/cdf-3.9.1")
  set(cdf_include "${cdf_place}/include")
  set(cdf_samples "${cdf_place}/samples")
  set(cdf_version 3.9.1)
  file(COPY "${cdf_place}/lib/libcdf.so" DESTINATION "${CMAKE_LIBRARY_OUTPUT_DIRECTORY}")
  add_library(cdf_shared SHARED IMPORTED GLOBAL)
  set_target_properties(cdf_shared PROPERTIES
    IMPORTED_LOCATION "${CMAKE_LIBRARY_OUTPUT_DIRECTORY}/libcdf.so"
    IMPORTED_NO_SONAME ON)  # else its path at build time would be recorded
  set(cdf_link cdf_shared)
  # Beside the module, where no other program takes it for the system's own.
  install(PROGRAMS "${cdf_place}/lib/libcdf.so" DESTINATION "${AMBRIX_INSTALL_LIBDIR}")
endmacro()

macro(cdf_provision_source)
  cdf_fetch(source cdf-3.6.3-source)
  set(cdf_place "${AMBRIX_CDF_CACHE}/cdf-3.6.3-source")
  set(cdf_include "${cdf_place}/src/include")
  set(cdf_samples "${cdf_place}/samples")
  set(cdf_version 3.6.3)
  set(CDF_SOURCE_DIR "${cdf_place}")
  add_subdirectory("${PROJECT_SOURCE_DIR}/cmake/cdf363" "${CMAKE_BINARY_DIR}/cdf363")
  set(cdf_link cdf363)
endmacro()

# Sets cdf_include, cdf_link, cdf_samples, cdf_version and cdf_place.
macro(cdf_provision)
  if(AMBRIX_CDF STREQUAL "source" OR NOT CMAKE_SYSTEM_NAME STREQUAL "Linux"
      OR NOT CMAKE_SYSTEM_PROCESSOR MATCHES "^(x86_64|amd64|AMD64)$")
    cdf_provision_source()
  else()
    cdf_provision_library()
  endif()
  install(FILES "${cdf_place}/CDF_copyright.txt" DESTINATION "${CMAKE_INSTALL_DOCDIR}")
endmacro()
