// The gateway's answers to orders: one line of fields, no records.
//
//   reply    |39=mark|K1=text|19=letter|46=number|44=date
//
// An order went through when the mark is a single blank and the letter is one that takes it; else
// the text says why not.
#ifndef QUORVANE_GATEWAY_ORDERS_ORDER_ANSWER_H_
#define QUORVANE_GATEWAY_ORDERS_ORDER_ANSWER_H_

#include <string_view>

// Tag 39 of an order that is not refused.
inline constexpr std::string_view kNoRefusalMark = " ";

// The letter of tag 19, its first character, that takes an order; NUL when it takes none.
inline char AcceptanceLetter(std::string_view acceptance) {
  constexpr std::string_view kLetters = "STXY";
  const bool taken = !acceptance.empty() && kLetters.find(acceptance[0]) != std::string_view::npos;
  return taken ? acceptance[0] : '\0';
}

// How the result shows such a letter.
inline char AcceptedFlag(char letter) {
  return letter == 'X' ? '0' : '1';
}

#endif  // QUORVANE_GATEWAY_ORDERS_ORDER_ANSWER_H_
