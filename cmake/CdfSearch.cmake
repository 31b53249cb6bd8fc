# Looks for an installed CDF library (see FindCDF.cmake).

set(cdf_usual_places /usr/local/cdf /usr/local /opt/cdf /opt/local /opt/homebrew /usr
  /Applications/cdf)
set(cdf_what_to_do "Name a folder that holds include/cdf.h and lib/libcdf.so, libcdf.a or \
libcdf.dylib of CDF version 3; or name none, and the library is looked for and else provided.")

# Sets VARIABLE to why the header is not one of CDF version 3, or to nothing.
function(cdf_check_header header variable)
  file(STRINGS "${header}" added_by_version_3 REGEX "CDF_EPOCH16")
  set(reason "")
  if(NOT added_by_version_3)
    set(reason "${header} is not the header of CDF version 3")
  endif()
  set(${variable} "${reason}" PARENT_SCOPE)
endfunction()

# Links and runs a program that asks the library for its version: sets VERSION, or REASON.
function(cdf_check_library include library version_variable reason_variable)
  try_run(ran compiled "${CMAKE_BINARY_DIR}/cdf-check"
    "${PROJECT_SOURCE_DIR}/cmake/cdf_version.c"
    CMAKE_FLAGS "-DINCLUDE_DIRECTORIES=${include}"
    LINK_LIBRARIES "${library}" m
    COMPILE_OUTPUT_VARIABLE build_output
    RUN_OUTPUT_VARIABLE version)
  set(reason "")
  if(NOT compiled)
    set(reason "a program with ${include}/cdf.h and ${library} does not link:\n${build_output}")
  elseif(NOT ran EQUAL 0)
    set(reason "a program linked with ${library} does not run")
  endif()
  unset(ran CACHE)
  unset(compiled CACHE)
  set(${version_variable} "${version}" PARENT_SCOPE)
  set(${reason_variable} "${reason}" PARENT_SCOPE)
endfunction()

# Looks in the given folders: sets cdf_reason to nothing and the results, or to what is wrong.
function(cdf_look includes libraries)
  list(TRANSFORM libraries APPEND 64 OUTPUT_VARIABLE libraries64)
  unset(CDF_HEADER_DIR CACHE)
  unset(CDF_LIBRARY_FILE CACHE)
  find_path(CDF_HEADER_DIR cdf.h PATHS ${includes} NO_DEFAULT_PATH)
  find_library(CDF_LIBRARY_FILE cdf PATHS ${libraries} ${libraries64} NO_DEFAULT_PATH)
  mark_as_advanced(CDF_HEADER_DIR CDF_LIBRARY_FILE)
  if(NOT CDF_HEADER_DIR)
    set(reason "cdf.h was not found in: ${includes}")
  elseif(NOT CDF_LIBRARY_FILE)
    set(reason "libcdf (.so, .a, .dylib) was not found in: ${libraries}")
  else()
    cdf_check_header("${CDF_HEADER_DIR}/cdf.h" reason)
  endif()
  if(NOT reason)
    cdf_check_library("${CDF_HEADER_DIR}" "${CDF_LIBRARY_FILE}" version reason)
  endif()
  set(cdf_reason "${reason}" PARENT_SCOPE)
  set(cdf_version "${version}" PARENT_SCOPE)
endfunction()

# As cdf_look for one installation that the user named; stops when it is not one.
macro(cdf_look_named name includes libraries)
  cdf_look("${includes}" "${libraries}")
  if(cdf_reason)
    message(FATAL_ERROR "${name} does not lead to a usable CDF library: ${cdf_reason}\n"
      "${cdf_what_to_do}")
  endif()
endmacro()

macro(cdf_search)
  if(CDF_ROOT)
    cdf_look_named("CDF_ROOT (${CDF_ROOT})" "${CDF_ROOT}/include" "${CDF_ROOT}/lib")
  elseif("$ENV{CDF_ROOT}$ENV{CDF_BASE}" MATCHES ".")
    set(name CDF_ROOT)
    if("$ENV{CDF_ROOT}" STREQUAL "")
      set(name CDF_BASE)
    endif()
    set(base "$ENV{${name}}")
    cdf_look_named("${name} (${base}, environment)" "${base}/include" "${base}/lib")
  elseif("$ENV{CDF_INC}" MATCHES "." AND "$ENV{CDF_LIB}" MATCHES ".")
    cdf_look_named("CDF_INC and CDF_LIB (environment)" "$ENV{CDF_INC}" "$ENV{CDF_LIB}")
  else()
    list(TRANSFORM cdf_usual_places APPEND /include OUTPUT_VARIABLE includes)
    list(TRANSFORM cdf_usual_places APPEND /include/cdf OUTPUT_VARIABLE subfolders)
    list(TRANSFORM cdf_usual_places APPEND /lib OUTPUT_VARIABLE libraries)
    if(CMAKE_LIBRARY_ARCHITECTURE)
      list(APPEND libraries "/usr/lib/${CMAKE_LIBRARY_ARCHITECTURE}")
    endif()
    cdf_look("${includes};${subfolders}" "${libraries}")
  endif()
  if(NOT cdf_reason)
    set(cdf_found TRUE)
    set(cdf_include "${CDF_HEADER_DIR}")
    set(cdf_place "${CDF_LIBRARY_FILE}")
    cdf_import_found()
  endif()
endmacro()

# Sets cdf_link to a target for the library that was found, and cdf_samples.
macro(cdf_import_found)
  file(REMOVE "${CMAKE_BINARY_DIR}/lib/libcdf.so")  # one provided earlier would be loaded instead
  set(cdf_kind SHARED)
  if(CDF_LIBRARY_FILE MATCHES "\\.a$")
    set(cdf_kind STATIC)
  endif()
  add_library(cdf_installed ${cdf_kind} IMPORTED GLOBAL)
  set_target_properties(cdf_installed PROPERTIES IMPORTED_LOCATION "${CDF_LIBRARY_FILE}")
  if(cdf_kind STREQUAL "SHARED")
    # Several of its releases carry no SONAME; their path would then be recorded instead.
    set_target_properties(cdf_installed PROPERTIES IMPORTED_NO_SONAME ON)
  endif()
  set(cdf_link cdf_installed m)
  get_filename_component(cdf_base "${CDF_HEADER_DIR}" DIRECTORY)
  set(cdf_samples "")
  if(EXISTS "${cdf_base}/samples/example1.cdf")
    set(cdf_samples "${cdf_base}/samples")
  endif()
endmacro()
