# The binary interface's version, which is the libraries' SONAME: docs/compatibility.md says what it
# promises. Before version 1.0 it changes with the second number of the version.
if(PROJECT_VERSION_MAJOR EQUAL 0)
  set(BRIMOL_INTERFACE_VERSION "0.${PROJECT_VERSION_MINOR}")
else()
  set(BRIMOL_INTERFACE_VERSION "${PROJECT_VERSION_MAJOR}")
endif()

# brimol_shared_library(<target> <component> <map> [<where>]): what the shared libraries have in common.
# Users link brimol3_widget::<component>, be it built or installed. The linker's map <map> names what the
# library exports. <where>: as for brimol_install_library.
function(brimol_shared_library target component map)
  add_library(brimol3_widget::${component} ALIAS ${target})
  set(map "${CMAKE_CURRENT_SOURCE_DIR}/${map}")
  set_target_properties(
    ${target}
    PROPERTIES VERSION "${PROJECT_VERSION}"
               SOVERSION "${BRIMOL_INTERFACE_VERSION}"
               EXPORT_NAME ${component}
               LINK_DEPENDS "${map}")
  target_include_directories(${target} PUBLIC "$<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}/include>")
  target_compile_features(${target} PUBLIC cxx_std_20)
  target_link_options(${target} PRIVATE "LINKER:--version-script=${map}")
  brimol_install_library(${target} ${component} ${ARGN})
endfunction()
