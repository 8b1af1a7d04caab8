// A library with one sound export; each macro adds one fault that scripts/check-binary must see.
#include <stdlib.h>
#include <string.h>

#define EXPORT extern "C" __attribute__((visibility("default")))
#ifndef FAULT_PAD
#define NO_PAD
#elif defined __aarch64__
#define NO_PAD __attribute__((target("branch-protection=none")))
#else
#define NO_PAD __attribute__((nocf_check))
#endif

EXPORT NO_PAD void* Java_com_brindlex_kernel_quorvane_gatewayjni_AuthDecode() {
  static void* (*volatile allocate)(size_t) = malloc;  // one relocated word
  return allocate(1);
}

// A buffer that may overflow, as far as the compiler sees: a stack protector, a fortified call.
EXPORT int Java_com_brindlex_kernel_quorvane_gatewayjni_AuthEncode(const char* text, size_t size) {
  char copy[16];
  memcpy(copy, text, size);
  return copy[0];
}

#ifdef FAULT_EXPORT
EXPORT void helper() {}
#endif
#ifdef FAULT_NATIVE
EXPORT void Java_com_brindlex_kernel_quorvane_gatewayjni_Unknown() {}
#endif
#ifdef FAULT_CALL
EXPORT int Java_com_brindlex_kernel_quorvane_gatewayjni_PaymentDecode() {
  return system("");
}
#endif
#ifdef FAULT_LOG
extern "C" int __android_log_write(int priority, const char* tag, const char* text);
EXPORT int Java_com_brindlex_kernel_quorvane_gatewayjni_PaymentDecode() {
  return __android_log_write(3, "", "");
}
#endif
#ifdef FAULT_TEXTREL
asm(".text\n.dc.a Java_com_brindlex_kernel_quorvane_gatewayjni_AuthDecode\n");
#endif
#ifdef FAULT_WRITABLE_CODE
asm(".section .mixed,\"awx\"\n.byte 0\n.text\n");
#endif
#ifdef FAULT_RELRO
// Two more pages of 4 KiB with nothing but addresses.
#define EIGHT(x) x, x, x, x, x, x, x, x
extern "C"
    __attribute__((used)) void* (*const addresses[1024])(size_t) = {EIGHT(EIGHT(EIGHT(malloc)))};
#endif
#ifdef FAULT_PATH
extern "C" __attribute__((used)) const char path[] = FAULT_PATH;
#endif
