# Another architecture's build, by Clang, with the packages that scripts/foreign_root.sh unpacked.
# Included by <architecture>.cmake, which sets BRIMOL_ARCHITECTURE, BRIMOL_TRIPLE, and either BRIMOL_EMULATOR or,
# where this machine runs the programs itself, BRIMOL_LOADER.

# CMake reads from the compiler which folders it searches by itself. With a base_dir ccache would make their
# names relative.
set(ENV{CCACHE_DISABLE} 1)
cmake_path(SET root NORMALIZE "${CMAKE_CURRENT_LIST_DIR}/../../build/roots/${BRIMOL_ARCHITECTURE}")
set(CMAKE_SYSTEM_NAME Linux)
set(CMAKE_SYSROOT "${root}")
set(CMAKE_LIBRARY_ARCHITECTURE ${BRIMOL_TRIPLE})
foreach(language IN ITEMS C CXX)
  set(CMAKE_${language}_COMPILER_TARGET ${BRIMOL_TRIPLE})
endforeach()
set(CMAKE_C_COMPILER clang)
set(CMAKE_CXX_COMPILER clang++)
set(CMAKE_FIND_ROOT_PATH_MODE_PROGRAM NEVER)
set(CMAKE_FIND_ROOT_PATH_MODE_LIBRARY ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_INCLUDE ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_PACKAGE ONLY)
set(CMAKE_EXE_LINKER_FLAGS_INIT "-fuse-ld=lld")
set(CMAKE_SHARED_LINKER_FLAGS_INIT "-fuse-ld=lld")
# The libraries of the folder, not those of this machine.
string(CONCAT libraries "${root}/lib/${BRIMOL_TRIPLE}:${root}/usr/lib/${BRIMOL_TRIPLE}:"
                        "${root}/usr/lib/${BRIMOL_TRIPLE}/android:${root}/usr/lib/p7zip")
if(BRIMOL_EMULATOR)
  # By their own names: a 32-bit loader asks whether a folder exists by a call that -L does not change.
  set(CMAKE_CROSSCOMPILING_EMULATOR ${BRIMOL_EMULATOR} -L "${root}" -E "LD_LIBRARY_PATH=${libraries}")
else()
  set(CMAKE_CROSSCOMPILING_EMULATOR "${root}${BRIMOL_LOADER}" --library-path "${libraries}")
endif()
