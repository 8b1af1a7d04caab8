// How an operation ends, and what every decoder does before it reads its own fields.
#include "gateway/core/gateway_pub.h"
#include "gateway/core/list_frame.h"
#include "gateway/core/messages.h"
#include "gateway/core/protocol.h"

char* CGatewayPub::Finish(CTextWriter& line, int* status, const char* overflow) {
  if (line.Overflowed()) return Fail(line, status, overflow);
  return line.Text();
}

char* CGatewayPub::FinishEscaped(CTextWriter& line, int* status, const char* overflow) {
  line.EscapeBlanks();
  return Finish(line, status, overflow);
}

char* CGatewayPub::Fail(CTextWriter& line, int* status, const char* message) {
  *status = -1;
  line.Replace(message);
  return line.Text();
}

char* CGatewayPub::Answer(std::string_view text) {
  CTextWriter answer = StartRequest();
  answer.AppendText(text);
  return answer.Text();
}

char* CGatewayPub::Fail(std::string_view message, int* status) {
  *status = -1;
  return Answer(message);
}

char* CGatewayPub::Refuse(std::string_view message, std::string_view code, int* status) {
  *status = -1;
  CTextWriter answer = StartRequest();
  answer.Append(WIRE("%s%s"), SourceOf(message), message);
  if (!code.empty()) answer.Append(WIRE("(%s)"), code);
  return answer.Text();
}

char* CGatewayPub::AnswerWithoutData(const CReplyList& list, std::string_view noData, int* status) {
  switch (list.Verdict()) {
    case ListVerdict::kNoData:
      return Answer(noData);
    case ListVerdict::kRefused:
      return Refuse(list.Message(), list.Code(), status);
    case ListVerdict::kData:
      break;
  }
  return nullptr;
}

char* CGatewayPub::FinishList(CResultText& records, int count, int* status) {
  char* const list = records.Finish("", count);
  if (list == nullptr) *status = -1;
  return list;
}

char* CGatewayPub::RenewResult(size_t length, int* status) {
  char* const room = RenewHeapText(DataText(), length);
  if (room == nullptr) *status = -1;
  return room;
}

bool CGatewayPub::TransportFailed(std::string_view reply, int* status) {
  *status = 1;
  const Transport transport = JudgeTransport(reply);
  if (transport == Transport::kOk) return false;
  Fail(TransportMessage(transport), status);
  return true;
}
