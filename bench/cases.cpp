#include "bench/cases.h"

#include <benchmark/benchmark.h>

#include <cstdio>
#include <cstdlib>
#include <string>

#include "bench/baseline/general_engine.h"
#include "bench/baseline/usual.h"
#include "bench/limits.h"
#include "bench/operations.h"
#include "bench/sample_session.h"
#include "bench/surroundings.h"
#include "tests/support/sample_replies.h"

namespace bench {
namespace {

using gateway_tests::kListDecoders;
using gateway_tests::SampleAnswer;
using gateway_tests::SampleList;

constexpr size_t kSizes[] = {1, 20, 1000, 20000};
constexpr size_t kUsual = 1000;  // records of a list where nothing else is said

constexpr char kStockBook[] = "QueryOrderDecode";
constexpr char kFuturesBook[] = "FutQueryOrderDecode";
constexpr char kNewOrder[] = "SubmitOrderEncode";
constexpr char kClock[] = "limit/clock";

std::string Sized(const std::string& name, size_t records) {
  return name + "/" + std::to_string(records);
}

// A block of malloc, as every text of the usual C way.
char* UsualOrder() {
  return usual::NewStockOrder(kStockCode, kOrderDate, 2, 1000, 58550, 'B', '0', 0, 0, 0, 1);
}

struct UsualDecoder {
  const char* name;
  char* (*run)(const char* reply);
};

constexpr UsualDecoder kUsualDecoders[] = {
    {"AuthDecode", usual::DecodeLogin},
    {kStockBook, usual::DecodeStockBook},
    {kFuturesBook, usual::DecodeFuturesBook},
};

// Compares and releases `text`.
bool Agree(const std::string& name, const std::string& expected, char* text) {
  const std::string got = text;
  free(text);
  if (got == expected) return true;
  size_t at = 0;
  while (at < got.size() && at < expected.size() && got[at] == expected[at]) ++at;
  const size_t from = at < 40 ? 0 : at - 40;
  fprintf(stderr, "%s: the usual C way differs at byte %zu:\n  library: %s\n  usual:   %s\n",
          name.c_str(), at, expected.substr(from, 80).c_str(), got.substr(from, 80).c_str());
  return false;
}

std::string Result(const Encoder& encoder) {
  std::string text;
  encoder.run(&text);
  return text;
}

// --- Bodies ---

using Bodies = std::map<std::string, Body>;

void AddEncoder(Bodies& bodies, const Encoder& encoder) {
  const std::string name = encoder.name;
  const std::string text = Result(encoder);
  bodies["encode/" + name] = MakeBody([&encoder] { encoder.run(nullptr); });
  bodies["clocked/" + name] = MakeBody([&encoder] { encoder.run(nullptr); }, Clock::kReal);
  bodies["copy/" + name] = MakeBody([text] {
    char out[4096];
    CopyBytes(text, out);
    benchmark::DoNotOptimize(out);
    benchmark::ClobberMemory();
  });
}

void AddReply(Bodies& bodies, const std::string& name, const Decoder& decoder,
              const std::string& reply) {
  bodies["decode/" + name] = MakeBody([&decoder, reply] { decoder.run(reply.c_str(), nullptr); });
  bodies["bars/" + name] = MakeBody([reply] { benchmark::DoNotOptimize(ScanBars(reply)); });
  bodies["copy/" + name] = MakeBody([reply, out = std::string(reply.size(), ' ')]() mutable {
    CopyBytes(reply, out.data());
    benchmark::ClobberMemory();
  });
}

void AddDecoder(Bodies& bodies, const Decoder& decoder) {
  const std::string name = decoder.name;
  const std::string answer = SampleAnswer(name);
  if (!answer.empty()) return AddReply(bodies, name, decoder, answer);
  for (size_t records : kSizes) {
    AddReply(bodies, Sized(name, records), decoder, SampleList(name, records));
  }
}

void AddBaselines(Bodies& bodies) {
  bodies["usual/" + std::string(kNewOrder)] = MakeBody([] {
    char* const text = UsualOrder();
    benchmark::DoNotOptimize(text);
    free(text);
  });
  for (const UsualDecoder& usual : kUsualDecoders) {
    const std::string name = Sized(usual.name, kUsual);
    const std::string reply = SampleList(usual.name, kUsual);
    bodies["usual/" + name] = MakeBody([&usual, reply] {
      char* const text = usual.run(reply.c_str());
      benchmark::DoNotOptimize(text);
      free(text);
    });
    const std::vector<std::string> messages = EngineMessages(reply);
    bodies["engine/" + name] =
        MakeBody([messages] { benchmark::DoNotOptimize(ParseByEngine(messages)); });
  }
}

// --- Replies that nobody sends without ill will ---

std::string Repeat(const std::string& piece, size_t size) {
  std::string text;
  while (text.size() < size) text += piece;
  return text;
}

struct Hostile {
  const char* name;
  std::string reply;
};

// Each about as long as a stock order book of the usual number of records.
std::vector<Hostile> HostileReplies() {
  const std::string book = SampleList(kStockBook, kUsual);
  const size_t size = book.size();
  const std::string first = SampleList(kStockBook, 1);
  const std::string record = first.substr(0, first.find("|00=1|67=900001"));
  return {
      {"bars alone", std::string(size, '|')},
      {"ends without a begin", record + Repeat("|01=", size)},
      {"begins without an end", record + Repeat("|00=", size)},
      {"begins, then as many ends", record + Repeat("|00=", size / 2) + Repeat("|01=", size / 2)},
      {"empty records", record + Repeat("|00=|01=", size)},
      {"one endless value", record + "|00=1|67=000002|68=0000|K1=" + std::string(size, 'x')},
      {"one record of one tag over and over", "|00=1|68=0000" + Repeat("|46=7", size) + "|01="},
      {"unknown tags", "|00=1|68=0000" + Repeat("|Zz=7", size) + "|01="},
      {"fields without a tag", "|00=1|68=0000" + Repeat("|7", size) + "|01="},
      {"brackets alone", record + std::string(size, '[')},
      {"error markers cut short", record + Repeat("[GATEWAY]erro", size)},
      {"blanks alone", record + std::string(size, ' ')},
  };
}

void AddHostile(Bodies& bodies) {
  const Decoder& decoder = FindDecoder(kStockBook);
  for (const Hostile& hostile : HostileReplies()) {
    AddReply(bodies, std::string("hostile ") + hostile.name, decoder, hostile.reply);
  }
}

// --- Ratios ---

void AddStockTargets(std::vector<Ratio>& ratios) {
  const char* const group = "Stock order book, 1,000 records";
  const std::string at1000 = Sized("decode/" + std::string(kStockBook), 1000);
  const std::string at20 = Sized("decode/" + std::string(kStockBook), 20);
  const std::string at20000 = Sized("decode/" + std::string(kStockBook), 20000);
  ratios.push_back({group, "decode / bar scan", at1000, "bars/QueryOrderDecode/1000", 1, 1,
                    Ratio::Sense::kAtMost, 2.0, 1.2});
  ratios.push_back({group, "usual C way / decode", "usual/QueryOrderDecode/1000", at1000, 1, 1,
                    Ratio::Sense::kAtLeast, 15, 20});
  ratios.push_back({group, "a record of 1,000 / a record of 20", at1000, at20, 1000, 20,
                    Ratio::Sense::kAtMost, 1.15, 0});
  ratios.push_back({group, "a record of 20,000 / a record of 1,000", at20000, at1000, 20000, 1000,
                    Ratio::Sense::kAtMost, 1.15, 0});
}

void AddOrderTargets(std::vector<Ratio>& ratios) {
  const char* const group = "Stock new order";
  const std::string name = kNewOrder;
  ratios.push_back({group, "encode, free clock / copy", "encode/" + name, "copy/" + name, 1, 1,
                    Ratio::Sense::kAtMost, 12, 8});
  ratios.push_back({group, "encode, real clock / time + localtime_r", "clocked/" + name, kClock, 1,
                    1, Ratio::Sense::kAtMost, 1.8, 1.5});
  ratios.push_back({group, "usual C way / encode, free clock", "usual/" + name, "encode/" + name, 1,
                    1, Ratio::Sense::kAtLeast, 15, 0});
}

void AddListTargets(std::vector<Ratio>& ratios) {
  for (std::string_view list : kListDecoders) {
    const std::string name = Sized(std::string(list), kUsual);
    if (list == kStockBook) continue;
    ratios.push_back({"Other lists, 1,000 records: decode / bar scan", std::string(list),
                      "decode/" + name, "bars/" + name, 1, 1, Ratio::Sense::kAtMost, 2.5,
                      list == kFuturesBook ? 1.6 : 0});
  }
}

void AddPeers(std::vector<Ratio>& ratios) {
  const char* const group = "Beside others, 1,000 records: time / bar scan";
  for (const char* name : {"AuthDecode", kStockBook, kFuturesBook}) {
    const std::string sized = Sized(name, kUsual);
    ratios.push_back(
        {group, std::string(name) + ": usual C way", "usual/" + sized, "bars/" + sized});
    ratios.push_back(
        {group, std::string(name) + ": QuickFIX, parse only", "engine/" + sized, "bars/" + sized});
    ratios.push_back({group, std::string(name) + ": plain copy", "copy/" + sized, "bars/" + sized});
    ratios.push_back(
        {group, std::string(name) + ": this library", "decode/" + sized, "bars/" + sized});
  }
}

void AddGrowth(std::vector<Ratio>& ratios) {
  for (std::string_view list : kListDecoders) {
    const std::string name(list);
    for (const auto& [many, few] : {std::pair(1000, 20), std::pair(20000, 1000)}) {
      ratios.push_back({"A record of many / a record of few",
                        name + ": " + std::to_string(many) + " / " + std::to_string(few),
                        Sized("decode/" + name, static_cast<size_t>(many)),
                        Sized("decode/" + name, static_cast<size_t>(few)),
                        static_cast<double>(many), static_cast<double>(few)});
    }
  }
}

void AddSmall(std::vector<Ratio>& ratios) {
  const char* const group = "Replies of one record: decode / bar scan";
  for (const Decoder& decoder : Decoders()) {
    const std::string name = decoder.name;
    const std::string sized = SampleAnswer(name).empty() ? Sized(name, 1) : name;
    ratios.push_back({group, name, "decode/" + sized, "bars/" + sized});
  }
}

void AddHostileReplies(std::vector<Ratio>& ratios) {
  for (const Hostile& hostile : HostileReplies()) {
    const double size = static_cast<double>(hostile.reply.size());
    ratios.push_back({"Hostile replies: a byte / a byte of a stock order book", hostile.name,
                      std::string("decode/hostile ") + hostile.name, "decode/QueryOrderDecode/1000",
                      size, static_cast<double>(SampleList(kStockBook, kUsual).size())});
  }
}

void AddEncoders(std::vector<Ratio>& ratios) {
  for (const Encoder& encoder : Encoders()) {
    const std::string name = encoder.name;
    ratios.push_back(
        {"Encoders, free clock: encode / copy", name, "encode/" + name, "copy/" + name});
  }
  for (const Encoder& encoder : Encoders()) {
    const std::string name = encoder.name;
    ratios.push_back(
        {"Encoders, real clock: encode / time + localtime_r", name, "clocked/" + name, kClock});
  }
}

}  // namespace

bool BaselinesAgree() {
  UseClock(Clock::kFree);
  bool agree = Agree(kNewOrder, Result(FindEncoder(kNewOrder)), UsualOrder());
  for (const UsualDecoder& usual : kUsualDecoders) {
    for (size_t records : {size_t{1}, size_t{20}, kUsual}) {
      const std::string reply = SampleList(usual.name, records);
      std::string expected;
      FindDecoder(usual.name).run(reply.c_str(), &expected);
      agree &= Agree(Sized(usual.name, records), expected, usual.run(reply.c_str()));
    }
  }
  return agree;
}

std::map<std::string, Body> AllBodies() {
  UseClock(Clock::kFree);
  Bodies bodies;
  bodies[kClock] = MakeBody(ReadRealClock, Clock::kReal);
  for (const Encoder& encoder : Encoders()) AddEncoder(bodies, encoder);
  for (const Decoder& decoder : Decoders()) AddDecoder(bodies, decoder);
  AddBaselines(bodies);
  AddHostile(bodies);
  return bodies;
}

std::vector<Ratio> AllRatios() {
  std::vector<Ratio> ratios;
  for (const auto add : {AddStockTargets, AddListTargets, AddOrderTargets, AddPeers, AddGrowth,
                         AddHostileReplies, AddSmall, AddEncoders}) {
    add(ratios);
  }
  return ratios;
}

}  // namespace bench
