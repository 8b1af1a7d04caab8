# What the distribution's cross compilers have in common. They build for the machines of Android's
# ABIs, with the C library of a plain Linux: to run the tests on the word sizes of a phone, and to
# try the Android package where there is no NDK (scripts/setup cross brings them).
set(CMAKE_SYSTEM_NAME Linux)
set(CMAKE_CXX_COMPILER ${cross}-g++)
set(CMAKE_CROSSCOMPILING_EMULATOR ${emulator} -L /usr/${cross})

# Libraries and packages of the other machine only: those of this one do not link.
set(CMAKE_FIND_ROOT_PATH /usr/${cross})
set(CMAKE_FIND_ROOT_PATH_MODE_PROGRAM NEVER)
set(CMAKE_FIND_ROOT_PATH_MODE_LIBRARY ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_INCLUDE ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_PACKAGE ONLY)
