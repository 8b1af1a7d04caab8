// Hints to the compiler. Only where they were measured to pay: in what every request and every
// field passes through.
//
//   Mostly, Rarely   what a condition nearly always is, so that the usual way runs straight on
#ifndef QUORVANE_GATEWAY_CORE_BRANCH_HINTS_H_
#define QUORVANE_GATEWAY_CORE_BRANCH_HINTS_H_

constexpr bool Mostly(bool condition) {
  return __builtin_expect(condition, true);
}
constexpr bool Rarely(bool condition) {
  return __builtin_expect(condition, false);
}

#endif  // QUORVANE_GATEWAY_CORE_BRANCH_HINTS_H_
