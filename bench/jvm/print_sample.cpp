// print_sample DECODER RECORDS: prints the sample reply that the native benchmarks decode.
#include <cstdio>
#include <cstdlib>
#include <string>

#include "tests/support/sample_replies.h"

int main(int argc, char** argv) {
  if (argc != 3) return 2;
  const std::string reply = gateway_tests::SampleReply(argv[1], static_cast<size_t>(atoi(argv[2])));
  fwrite(reply.data(), 1, reply.size(), stdout);
  return reply.empty() ? 1 : 0;
}
