# Five interface targets, so that every flag stands in one place:
#   quorvane_flags          whatever is compiled here, the tests included
#   quorvane_library_flags  what goes into libquorvane.so
#   quorvane_test_flags     what goes into test programs
#   quorvane_hardening      how a shared library is linked
#   quorvane_link_flags     how libquorvane.so is linked

set(instrumented OFF)
if(QUORVANE_SANITIZE OR QUORVANE_COVERAGE)
  set(instrumented ON)
endif()

add_library(quorvane_flags INTERFACE)
target_compile_options(quorvane_flags INTERFACE
    -Wall -Wextra -Wpedantic -Wformat=2 -Wconversion -Wsign-conversion -Wshadow
    $<$<BOOL:${QUORVANE_WERROR}>:-Werror>
    # Where it was built leaves no trace, so that two builds are equal to the byte.
    -ffile-prefix-map=${PROJECT_SOURCE_DIR}=. -ffile-prefix-map=${PROJECT_BINARY_DIR}=.
    $<$<CXX_COMPILER_ID:Clang>:-ffile-compilation-dir=.>
    $<$<BOOL:${ANDROID_NDK}>:-ffile-prefix-map=${ANDROID_NDK}=ndk>)
if(QUORVANE_SANITIZE)
  # The vptr check needs the type information that the library is built without.
  set(sanitize -fsanitize=${QUORVANE_SANITIZE} -fno-sanitize=vptr -fno-sanitize-recover=all
               -fno-omit-frame-pointer)
  target_compile_options(quorvane_flags INTERFACE ${sanitize})
  target_link_options(quorvane_flags INTERFACE ${sanitize})
endif()
if(QUORVANE_COVERAGE)
  target_compile_options(quorvane_flags INTERFACE --coverage -fprofile-update=atomic)
  target_link_options(quorvane_flags INTERFACE --coverage)
endif()

# All is bound when the library is loaded, so that calls of the C library need no stubs (-fno-plt).
add_library(quorvane_library_flags INTERFACE)
target_compile_options(quorvane_library_flags INTERFACE
    -fno-exceptions -fno-rtti -ffunction-sections -fdata-sections -fstack-protector-strong -fno-plt
    $<$<AND:$<CONFIG:Release>,$<NOT:$<BOOL:${instrumented}>>>:-U_FORTIFY_SOURCE -D_FORTIFY_SOURCE=2>)
if(QUORVANE_SANITIZE)
  target_compile_options(quorvane_library_flags INTERFACE -O1)
endif()

# Landing pads and signed return addresses, each where the machine has them; no frame that skips the
# page behind the stack. scripts/check-binary looks what became of it.
include(CheckCXXCompilerFlag)
foreach(flag -fcf-protection=full -mbranch-protection=standard -fstack-clash-protection)
  string(MAKE_C_IDENTIFIER "takes${flag}" takes)
  check_cxx_compiler_flag("-Werror ${flag}" ${takes})
  if(${takes})
    target_compile_options(quorvane_library_flags INTERFACE ${flag})
  endif()
endforeach()

# Test programs take far longer to optimize than they run; fuzz targets run for hours.
add_library(quorvane_test_flags INTERFACE)
target_link_libraries(quorvane_test_flags INTERFACE quorvane_flags)
target_compile_options(quorvane_test_flags INTERFACE $<IF:$<BOOL:${QUORVANE_FUZZ}>,-O2,-O0>)

# Both page sizes are set: the first aligns the segments, the second the end of the read-only data
# after relocation, and a device with 16 KiB pages needs the two alike.
add_library(quorvane_hardening INTERFACE)
target_link_options(quorvane_hardening INTERFACE
    LINKER:-z,relro LINKER:-z,now LINKER:-z,noexecstack
    LINKER:-z,max-page-size=16384 LINKER:-z,common-page-size=16384
    LINKER:--build-id=sha1 LINKER:--gc-sections LINKER:--as-needed)

# The library needs the C library and liblog, no C++ runtime: it uses no exceptions, no type
# information and no containers, and gateway/core/heap.cpp brings the forms of new and delete
# that it calls. The runtimes of sanitizers and coverage want their usual surroundings back.
add_library(quorvane_link_flags INTERFACE)
target_link_libraries(quorvane_link_flags INTERFACE quorvane_hardening)
if(NOT instrumented)
  target_link_options(quorvane_link_flags INTERFACE LINKER:--no-undefined)
  if(CMAKE_CXX_COMPILER_ID MATCHES "Clang")
    target_link_options(quorvane_link_flags INTERFACE -nostdlib++)
    if(ANDROID_ABI STREQUAL x86)
      # Older lld defines the table only when it is named before link-time optimisation names it.
      target_link_options(quorvane_link_flags INTERFACE LINKER:--undefined=_GLOBAL_OFFSET_TABLE_)
    endif()
  else()
    target_link_options(quorvane_link_flags INTERFACE -nodefaultlibs)
    target_link_libraries(quorvane_link_flags INTERFACE c gcc)
  endif()
endif()
