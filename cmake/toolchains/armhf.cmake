# 32-bit Arm, under emulation.
set(BRIMOL_ARCHITECTURE armhf)
set(BRIMOL_TRIPLE arm-linux-gnueabihf)
set(BRIMOL_EMULATOR qemu-arm)
set(CMAKE_SYSTEM_PROCESSOR armv7l)
include("${CMAKE_CURRENT_LIST_DIR}/foreign.cmake")
