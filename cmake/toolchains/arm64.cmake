# 64-bit Arm, under emulation.
set(BRIMOL_ARCHITECTURE arm64)
set(BRIMOL_TRIPLE aarch64-linux-gnu)
set(BRIMOL_EMULATOR qemu-aarch64)
set(CMAKE_SYSTEM_PROCESSOR aarch64)
include("${CMAKE_CURRENT_LIST_DIR}/foreign.cmake")
