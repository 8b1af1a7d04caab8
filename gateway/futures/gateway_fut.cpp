// The futures object's life, its two position texts and the reading of a result code.
#include "gateway/futures/gateway_fut.h"

#include "gateway/core/messages.h"
#include "gateway/core/protocol.h"
#include "gateway/futures/futures_list.h"
#include "gateway/futures/messages.h"

CGatewayFut::CGatewayFut()
    : m_nFutDataSize(0),
      m_nFutDataLen(0),
      m_pFutData(nullptr),
      m_nOptDataSize(0),
      m_nOptDataLen(0),
      m_pOptData(nullptr) {}

CGatewayFut::~CGatewayFut() {
  delete[] m_pFutData;
  delete[] m_pOptData;
}

void CGatewayFut::AppendFutData(const char* data, int length, bool reset) {
  AppendHeapText(FutText(), data, length, reset);
}

void CGatewayFut::AppendOptData(const char* data, int length, bool reset) {
  AppendHeapText(OptText(), data, length, reset);
}

char* CGatewayFut::GetResultCode(const char* reply, char* out, int size) {
  if (out == nullptr || size < 1) return out;
  memset(out, 0, static_cast<size_t>(size));
  const std::string_view text = AsText(reply);
  if (text.empty()) {
    CopyIfFits(kNoReplyToJudge, out, size);
    return out;
  }
  char scratch[kReplyCode.bound + kRefusal.bound + 2];
  CTextWriter result(scratch, sizeof scratch);
  WriteReplyCode(ReplyCode(text), text, result);
  CopyIfFits({result.Text(), result.Length()}, out, size);
  return out;
}

char* CGatewayFut::AnswerWithoutRecords(std::string_view reply, std::string_view noData,
                                        int* status) {
  *status = 1;
  if (reply.empty()) return Fail(kNoReply, status);
  const std::string_view code = ReplyCode(reply);
  if (code == kDoneCode) return nullptr;
  if (code == kNoDataCode) return Answer(noData);
  *status = -1;
  CTextWriter answer = StartRequest();
  WriteReplyCode(code, reply, answer);
  return answer.Text();
}
