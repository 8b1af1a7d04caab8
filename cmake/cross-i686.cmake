set(CMAKE_SYSTEM_PROCESSOR i686)
set(cross i686-linux-gnu)
set(emulator qemu-i386)
include(${CMAKE_CURRENT_LIST_DIR}/cross.cmake)
