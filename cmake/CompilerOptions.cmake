# The language, the warnings, the sanitizers and the run paths that every target shares.

set(CMAKE_CXX_STANDARD 20)
set(CMAKE_CXX_STANDARD_REQUIRED ON)
set(CMAKE_CXX_EXTENSIONS OFF)
set(CMAKE_EXPORT_COMPILE_COMMANDS ON)
if(NOT CMAKE_BUILD_TYPE AND NOT CMAKE_CONFIGURATION_TYPES)
  set(CMAKE_BUILD_TYPE RelWithDebInfo CACHE STRING "Build type" FORCE)
endif()

find_program(AMBRIX_CCACHE ccache DOC "Compiler cache, used when it is there")
mark_as_advanced(AMBRIX_CCACHE)
foreach(language C CXX)
  if(AMBRIX_CCACHE AND NOT CMAKE_${language}_COMPILER_LAUNCHER)
    set(CMAKE_${language}_COMPILER_LAUNCHER "${AMBRIX_CCACHE}")
  endif()
endforeach()

# The build tree is laid out like an installation and both use the same relative run paths, so that
# either can be moved. The libraries have a folder of their own: their names and interfaces are no
# affair of the system's. (The run paths of the build are not padded for a rewrite at installation:
# the padding would make the loader look in the current directory.)
set(CMAKE_INSTALL_LIBDIR lib)
set(CMAKE_RUNTIME_OUTPUT_DIRECTORY "${CMAKE_BINARY_DIR}/bin")
set(AMBRIX_INSTALL_LIBDIR "${CMAKE_INSTALL_LIBDIR}/ambrix")
set(CMAKE_LIBRARY_OUTPUT_DIRECTORY "${CMAKE_BINARY_DIR}/${AMBRIX_INSTALL_LIBDIR}")
set(CMAKE_ARCHIVE_OUTPUT_DIRECTORY "${CMAKE_BINARY_DIR}/lib")
set(CMAKE_BUILD_WITH_INSTALL_RPATH ON)
set(CMAKE_INSTALL_RPATH "$ORIGIN/../${AMBRIX_INSTALL_LIBDIR}")
set(CMAKE_INSTALL_RPATH_USE_LINK_PATH ON)

# What our own code is compiled with. The CDF library's sources are not ours and do not get it.
add_library(ambrix_options INTERFACE)
target_compile_options(ambrix_options INTERFACE
  -Wall -Wextra -Wpedantic -Wconversion -Wsign-conversion -Wold-style-cast
  -Wnon-virtual-dtor -Woverloaded-virtual -Wcast-align -Wcast-qual -Wundef
  -Wdouble-promotion -Wimplicit-fallthrough -Wextra-semi
  $<$<CXX_COMPILER_ID:GNU>:-Wduplicated-cond -Wduplicated-branches -Wlogical-op
    -Wsuggest-override -Wshadow=local>
  # Before GCC 13 it finds fault with the standard library's own operator+ of strings.
  $<$<AND:$<CXX_COMPILER_ID:GNU>,$<VERSION_LESS:$<CXX_COMPILER_VERSION>,13>>:-Wno-restrict>
  $<$<CXX_COMPILER_ID:Clang,AppleClang>:-Wshadow>)
if(AMBRIX_WERROR)
  target_compile_options(ambrix_options INTERFACE -Werror)
endif()

if(AMBRIX_SANITIZE)
  add_compile_options(-fsanitize=address -fno-omit-frame-pointer)
  add_link_options(-fsanitize=address,undefined)
  # For the folders that come after the CDF library; tests leave it out again.
  set(AMBRIX_CHECKS -fsanitize=undefined -fno-sanitize-recover=all)
  if(CMAKE_CXX_COMPILER_ID STREQUAL "Clang")
    list(APPEND AMBRIX_CHECKS -fsanitize=fuzzer-no-link)  # libFuzzer's eyes
  endif()
endif()

# Coverage is counted in the layers of the module only; whatever takes in their objects is linked
# for it.
add_library(ambrix_coverage INTERFACE)
if(AMBRIX_COVERAGE)
  target_compile_options(ambrix_coverage INTERFACE --coverage)
  add_link_options(--coverage)
endif()
