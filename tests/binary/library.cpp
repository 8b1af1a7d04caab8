// A library with one sound export; each macro adds one fault that scripts/check-binary must see.
#include <stdlib.h>

#define EXPORT extern "C" __attribute__((visibility("default")))

EXPORT void* Java_com_brindlex_kernel_quorvane_gatewayjni_AuthDecode() {
  static void* (*volatile allocate)(size_t) = malloc;  // one relocated word
  return allocate(1);
}

#ifdef FAULT_EXPORT
EXPORT void helper() {}
#endif
#ifdef FAULT_NATIVE
EXPORT void Java_com_brindlex_kernel_quorvane_gatewayjni_Unknown() {}
#endif
#ifdef FAULT_CALL
EXPORT int Java_com_brindlex_kernel_quorvane_gatewayjni_AuthEncode() {
  return system("");
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
