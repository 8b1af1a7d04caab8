// What both markets share of an order: its state, the letter that takes it, its two numbers.

#include <gtest/gtest.h>

#include "gateway/orders/order_answer.h"
#include "gateway/orders/order_reference.h"
#include "gateway/orders/order_state.h"

namespace gateway_tests {
namespace {

struct StateRow {
  const char* name;
  OrderState state;
  const char* text;
};

constexpr char kSentOn[] = "委託已傳送，等待接收回報！";
constexpr char kAllCancelled[] = "全部取消";

constexpr StateRow kStates[] = {
    {"failed, whatever else", {5, 5, 5, 'F', "E", "0", kSentOn, 3}, "委託失敗"},
    {"failed is one letter", {1, 0, 0, 'R', "EE", "1", "", 0}, "委託成功"},
    {"all cancelled, says the gateway", {5, 0, 0, '\0', "", "0", kAllCancelled, 0}, "已取消"},
    {"all cancelled, says the gateway, F", {5, 5, 0, 'F', "", "0", kAllCancelled, 3}, "已取消"},
    {"almost all cancelled", {5, 0, 0, '\0', "", "0", "全部取消 ", 0}, "預約單"},
    {"sent on", {5, 5, 0, 'R', "", "", kSentOn, 0}, "正在處理"},
    {"sent on, market 3", {5, 5, 0, 'R', "", "", kSentOn, 3}, "委託收到"},
    {"sent on, market 103", {5, 5, 0, 'R', "", "", kSentOn, 103}, "委託收到"},
    {"sent on, market 4", {5, 5, 0, 'R', "", "", kSentOn, 4}, "正在處理"},
    {"almost sent on", {5, 0, 0, 'R', "", "", "委託已傳送", 3}, "委託成功"},
    {"all cancelled, F", {5, 5, 0, 'F', "", "0", "", 0}, "撮合未成交"},
    {"all cancelled, I", {5, 5, 0, 'I', "", "0", "", 0}, "撮合未成交"},
    {"all cancelled, R", {5, 5, 0, 'R', "", "0", "", 0}, "已取消"},
    {"all cancelled, no letter", {5, 5, 0, '\0', "", "0", "", 0}, "已取消"},
    {"nothing of nothing", {0, 0, 0, 'R', "", "0", "", 0}, "已取消"},
    {"untouched, waits", {5, 0, 0, 'R', "", "0", "", 0}, "預約單"},
    {"untouched", {5, 0, 0, 'R', "", "1", "", 0}, "委託成功"},
    {"untouched, no N6", {5, 0, 0, 'I', "", "", "", 0}, "委託成功"},
    {"untouched, N6 of two", {5, 0, 0, 'R', "", "00", "", 0}, "委託成功"},
    {"reduced", {5, 2, 0, 'R', "", "0", "", 0}, "已改量"},
    {"filled", {5, 0, 5, 'R', "", "0", "", 0}, "已成交"},
    {"filled, I", {5, 0, 5, 'I', "", "1", "", 0}, "已成交"},
    {"filled and cancelled, I", {5, 3, 2, 'I', "", "1", "", 0}, "撮合部份成交"},
    {"filled and cancelled, F", {5, 3, 2, 'F', "", "1", "", 0}, "部份成交，其餘已取消"},
    {"filled and cancelled, R", {5, 3, 2, 'R', "", "1", "", 0}, "部份成交，其餘已取消"},
    {"partly filled", {5, 0, 2, 'R', "", "1", "", 0}, "部份成交"},
    {"partly filled and reduced", {5, 1, 2, 'I', "", "1", "", 0}, "部份成交"},
    {"overfilled", {5, 0, 6, 'R', "", "1", "", 0}, "部份成交"},
    {"sum wraps", {INT32_MIN, INT32_MAX, 1, 'R', "", "1", "", 0}, "部份成交，其餘已取消"},
};

TEST(Orders, EveryRowOfTheStates) {
  for (const StateRow& row : kStates) EXPECT_EQ(OrderStateText(row.state), row.text) << row.name;
}

TEST(Orders, LettersThatTakeAnOrder) {
  for (const char* taken : {"S", "T", "X", "Y", "S0", "XYZ"}) {
    EXPECT_EQ(AcceptanceLetter(taken), taken[0]) << taken;
  }
  for (const char* other : {"", " ", "s", "R", "U", "Z", "0S"}) {
    EXPECT_EQ(AcceptanceLetter(other), '\0') << other;
  }
  EXPECT_EQ(AcceptedFlag('X'), '0');
  for (const char letter : {'S', 'T', 'Y'}) EXPECT_EQ(AcceptedFlag(letter), '1');
}

TEST(Orders, ReferenceIsTwoNumbersThatFit) {
  const struct {
    const char* text;
    const char* orderNumber;
    const char* gatewayNumber;
  } rows[] = {{"W1&G2", "W1", "G2"},   {"W1", "W1", ""},
              {"&G2", "", "G2"},       {"", "", ""},
              {"W1&G2&x", "W1", "G2"}, {"12345&6", "", "6"},
              {"1&23456", "1", ""},    {"1234&5678", "1234", "5678"}};
  for (const auto& row : rows) {
    const OrderReference reference(row.text, 5);
    EXPECT_EQ(reference.orderNumber, row.orderNumber) << row.text;
    EXPECT_EQ(reference.gatewayNumber, row.gatewayNumber) << row.text;
  }
}

}  // namespace
}  // namespace gateway_tests
