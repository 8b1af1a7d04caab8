// The header of queries and account operations.
#include "gateway/core/gateway_pub.h"
#include "gateway/core/messages.h"
#include "gateway/core/protocol.h"

namespace {

// The login block names an account, an ID number or both, told apart by their lengths alone: a
// first part of 8 to 10 characters is an ID number (9 included), a second part only with 8 or 10.
bool WriteIdentity(CTextWriter& line, std::string_view first, std::string_view second,
                   const char* password) {
  if (IsAccountLength(first.size())) {
    line.Append(WIRE("15=0|ACNO=%07d|PWD=%s|"), ReadInt32(first), password);
    return true;
  }
  if (IsIdNumberLength(first.size())) {
    line.Append(WIRE("15=1|IDNO=%s|"), first);
    if (IsAccountLength(second.size())) line.Append(WIRE("ACNO=%07d|"), ReadInt32(second));
    line.Append(WIRE("PWD=%s|"), password);
    return true;
  }
  if (second.size() == 8 || second.size() == 10) {
    line.Append(WIRE("15=1|IDNO=%s|PWD=%s|"), second, password);
    return true;
  }
  return false;
}

}  // namespace

int CGatewayPub::SeparateDataFromUiField(const char* field, char* first, int firstSize,
                                         char* second, int secondSize) {
  const char* const ampersand = field == nullptr ? nullptr : strchr(field, '&');
  if (ampersand == nullptr) return 0;
  const std::string_view before(field, static_cast<size_t>(ampersand - field));
  CopyIfFits(before, first, firstSize);
  CopyIfFits(ampersand + 1, second, secondSize);
  return 1;
}

int CGatewayPub::initQueryHead(const char* branch, const char* identity, const char* password,
                               char* out) {
  CTextWriter line = CTextWriter::Continue(out, kBufferSize);
  const bool written = WriteQueryHead(line, branch, identity, password);
  return EndPublicText(line, written);
}

CTextWriter CGatewayPub::StartQuery(const char* branch, const char* identity, const char* password,
                                    int* status) {
  CTextWriter line = StartRequest();
  *status = WriteQueryHead(line, branch, identity, password) ? 1 : -1;
  return line;
}

bool CGatewayPub::WriteQueryHead(CTextWriter& line, const char* branch, const char* identity,
                                 const char* password) {
  const Stamp stamp = TakeStamp();
  const Device device = TheDevice();
  char first[kIdentityPartSize] = "";
  char second[kIdentityPartSize] = "";
  if (!AsText(identity).empty() &&
      SeparateDataFromUiField(identity, first, sizeof first, second, sizeof second) == 0) {
    line.Replace(kIdentityUnsplit);
    return false;
  }
  debuglog(first);
  debuglog(second);
  if (device.address.empty()) {
    line.Replace(kNoAddress);
    return false;
  }

  line.Append(WIRE("F=7|KIND=%c|BHNO=%s|CB=1|IP=%s|11=%s|VER=%s|65=00%s|SN=%s%s|"), RequestKind(),
              branch, device.address, device.edition, kProtocolVersion, stamp.RequestId(),
              device.serialNo, device.serialTail);
  if (first[0] == '\0') return true;
  if (!WriteIdentity(line, first, second, password)) {
    line.Replace(kIdentityLengths);
    return false;
  }
  if (!line.Overflowed()) debuglog(line.Text());
  return true;
}
