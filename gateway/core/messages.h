// The texts that a user may be shown, whatever the operation; each is UTF-8.
#ifndef QUORVANE_GATEWAY_CORE_MESSAGES_H_
#define QUORVANE_GATEWAY_CORE_MESSAGES_H_

#include <string_view>

#include "gateway/core/reply_reader.h"

// Request headers.
inline constexpr char kIdentityUnsplit[] = "[CLIENT] 身分證字號及帳號有誤！";
inline constexpr char kIdentityLengths[] = "[CLIENT] 帳號或身份證字號輸入錯誤";
inline constexpr char kNoAddress[] = "[CLIENT] 無法取得IP，請確認網路連線是否正常！";

// A request that does not fit its buffer, or parameters that make no request.
inline constexpr char kBadParameters[] = "[CLIENT]傳入的參數錯誤";

// Transport failures.
inline constexpr char kGatewayDown[] = "[GATEWAY]主機連線失敗";
inline constexpr char kBrokerDown[] = "[BROKER]主機連線失敗";

constexpr const char* TransportMessage(Transport transport) {
  return transport == Transport::kGatewayDown ? kGatewayDown : kBrokerDown;
}

// What a gateway's message is shown behind: nothing when it names its source itself.
inline const char* SourceOf(std::string_view message) {
  for (const std::string_view source : {"[GATEWAY]", "[BROKER]", "[CERT]"}) {
    if (message.find(source) != std::string_view::npos) return "";
  }
  return "[GATEWAY]";
}

#endif  // QUORVANE_GATEWAY_CORE_MESSAGES_H_
