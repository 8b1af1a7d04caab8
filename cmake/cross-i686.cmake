set(CMAKE_SYSTEM_PROCESSOR i686)
set(cross i686-linux-gnu)
include(${CMAKE_CURRENT_LIST_DIR}/cross.cmake)
