// The public methods that read a reply, or what it says, into a caller's buffer. No operation calls
// them: decoders read slices by the same rules (reply_reader.h).
#include "gateway/core/gateway_pub.h"
#include "gateway/core/messages.h"
#include "gateway/core/protocol.h"

namespace {

void ClearBuffer(char* out, int size) {
  if (out != nullptr && size > 0) memset(out, 0, static_cast<size_t>(size));
}

}  // namespace

int CGatewayPub::GetToken(const char* tag, const char* reply, char* out, int outSize,
                          bool skipBlank) {
  ClearBuffer(out, outSize);
  if (tag == nullptr) return 0;
  const Blanks blanks = skipBlank ? Blanks::kSkipped : Blanks::kTaken;
  const std::string_view value = FindField(AsText(reply), tag, blanks);
  CopyIfFits(value, out, outSize);
  return static_cast<int>(value.size());
}

void CGatewayPub::GetSubString(const char* reply, int& pos, char* out, int outSize) {
  ClearBuffer(out, outSize);
  const std::string_view text = AsText(reply);
  if (pos < 0 || static_cast<size_t>(pos) > text.size()) pos = static_cast<int>(text.size());
  const size_t from = static_cast<size_t>(pos);
  const size_t opening = text.find("|00=", from);
  const size_t closing = text.find("|01=", from);
  if (opening == std::string_view::npos || closing == std::string_view::npos) {
    pos = static_cast<int>(text.size());
    return;
  }
  if (closing > opening) CopyIfFits({text.data() + opening, closing - opening}, out, outSize);
  pos = static_cast<int>(closing + 1);
}

void CGatewayPub::GetFieldString(char** cursor, const char* separator, char* out, int outSize) {
  if (cursor == nullptr || *cursor == nullptr || separator == nullptr) return;
  char* const found = strstr(*cursor, separator);
  if (found == nullptr && out == nullptr) return;
  const size_t length = found == nullptr ? strlen(*cursor) : static_cast<size_t>(found - *cursor);
  CopyIfFits({*cursor, length}, out, outSize);
  *cursor += length + (found == nullptr ? 0 : strlen(separator));
}

void CGatewayPub::CheckError(const char* reply, int* status, char* message, int messageSize) {
  ClearBuffer(message, messageSize);
  const Transport transport = JudgeTransport(AsText(reply));
  if (transport == Transport::kOk) return;
  *status = -1;
  CopyIfFits(TransportMessage(transport), message, messageSize);
}

void CGatewayPub::MakeErrorMsg(char* message) {
  if (message == nullptr) return;
  const char* const source = SourceOf(AsText(message));
  const size_t size = strlen(source);
  if (size == 0) return;
  memmove(message + size, message, strlen(message) + 1);
  memcpy(message, source, size);
}

void CGatewayPub::AppendData(const char* data, int length, bool reset) {
  AppendHeapText(DataText(), data, length, reset);
}
