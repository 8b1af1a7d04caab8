// The gateway object of futures and options.
#ifndef QUORVANE_GATEWAY_FUTURES_GATEWAY_FUT_H_
#define QUORVANE_GATEWAY_FUTURES_GATEWAY_FUT_H_

#include <cstddef>
#include <cstdint>
#include <string_view>

#include "gateway/core/gateway_pub.h"

struct FuturesOrder;

// Lives, answers and fails as its base does. In every encoder `branch`, `identity` and `password`
// are the header's (see initQueryHead and initOrderHead).
class CGatewayFut : public CGatewayPub {
 public:
  static constexpr size_t kBodySize = 1024;  // of an order's own tags, with terminator

  CGatewayFut();
  ~CGatewayFut() override;

  // Build the request of an order on one leg (a futures contract, an option) or two (a futures
  // spread, a combination of two options). They differ in the header and in the signature payload
  // at the end: joined by '_', or by ',' in tag PL for SubmitOrderEncode1. The status is -1 when
  // the header fails (its message alone), when a needed leg text is empty or the kind unknown (the
  // message behind the header), or when the request does not fit.
  //
  //   orderReference       of the order to change or cancel: two values joined by '&'
  //   orderDate            a date such as 1130115, or empty; sent by SubmitOrderEncode alone
  //   commodity..callPut   of the legs; strike and call/put are empty for futures
  //   handlingFlag         0 to 255, sent as tag N6
  //   orderKind            1 futures, 2 option, 3 option combination, 4 futures spread
  //   priceType            0 to 255; 1 and 3 are at the market, whatever the price
  //   function             'I' new, 'C' change of quantity, 'A' change of price, else cancel
  //   flagW3               sent as tag W3 of a new order
  //   timeInForce          'I' immediate or cancel, 'F' fill or kill, else rest of day
  //   side1, side2         'B' or 'S'
  //   quantity             lots
  //   price                with four implied decimals
  using OrderEncoder = char*(const char* branch, const char* identity, const char* password,
                             const char* orderReference, const char* orderDate,
                             const char* commodity1, const char* commodity2, const char* month1,
                             const char* month2, const char* strike1, const char* strike2,
                             const char* callPut1, const char* callPut2, char handlingFlag,
                             char orderKind, char priceType, char function, char flagW3,
                             char timeInForce, char unreadLetter, char side1, char side2,
                             int quantity, int unreadNumber, int price, int* status);
  OrderEncoder SubmitOrderEncode, SubmitOrderEncode1;

  // The gateway's answer to an order: "number@date@@accepted@flag@!", or its message with status
  // -1. An empty reply means that the order is under way: status 1.
  char* SubmitOrderDecode(const char* reply, int* status);

  // The orders of `date` (1130115 or 20240115, not empty); `selection` is sent as tag 28. The list
  // is "count!records"; the status of each order is derived, the gateway does not send it.
  char* QueryOrderEncode(const char* branch, const char* identity, const char* password,
                         const char* date, int selection, int* status);
  char* QueryOrderDecode(const char* reply, int* status);

  // The fills from one Republic of China date to another; "count!records".
  char* QueryReplyEncode(const char* branch, const char* identity, const char* password,
                         const char* startDate, const char* endDate, int* status);
  char* QueryReplyDecode(const char* reply, int* status);

  // The open positions: "<5>!count!futures<6>!count!options".
  char* QueryInventoryEncode(const char* branch, const char* identity, const char* password,
                             int* status);
  char* QueryInventoryDecode(const char* reply, int* status);

  // The margin account, one record of 30 fields. Of `queryType`, 0 is sent as 3, 3 and 4 as 5, any
  // other as it is.
  char* QueryFinanceEncode(const char* branch, const char* identity, const char* password,
                           int queryType, int* status);
  char* QueryFinanceDecode(const char* reply, int* status);

  // What the class offers beside its operations, none of which calls it.

  // Append the order's own tags to the terminated text in `body`, a buffer of kBodySize bytes, and
  // turn the order key in `signature`, a buffer of kBufferSize bytes, into the signature payload.
  // Return 1, or 0 with the parameter error alone in `body`.
  using RecordEncoder = int(const char* orderReference, const char* orderDate,
                            const char* commodity1, const char* commodity2, const char* month1,
                            const char* month2, const char* strike1, const char* strike2,
                            const char* callPut1, const char* callPut2, char handlingFlag,
                            char orderKind, char priceType, char function, char flagW3,
                            char timeInForce, char unreadLetter, char side1, char side2,
                            int quantity, int unreadNumber, int price, char* body, char* signature);
  RecordEncoder EncodeSubmitOrderRecord, EncodeSubmitOrderRecord1;

  // Writes what a reply or record says of itself into `out` (cleared before, `size` bytes): "0000",
  // "5001" (no data), else "message(code)"; nothing when that does not fit. Returns `out`.
  char* GetResultCode(const char* reply, char* out, int size);

  // As AppendData, on the two texts of the position list.
  void AppendFutData(const char* data, int length, bool reset);
  void AppendOptData(const char* data, int length, bool reset);

  char m_szSignature[kBufferSize];  // an order's key, then its signature payload
  int32_t m_nFutDataSize;           // capacity of m_pFutData
  int32_t m_nFutDataLen;            // characters in m_pFutData
  char* m_pFutData;                 // futures positions; released with array delete
  int32_t m_nOptDataSize;
  int32_t m_nOptDataLen;
  char* m_pOptData;  // option positions; released with array delete

 private:
  HeapText FutText() { return {m_pFutData, m_nFutDataSize, m_nFutDataLen}; }
  HeapText OptText() { return {m_pOptData, m_nOptDataSize, m_nOptDataLen}; }

  char* EncodeOrder(OrderHead head, const OrderOrigin& origin, const FuturesOrder& order,
                    int* status);

  // Ends the decoder of a list of fills or positions that the reply as a whole refuses, in
  // GetResultCode's words and with status -1, or that has nothing to show, which the user interface
  // knows as `noData`. Null when there are records to read.
  char* AnswerWithoutRecords(std::string_view reply, std::string_view noData, int* status);
};

#endif  // QUORVANE_GATEWAY_FUTURES_GATEWAY_FUT_H_
