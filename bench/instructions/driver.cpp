// instruction_driver: makes one call of each main case through the library's entry points. Run by
// callgrind, it leaves one profile per case; what a profile tells of libquorvane.so itself is the
// same on every machine, whatever C library the calls go on to.
#include <valgrind/callgrind.h>

#include <cstdio>
#include <cstdlib>
#include <string>
#include <string_view>
#include <vector>

#include "tests/support/bare_host.h"
#include "tests/support/call_table.h"
#include "tests/support/sample_replies.h"
#include "tests/support/surroundings.h"

namespace {

using gateway_tests::Export;

// An argument list as text: numbers for i, b and c, anything for S, the status left out.
struct Case {
  std::string_view operation;
  std::vector<const char*> arguments;
};

const char* const kSession[] = {"0", "0", "7", "A1B2C3D4E5F60718", "192.168.100.123"};

// clang-format off
const Case kRequests[] = {
    {"AuthEncode", {"9A00", "A123456789&1234567", "s3cretpw"}},
    {"ChangePasswordEncode", {"9A00", "A123456789&1234567", "s3cretpw", "n3wsecret"}},
    {"GetCertEncode2", {"-----BEGIN CERTIFICATE REQUEST-----MIICijCCAXICAQAwRTELMAkGA1UEBhMCVFcx"}},
    {"SubmitOrderEncode", {"9A00", "A123456789&1234567", "s3cretpw", "2330", "1130115",
                           "2", "1000", "58550", "66", "48", "0", "0", "0", "1"}},
    {"SubmitOrderEncode1", {"9A00", "A123456789&1234567", "s3cretpw", "2330", "1130115",
                            "2", "1000", "58550", "66", "48", "0", "0", "0", "1"}},
    {"ChangeOrderEncode", {"9A00", "A123456789&1234567", "s3cretpw", "2330", "1130115",
                           "20240115-100123&A0012345", "2", "1000", "58550", "66", "48", "0", "0",
                           "0", "1"}},
    {"QueryOrderEncode", {"9A00", "A123456789&1234567", "s3cretpw", "1130115", "0"}},
    {"FutSubmitOrderEncode", {"9A00", "A123456789&1234567", "s3cretpw", "20240115-100123&A0012345",
                              "1130115", "TXO", "TXO", "202402", "202403", "17000", "17500", "C",
                              "P", "1", "3", "0", "73", "48", "82", "32", "66", "83", "3", "0",
                              "1234500"}},
    {"FutQueryReplyEncode", {"9A00", "A123456789&1234567", "s3cretpw", "1130101", "1130115"}},
};
// clang-format on

constexpr std::string_view kAnswers[] = {
    "SubmitOrderDecode",
    "FutSubmitOrderDecode",
    "GetCertDecode",
    "QueryFinanceDecode",
};

void Run(std::string_view operation, const std::vector<const char*>& arguments,
         const std::string& label) {
  const Export* const row = gateway_tests::FindExport(operation);
  void* const entryPoint = row->EntryPoint();
  if (entryPoint == nullptr || arguments.size() + row->HasStatus() != row->shape.size()) {
    fprintf(stderr, "no such call: %s\n", label.c_str());
    exit(2);
  }
  jint status = 0;
  std::vector<jvalue> values(arguments.size() + 1);
  for (size_t i = 0; i < arguments.size(); ++i) {
    const int number = atoi(arguments[i]);
    switch (row->shape[i]) {
      case 'S':
        values[i].l = gateway_tests::BareText(arguments[i]);
        break;
      case 'b':
        values[i].b = static_cast<jbyte>(number);
        break;
      case 'c':
        values[i].c = static_cast<jchar>(number);
        break;
      default:
        values[i].i = number;
    }
  }
  values.back().l = gateway_tests::BareStatus(&status);
  JNIEnv* const env = gateway_tests::BareHost();

  CALLGRIND_ZERO_STATS;
  row->call(entryPoint, env, values.data());
  CALLGRIND_DUMP_STATS_AT(label.c_str());
  if (status != 1) {
    fprintf(stderr, "%s failed\n", label.c_str());
    exit(2);
  }
}

void RunReply(std::string_view decoder, const std::string& reply, const std::string& label) {
  std::vector<const char*> arguments = {reply.c_str()};
  if (decoder == "QueryOrderDecode") arguments.insert(arguments.begin(), "0");
  Run(decoder, arguments, label);
}

}  // namespace

int main() {
  gateway_tests::EnterMarketTimeZone();
  gateway_tests::SetClock("2024-01-15 13:45:21");
  for (const Case& request : kRequests) {
    std::vector<const char*> arguments(std::begin(kSession), std::end(kSession));
    arguments.insert(arguments.end(), request.arguments.begin(), request.arguments.end());
    Run(request.operation, arguments, std::string(request.operation));
  }
  for (std::string_view answer : kAnswers) {
    RunReply(answer, gateway_tests::SampleAnswer(answer), std::string(answer));
  }
  for (std::string_view list : gateway_tests::kListDecoders) {
    for (size_t records : {size_t{1}, size_t{1000}}) {
      const std::string label = std::string(list) + "/" + std::to_string(records);
      RunReply(list, gateway_tests::SampleList(list, records), label);
    }
  }
}
