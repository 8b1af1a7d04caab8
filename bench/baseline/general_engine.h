// A mature general message engine as a peer: QuickFIX, which the distribution brings. It is fed the
// same fields, one message per record, and asked to parse them, no more.
#ifndef QUORVANE_BENCH_BASELINE_GENERAL_ENGINE_H_
#define QUORVANE_BENCH_BASELINE_GENERAL_ENGINE_H_

#include <cstddef>
#include <string>
#include <vector>

namespace bench {

// One message per record of `reply`. The engine's tags are numbers: a tag with letters is sent as a
// five-digit one.
std::vector<std::string> EngineMessages(const std::string& reply);

// Parses each message without a data dictionary or checks; the number of fields in their bodies.
size_t ParseByEngine(const std::vector<std::string>& messages);

}  // namespace bench

#endif  // QUORVANE_BENCH_BASELINE_GENERAL_ENGINE_H_
