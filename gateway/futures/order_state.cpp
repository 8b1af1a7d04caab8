#include "gateway/futures/order_state.h"

#include "gateway/core/decimal.h"

namespace {

// A gateway may tell with this message that it sent an order on and waits for its report.
constexpr std::string_view kSentOn = "委託已傳送，等待接收回報！";

// The markets, plain and with the futures offset, whose users see a sent order as received.
constexpr bool ShowsReceipt(int32_t market) {
  return market == 3 || market == 103;
}

struct Facts {
  const OrderState& order;
  bool immediate;  // fill or kill, immediate or cancel
  bool untouched;  // neither filled nor cancelled
  bool unfilled;
};

struct StateRow {
  bool (*holds)(const Facts& facts);
  std::string_view text;
};

// The first row that holds decides.
constexpr StateRow kStates[] = {
    {[](const Facts& f) { return f.order.failure == "E"; }, "委託失敗"},
    {[](const Facts& f) { return f.order.message == kSentOn && ShowsReceipt(f.order.market); },
     "委託收到"},
    {[](const Facts& f) { return f.order.message == kSentOn; }, "正在處理"},
    {[](const Facts& f) { return f.order.quantity == f.order.cancelled && f.immediate; },
     "撮合未成交"},
    {[](const Facts& f) { return f.order.quantity == f.order.cancelled; }, "已取消"},
    {[](const Facts& f) { return f.untouched && f.order.n6 == "0"; }, "預約單"},
    {[](const Facts& f) { return f.untouched; }, "委託成功"},
    {[](const Facts& f) { return f.unfilled; }, "已改量"},
    {[](const Facts& f) { return f.order.quantity == f.order.filled; }, "已成交"},
    {[](const Facts& f) {
       return f.order.quantity == WrapAdd(f.order.cancelled, f.order.filled) &&
              f.order.timeInForce == 'I';
     },
     "撮合部份成交"},
    {[](const Facts& f) { return f.order.quantity == WrapAdd(f.order.cancelled, f.order.filled); },
     "部份成交，其餘已取消"},
};

constexpr std::string_view kPartlyFilled = "部份成交";

}  // namespace

std::string_view OrderStateText(const OrderState& state) {
  const bool unfilled = state.filled == 0;
  const Facts facts = {state, state.timeInForce == 'F' || state.timeInForce == 'I',
                       unfilled && state.cancelled == 0, unfilled};
  for (const StateRow& row : kStates) {
    if (row.holds(facts)) return row.text;
  }
  return kPartlyFilled;
}
