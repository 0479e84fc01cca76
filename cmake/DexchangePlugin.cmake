# dexchange_add_plugin(<name> SOURCES ...) builds lib<name>.so against the library and installs it
# into the plug-in folder that GetLibraryFunction searches.
set(DEXCHANGE_PLUGIN_INSTALL_DIR "${CMAKE_INSTALL_LIBDIR}/dexchange/plugins")

function(dexchange_add_plugin name)
  cmake_parse_arguments(PLUGIN "NO_INSTALL" "OUTPUT_DIRECTORY" "SOURCES" ${ARGN})
  add_library(${name} MODULE ${PLUGIN_SOURCES})
  target_link_libraries(${name} PRIVATE dexchange dexchange_flags)
  set_target_properties(${name} PROPERTIES
    PREFIX "lib"
    CXX_VISIBILITY_PRESET hidden
    VISIBILITY_INLINES_HIDDEN ON)
  if(PLUGIN_OUTPUT_DIRECTORY)
    set_target_properties(${name} PROPERTIES LIBRARY_OUTPUT_DIRECTORY "${PLUGIN_OUTPUT_DIRECTORY}")
  else()
    set_target_properties(${name} PROPERTIES LIBRARY_OUTPUT_DIRECTORY "${CMAKE_BINARY_DIR}/lib/plugins")
  endif()
  if(NOT PLUGIN_NO_INSTALL)
    install(TARGETS ${name} LIBRARY DESTINATION "${DEXCHANGE_PLUGIN_INSTALL_DIR}")
  endif()
endfunction()
