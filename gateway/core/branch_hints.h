// What a condition nearly always is, so that the usual way through the code runs straight on, and
// what becomes part of every caller. Only where it was measured to pay: in what every request and
// every field passes through.
#ifndef QUORVANE_GATEWAY_CORE_BRANCH_HINTS_H_
#define QUORVANE_GATEWAY_CORE_BRANCH_HINTS_H_

// A build for a debugger or for coverage counters keeps its functions apart.
#ifdef __OPTIMIZE__
#define ALWAYS_INLINE __attribute__((always_inline))
#define IN_ONE_PIECE __attribute__((flatten))
#else
#define ALWAYS_INLINE
#define IN_ONE_PIECE
#endif

constexpr bool Mostly(bool condition) {
  return __builtin_expect(condition, true);
}
constexpr bool Rarely(bool condition) {
  return __builtin_expect(condition, false);
}

#endif  // QUORVANE_GATEWAY_CORE_BRANCH_HINTS_H_
