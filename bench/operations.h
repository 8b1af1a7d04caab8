// Every encoder and decoder as one call each: the gateway object is made, filled, asked and
// destroyed, which is what an entry point does for each order of the user.
#ifndef QUORVANE_BENCH_OPERATIONS_H_
#define QUORVANE_BENCH_OPERATIONS_H_

#include <string>
#include <string_view>

namespace bench {

// An operation by the name of its export. `result` may be null; otherwise it receives the text.
struct Encoder {
  const char* name;
  void (*run)(std::string* result);
};
struct Decoder {
  const char* name;
  void (*run)(const char* reply, std::string* result);
};

inline constexpr int kEncoders = 32;
inline constexpr int kDecoders = 27;

const Encoder (&Encoders())[kEncoders];
const Decoder (&Decoders())[kDecoders];

// The row of that name, which must exist.
const Encoder& FindEncoder(std::string_view name);
const Decoder& FindDecoder(std::string_view name);

}  // namespace bench

#endif  // QUORVANE_BENCH_OPERATIONS_H_
