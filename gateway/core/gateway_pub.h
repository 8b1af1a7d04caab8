// The gateway session object that every operation works on, and the operations of the session
// itself: login, account maintenance, certificates.
#ifndef QUORVANE_GATEWAY_CORE_GATEWAY_PUB_H_
#define QUORVANE_GATEWAY_CORE_GATEWAY_PUB_H_

#include <cstddef>
#include <cstdint>
#include <string_view>

#include "gateway/core/reply_reader.h"
#include "gateway/core/request_head.h"
#include "gateway/core/result_text.h"
#include "gateway/core/text_writer.h"

class CReplyList;

// One object lives for one call: constructed, filled with the session data, one `...Encode` or
// `...Decode`, destroyed. Every text that a method returns lies in the object and dies with it; a
// null return means that memory ran out. A null text argument is read as an empty one.
//
// Encoders return one request line; decoders return a result for the user interface. Both set
// `*status` (never null) to 1, or to -1 with a message in place of the text.
class CGatewayPub {
 public:
  static constexpr size_t kBufferSize = 4096;  // of a request or short result, with terminator

  CGatewayPub();
  virtual ~CGatewayPub();
  CGatewayPub(const CGatewayPub&) = delete;
  CGatewayPub& operator=(const CGatewayPub&) = delete;

  // The device's serial number: at most 20 characters are kept, and a full field has no terminator,
  // so that the address follows it in a header. Null clears the field.
  void setSerialNumber(const char* serial);

  // The device's address in text form: at most 64 characters are kept. Null clears the field.
  void setLocalIP(const char* ip);

  // Splits an identity field at its first '&'. A part of 1 to size - 1 characters is copied with a
  // terminator; any other leaves its buffer (which may be null) as it was. Returns 0 when `field`
  // is null or has no '&', else 1.
  int SeparateDataFromUiField(const char* field, char* first, int firstSize, char* second,
                              int secondSize);

  // As the free function of the same name.
  void debuglog(const char* text);

  // Writes a price, an integer scaled by 10^decimals: 12345 with 2 decimals as "123.45", -150 as
  // "-1.-50", into `out` of `outSize` bytes. A text that does not fit leaves `out` empty.
  void SetPriceString(int value, int decimals, char* out, int outSize);

  // Login and the list of the user's accounts.
  char* AuthEncode(const char* branch, const char* identity, const char* password, int* status);
  char* AuthDecode(const char* reply, int* status);
  char* GetTotalAccountEncode(const char* branch, const char* identity, const char* password,
                              int* status);
  char* GetTotalAccountDecode(const char* reply, int* status);

  // Opening an account. `extra1` and `extra2` are not sent; `time` and `item` are codes 0 to 255,
  // sent unsigned. The result of an accepted request is empty.
  char* OpenAccountEncode(const char* extra1, const char* identity, const char* extra2,
                          const char* name, const char* address, const char* tel, char time,
                          char item, int* status);
  char* OpenAccountDecode(const char* reply, int* status);

  // Changing the trading password. The result of an accepted request is empty.
  char* ChangePasswordEncode(const char* branch, const char* identity, const char* password,
                             const char* newPassword, int* status);
  char* ChangePasswordDecode(const char* reply, int* status);

  // The balance of the linked bank account: "1!@@@@balance@!", empty and with status 1 also where
  // the gateway refused to tell.
  char* QueryBankRemainEncode(const char* branch, const char* identity, const char* password,
                              int* status);
  char* QueryBankRemainDecode(const char* reply, int* status);

  // The trading certificate. `certMsg` is the application's own text, sent in Base64; an empty one,
  // and one that does not fit a request, fail with a message that names the operation. `birth` is
  // sent as it is.
  char* ApplyCertEncode(const char* branch, const char* identity, const char* password,
                        const char* birth, const char* certMsg, int* status);
  char* ReNewCertEncode(const char* branch, const char* identity, const char* password,
                        const char* birth, const char* certMsg, int* status);
  char* RevokeCertEncode(const char* branch, const char* identity, const char* password,
                         const char* birth, const char* certMsg, int* status);
  char* GetCertEncode(const char* certMsg, int* status);
  char* GetCertEncode2(const char* certMsg, int* status);
  char* GetCertStatusEncode(const char* certMsg, int* status);
  char* InstallCertOKEncode(const char* certMsg, int* status);
  char* OpenCertEncode(const char* certMsg, int* status);

  // As the others, for a message of any length.
  char* RegisterCertEncode(const char* certMsg, int* status);

  // The gateway's text as it came, or "[CERT]code text" with status -1.
  char* ApplyCertDecode(const char* reply, int* status);
  char* ReNewCertDecode(const char* reply, int* status);
  char* RevokeCertDecode(const char* reply, int* status);
  char* GetCertDecode(const char* reply, int* status);
  char* GetCertStatusDecode(const char* reply, int* status);
  char* InstallCertOKDecode(const char* reply, int* status);
  char* OpenCertDecode(const char* reply, int* status);
  char* RegisterCertDecode(const char* reply, int* status);

  // What the class offers beside its operations, none of which calls it: headers, tokenizers, dates
  // and prices in the caller's buffers, by the rules that the operations go by.

  // Appends the header of a query to the terminated text in `out`, a buffer of kBufferSize bytes.
  // `identity` is the user's ID number and account joined by '&', in either order, one of them
  // optional. Returns 1, or 0 with a "[CLIENT]" message alone in `out`.
  int initQueryHead(const char* branch, const char* identity, const char* password, char* out);

  // Append the header of an order likewise. `function` is 'I' (new), 'D' (cancel), 'C' (change) or
  // a futures function letter; `rocDate` a date such as 1130115 or empty. `orderKey`, a buffer of
  // kBufferSize bytes, receives the text that opens the order's signature payload; it stays as it
  // was where the device's address is missing.
  int initOrderHead(char function, const char* branch, const char* identity, const char* password,
                    const char* rocDate, char* out, char* orderKey);
  int initOrderHead1(char function, const char* branch, const char* identity, const char* password,
                     const char* rocDate, char* out, char* orderKey);
  int initOrderHead2(char function, const char* branch, const char* identity, const char* password,
                     char* out);

  // Copies the value of the first field `tag` of `reply` into `out` (cleared before, `outSize`
  // bytes) if it fits with its terminator. `skipBlank` passes over empty and single-blank values
  // that a '|' closes. Returns the value's length, 0 when there is none, even if it did not fit. A
  // null reply or tag finds nothing.
  int GetToken(const char* tag, const char* reply, char* out, int outSize, bool skipBlank);

  // Copies the next record, from "|00=" to before "|01=", into `out` (cleared before) if it fits,
  // and moves `pos` behind that last bar; moves `pos` to the end when no complete record is left.
  void GetSubString(const char* reply, int& pos, char* out, int outSize);

  // Copies the text from `*cursor` to before `separator` into `out` (not cleared before; may be
  // null) if it fits and is not empty, and moves `*cursor` behind the separator, or to the end of
  // the text when there is none and `out` is not null. An empty separator is forbidden: the cursor
  // would stand still.
  void GetFieldString(char** cursor, const char* separator, char* out, int outSize);

  // Sets `*status` to -1 and `message` (cleared before) to what to tell the user when the reply is
  // a transport failure; leaves `*status` alone otherwise.
  void CheckError(const char* reply, int* status, char* message, int messageSize);

  // Puts "[GATEWAY]" before a message that names no source; `message` has room for 9 more bytes.
  void MakeErrorMsg(char* message);

  // Joins `data` to the end of the text in m_pData and adds `length`, its length, to m_nDataLen;
  // `reset` empties both first. A wrong length is booked as it is told, the text is joined whole
  // all the same. Grows by what is needed plus 4096 zeroed bytes where the text would reach the
  // capacity; when memory runs out the text stays as it was. Null, an empty text and a length of 0
  // do nothing. `data` must not lie in m_pData, which may move.
  void AppendData(const char* data, int length, bool reset);

  // Converts a date between the Republic of China calendar (year - 1911) and the western one, in
  // place and by length: 1130115 and 990115 become western, 20240115 becomes 1130115; any other
  // text, and one whose number is 0, stays. `date` has room for at least 10 bytes: a year before
  // 912 becomes a negative one of four digits.
  void TransDate(char* date);

  // 1130115 to 20240115; 0 stays 0.
  int RocDateToStandardDate(int rocDate);
  int RocDateToStandardDate(const char* rocDate);

  // Reads "12.5" with 2 decimals as 1250; further decimals are cut. GetPriceString2 is for amounts
  // above 32 bits and reads no leading '-' of its own.
  int32_t GetPriceString(const char* text, int decimals);
  int64_t GetPriceString2(const char* text, int decimals);

  // Appends `src` to `dst`, zero-filled and three times as long, with every blank as "%20". The two
  // must not overlap: `src` would be overwritten unread, and never end.
  void fctRep(const char* src, char* dst);

  // Replaces every `from` in `text` by `to`, both characters; a `to` of 0 cuts the text.
  void StringReplaceAll(char* text, int from, int to);

  int32_t m_nDataSize;  // capacity of m_pData
  int32_t m_nDataLen;   // characters in m_pData
  char m_szBuffer[kBufferSize];
  char* m_pData;  // a long result, from its first byte on; released with array delete
  int32_t m_nMarket;
  int32_t m_nPlatform;
  int32_t m_nSeqNo;
  char m_szSerialNo[kSerialNoSize];  // no terminator when full
  char m_szLocalIP[kLocalIPSize];    // no terminator when full

  // What operations are made of.

  // m_pData, as what writes long results takes it.
  HeapText DataText() { return {m_pData, m_nDataSize, m_nDataLen}; }

  // An empty request or short result in m_szBuffer.
  CTextWriter StartRequest() { return CTextWriter(m_szBuffer, sizeof m_szBuffer); }

  // Starts a query with its header, in m_szBuffer. The status is 1, or -1 when the header failed:
  // then its message alone stands there. An overflow is no failure here, Finish tells it.
  CTextWriter StartQuery(const char* branch, const char* identity, const char* password,
                         int* status);

  // What an order is named by; reads the clock.
  OrderKey KeyOf(OrderHead head, char function, const OrderOrigin& origin);

  // Writes the header of an order. False leaves a message alone in `line`; an overflow is no
  // failure here either.
  bool WriteOrderHead(CTextWriter& line, const OrderKey& key);

  // Ends an encoder: its request, or the message `overflow` and status -1 when it did not fit.
  static char* Finish(CTextWriter& line, int* status, const char* overflow);

  // As Finish, for a request whose blanks travel as "%20".
  static char* FinishEscaped(CTextWriter& line, int* status, const char* overflow);

  // Ends an encoder with `message` in place of the request and status -1.
  static char* Fail(CTextWriter& line, int* status, const char* message);

  // Ends a decoder with a short result that lies in m_szBuffer.
  char* Answer(std::string_view text);
  char* Fail(std::string_view message, int* status);

  // Ends a decoder with a gateway's refusal: the message with its source, then the code in
  // parentheses if there is one; status -1.
  char* Refuse(std::string_view message, std::string_view code, int* status);

  // Ends the decoder of a list that the reply refuses, or that has nothing to show, which the user
  // interface knows as `noData`. Null when there is data: ask before the walk.
  char* AnswerWithoutData(const CReplyList& list, std::string_view noData, int* status);

  // Ends a decoder with its list, "count!records"; a null text and status -1 when memory ran out.
  static char* FinishList(CResultText& records, int count, int* status);

  // A long result of `length` characters, to be filled, in m_pData; null and status -1 when memory
  // ran out.
  char* RenewResult(size_t length, int* status);

  // Whether the reply is a transport failure. The status is 1, or -1 if so: then m_szBuffer tells
  // it.
  bool TransportFailed(std::string_view reply, int* status);

 private:
  // Reads the clock and reduces m_nSeqNo modulo 100.
  Stamp TakeStamp();
  Device TheDevice() const;
  char RequestKind() const;

  bool WriteQueryHead(CTextWriter& line, const char* branch, const char* identity,
                      const char* password);
  int WritePublicHead(OrderHead head, char function, const OrderOrigin& origin, char* out,
                      char* orderKey);
};

#endif  // QUORVANE_GATEWAY_CORE_GATEWAY_PUB_H_
