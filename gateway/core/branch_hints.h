// Hints to the compiler. Only where they were measured to pay: in what every request and every
// field passes through.
//
//   Mostly, Rarely   what a condition nearly always is, so that the usual way runs straight on
//   ALWAYS_INLINE    becomes part of each caller
//   IN_ONE_PIECE     takes in all that it calls
#ifndef QUORVANE_GATEWAY_CORE_BRANCH_HINTS_H_
#define QUORVANE_GATEWAY_CORE_BRANCH_HINTS_H_

// A build without inlining, as for a debugger, keeps its functions apart.
#ifndef __NO_INLINE__
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
