# Where things are installed, and in which of three components: `runtime` (the libraries),
# `development` (what building against them needs) and `tools` (the programs). Without BRIMOL_INSTALL
# the functions do nothing.

if(BRIMOL_INSTALL)
  # Debian's folder for libraries, under every prefix: its loader and its pkg-config look there.
  if(PROJECT_IS_TOP_LEVEL AND EXISTS /etc/debian_version AND CMAKE_LIBRARY_ARCHITECTURE)
    set(CMAKE_INSTALL_LIBDIR "lib/${CMAKE_LIBRARY_ARCHITECTURE}" CACHE PATH "Object code libraries")
  endif()
  include(GNUInstallDirs)
  set(BRIMOL_INSTALL_CMAKEDIR "${CMAKE_INSTALL_LIBDIR}/cmake/brimol3_widget")
endif()

# brimol_install_library(<target> <component> [<where>]): the library, and a CMake file that imports it
# as brimol3_widget::<component>. What programs of users run with is installed as `runtime`, unless
# <where> says otherwise.
function(brimol_install_library target component)
  if(NOT BRIMOL_INSTALL)
    return()
  endif()
  set(where runtime)
  if(ARGN)
    set(where ${ARGN})
  endif()
  install(
    TARGETS ${target}
    EXPORT brimol3_widget-${component}
    LIBRARY DESTINATION "${CMAKE_INSTALL_LIBDIR}"
            COMPONENT ${where}
            NAMELINK_COMPONENT development
    INCLUDES DESTINATION "${CMAKE_INSTALL_INCLUDEDIR}")
  install(
    EXPORT brimol3_widget-${component}
    NAMESPACE brimol3_widget::
    DESTINATION "${BRIMOL_INSTALL_CMAKEDIR}"
    COMPONENT development)
endfunction()

# brimol_install_program(<target>): the program, its manual page packaging/<target>.1, and the
# completion of its options. It finds the libraries wherever the whole is moved to.
function(brimol_install_program target)
  if(NOT BRIMOL_INSTALL)
    return()
  endif()
  get_target_property(linked ${target} LINK_LIBRARIES)
  if(brimol_pc IN_LIST linked)
    file(RELATIVE_PATH libraries "${CMAKE_INSTALL_FULL_BINDIR}" "${CMAKE_INSTALL_FULL_LIBDIR}")
    set_property(TARGET ${target} APPEND PROPERTY INSTALL_RPATH "$ORIGIN/${libraries}")
  endif()
  install(TARGETS ${target} RUNTIME DESTINATION "${CMAKE_INSTALL_BINDIR}" COMPONENT tools)
  brimol_install_manual(${target}.1 tools)
  install(
    FILES "${PROJECT_SOURCE_DIR}/packaging/completion.bash"
    DESTINATION "${CMAKE_INSTALL_DATADIR}/bash-completion/completions"
    RENAME ${target}
    COMPONENT tools)
endfunction()

# brimol_install_manual(<page> <component>): the manual page packaging/<page>, compressed.
function(brimol_install_manual page component)
  find_program(BRIMOL_GZIP gzip REQUIRED)
  cmake_path(GET page EXTENSION LAST_ONLY section)
  string(SUBSTRING "${section}" 1 -1 section)
  set(source "${PROJECT_SOURCE_DIR}/packaging/${page}")
  set(compressed "${PROJECT_BINARY_DIR}/packaging/${page}.gz")
  set_property(DIRECTORY APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS "${source}")
  file(MAKE_DIRECTORY "${PROJECT_BINARY_DIR}/packaging")
  execute_process(COMMAND "${BRIMOL_GZIP}" -9n INPUT_FILE "${source}" OUTPUT_FILE "${compressed}"
                  COMMAND_ERROR_IS_FATAL ANY)
  install(FILES "${compressed}" DESTINATION "${CMAKE_INSTALL_MANDIR}/man${section}"
          COMPONENT ${component})
endfunction()
