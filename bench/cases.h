// What is measured, and which ratios are told of it.
#ifndef QUORVANE_BENCH_CASES_H_
#define QUORVANE_BENCH_CASES_H_

#include <map>
#include <string>
#include <vector>

#include "bench/pairs.h"
#include "bench/ratio_table.h"

namespace bench {

// Whether the usual C way answers what the library answers, byte for byte; says where it does not.
bool BaselinesAgree();

// Everything that can be measured, by name: "encode/AuthEncode" with a free clock, "clocked/..."
// with the real one, "copy/..." of its bytes; "decode/QueryOrderDecode/1000", "bars/..." of the
// same reply; "usual/...", "engine/..."; "limit/clock".
std::map<std::string, Body> AllBodies();

// The ratios to tell, those with a target first.
std::vector<Ratio> AllRatios();

}  // namespace bench

#endif  // QUORVANE_BENCH_CASES_H_
