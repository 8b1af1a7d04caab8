# What the NDK's toolchain file is for the build, made of the distribution's compilers: clang, lld,
# Android's jni.h, and the C library of a plain Linux in place of Android's. It takes the variables
# that the presets give to the NDK's own, and refuses to go on with others.
set(ANDROID TRUE)
set(ANDROID_NDK ${CMAKE_CURRENT_LIST_DIR}/../..)
set(CMAKE_TRY_COMPILE_PLATFORM_VARIABLES ANDROID_ABI ANDROID_PLATFORM ANDROID_STL)
if(NOT ANDROID_PLATFORM STREQUAL android-21 OR NOT ANDROID_STL STREQUAL c++_static)
  message(FATAL_ERROR "ANDROID_PLATFORM '${ANDROID_PLATFORM}', ANDROID_STL '${ANDROID_STL}'")
endif()

if(ANDROID_ABI STREQUAL arm64-v8a)
  set(target aarch64-linux-gnu)
elseif(ANDROID_ABI STREQUAL armeabi-v7a)
  set(target arm-linux-gnueabihf)
elseif(ANDROID_ABI STREQUAL x86_64)
  set(target x86_64-linux-gnu)
elseif(ANDROID_ABI STREQUAL x86)
  set(target i686-linux-gnu)
else()
  message(FATAL_ERROR "ANDROID_ABI '${ANDROID_ABI}'")
endif()

set(CMAKE_SYSTEM_NAME Linux)
set(CMAKE_CXX_COMPILER clang++)
set(CMAKE_CXX_COMPILER_TARGET ${target})
set(CMAKE_STRIP llvm-strip)
set(CMAKE_TRY_COMPILE_TARGET_TYPE STATIC_LIBRARY)
# As the NDK: tables to unwind by, the compiler's routines from an archive.
set(CMAKE_CXX_FLAGS_INIT "-funwind-tables -isystem \"${ANDROID_NDK}/sysroot/include\" \
-isystem /usr/include/android/nativehelper")
# Start files that ask for nothing, such as the NDK's, are no other than none.
set(CMAKE_SHARED_LINKER_FLAGS_INIT
    "-fuse-ld=lld -nostartfiles -static-libgcc -L\"${ANDROID_NDK}/sysroot/lib/${ANDROID_ABI}\"")
