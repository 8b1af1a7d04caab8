// Unwind tables stay in the library, so that a tombstone shows its frames. On 32-bit ARM they name
// a routine that a thrown exception would call, and whoever defines it brings the whole unwinder
// along, with what that needs. Nothing is thrown through here, and what reads tombstones calls no
// such routine: these end an unwinding as the failure that it would be.
#ifdef __arm__
namespace {

constexpr int kFailure = 9;  // _URC_FAILURE

}  // namespace

#define ROUTINE extern "C" __attribute__((visibility("hidden"), used)) int

ROUTINE __aeabi_unwind_cpp_pr0() {
  return kFailure;
}

ROUTINE __aeabi_unwind_cpp_pr1() {
  return kFailure;
}

ROUTINE __aeabi_unwind_cpp_pr2() {
  return kFailure;
}
#endif
