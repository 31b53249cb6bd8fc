# The module from its layers: as objects for the tests and other hosts, and as a loadable library.

get_property(layers GLOBAL PROPERTY AMBRIX_LAYERS)

# Every object of the module, and neither the CDF library nor a host: whoever links this adds both
# (ambrix_cdf or a stand-in for it; ambrix_embedded or another host).
add_library(ambrix_module_objects INTERFACE)
foreach(layer ${layers})
  target_sources(ambrix_module_objects INTERFACE $<TARGET_OBJECTS:ambrix_${layer}>)
endforeach()

add_library(ambrix_module MODULE)
set_target_properties(ambrix_module PROPERTIES
  PREFIX ""
  LINKER_LANGUAGE CXX
  INSTALL_RPATH "$ORIGIN"  # the CDF library
  LINK_DEPENDS "${PROJECT_SOURCE_DIR}/cmake/module.map")
target_link_libraries(ambrix_module PRIVATE ambrix_module_objects ambrix_cdf)
target_link_options(ambrix_module PRIVATE
  "LINKER:--version-script=${PROJECT_SOURCE_DIR}/cmake/module.map")

install(TARGETS ambrix_module LIBRARY DESTINATION "${AMBRIX_INSTALL_LIBDIR}")
