# 32-bit x86, whose programs this machine runs.
set(BRIMOL_ARCHITECTURE i386)
set(BRIMOL_TRIPLE i386-linux-gnu)
set(BRIMOL_LOADER /lib/ld-linux.so.2)
set(CMAKE_SYSTEM_PROCESSOR i686)
include("${CMAKE_CURRENT_LIST_DIR}/foreign.cmake")
