#include "bench/operations.h"

#include <benchmark/benchmark.h>

#include <cstdlib>

#include "bench/sample_session.h"
#include "gateway/core/gateway_pub.h"
#include "gateway/futures/gateway_fut.h"
#include "gateway/stock/gateway_stk.h"

namespace bench {
namespace {

constexpr char kPeriodStart[] = "1130101";
constexpr char kCertificate[] =
    "-----BEGIN CERTIFICATE REQUEST-----MIICijCCAXICAQAwRTELMAkGA1UEBhMCVFcxEzARBgNVBAgMClNvbWUtU3R"
    "hdGUxITAfBgNVBAoMGEludGVybmV0IFdpZGdpdHMgUHR5IEx0ZDCCASIwDQYJKoZI-----END CERTIFICATE "
    "REQUEST-";

void Keep(const char* text, std::string* result) {
  benchmark::DoNotOptimize(text);
  if (result != nullptr) *result = text == nullptr ? "(null)" : text;
}

template <typename TGateway, typename TCall>
void Encode(int market, std::string* result, TCall call) {
  TGateway gateway;
  gateway.m_nMarket = market;
  gateway.m_nPlatform = kSession.platform;
  gateway.m_nSeqNo = kSession.sequence;
  gateway.setSerialNumber(kSession.serialNo);
  gateway.setLocalIP(kSession.localIP);
  int status = 0;
  Keep(call(gateway, &status), result);
}

template <char* (CGatewayPub::*kMethod)(const char*, const char*, const char*, int*)>
void EncodeUser(std::string* result) {
  Encode<CGatewayPub>(kSession.market, result, [](CGatewayPub& gateway, int* status) {
    return (gateway.*kMethod)(kBranch, kIdentity, kPassword, status);
  });
}

template <char* (CGatewayPub::*kMethod)(const char*, int*)>
void EncodeCert(std::string* result) {
  Encode<CGatewayPub>(kSession.market, result, [](CGatewayPub& gateway, int* status) {
    return (gateway.*kMethod)(kCertificate, status);
  });
}

template <char* (CGatewayPub::*kMethod)(const char*, const char*, const char*, const char*,
                                        const char*, int*)>
void EncodeUserCert(std::string* result) {
  Encode<CGatewayPub>(kSession.market, result, [](CGatewayPub& gateway, int* status) {
    return (gateway.*kMethod)(kBranch, kIdentity, kPassword, "0750101", kCertificate, status);
  });
}

template <typename TCall>
void EncodeStock(std::string* result, TCall call) {
  Encode<CGatewayStk>(kSession.market, result, call);
}

template <typename TCall>
void EncodeFutures(std::string* result, TCall call) {
  Encode<CGatewayFut>(kSession.market + 100, result, call);
}

template <char* (CGatewayStk::*kMethod)(const char*, const char*, const char*, const char*,
                                        const char*, long, long, long, char, char, char, char, char,
                                        char, int*)>
void EncodeNewOrder(std::string* result) {
  EncodeStock(result, [](CGatewayStk& gateway, int* status) {
    return (gateway.*kMethod)(kBranch, kIdentity, kPassword, kStockCode, kOrderDate, 2, 1000, 58550,
                              'B', '0', 0, 0, 0, 1, status);
  });
}

template <char* (CGatewayStk::*kMethod)(const char*, const char*, const char*, const char*,
                                        const char*, const char*, long, long, long, char, char,
                                        char, char, char, char, int*)>
void EncodeAmendment(std::string* result) {
  EncodeStock(result, [](CGatewayStk& gateway, int* status) {
    return (gateway.*kMethod)(kBranch, kIdentity, kPassword, kStockCode, kOrderDate, kReference, 2,
                              1000, 58550, 'B', '0', 0, 0, 0, 1, status);
  });
}

void EncodeBriefOrder(std::string* result) {
  EncodeStock(result, [](CGatewayStk& gateway, int*) {
    return gateway.SubmitOrderEncode2(kBranch, kIdentity, kPassword, 'I', 0);
  });
}

template <char* (CGatewayFut::*kMethod)(
    const char*, const char*, const char*, const char*, const char*, const char*, const char*,
    const char*, const char*, const char*, const char*, const char*, const char*, char, char, char,
    char, char, char, char, char, char, int, int, int, int*)>
void EncodeFuturesOrder(std::string* result) {
  EncodeFutures(result, [](CGatewayFut& gateway, int* status) {
    return (gateway.*kMethod)(kBranch, kIdentity, kPassword, kReference, kOrderDate, "TXO", "TXO",
                              "202402", "202403", "17000", "17500", "C", "P", 1, 3, 0, 'I', '0',
                              'R', ' ', 'B', 'S', 3, 0, 1234500, status);
  });
}

void EncodeOpenAccount(std::string* result) {
  Encode<CGatewayPub>(kSession.market, result, [](CGatewayPub& gateway, int* status) {
    return gateway.OpenAccountEncode("", kIdentity, "", "王小明", "台北市信義路五段7號",
                                     "0912345678", 1, 2, status);
  });
}

void EncodeChangePassword(std::string* result) {
  Encode<CGatewayPub>(kSession.market, result, [](CGatewayPub& gateway, int* status) {
    return gateway.ChangePasswordEncode(kBranch, kIdentity, kPassword, "n3wsecret", status);
  });
}

void EncodeStockBook(std::string* result) {
  EncodeStock(result, [](CGatewayStk& gateway, int* status) {
    return gateway.QueryOrderEncode(kBranch, kIdentity, kPassword, kOrderDate, 0, status);
  });
}
void EncodeStockFills(std::string* result) {
  EncodeStock(result, [](CGatewayStk& gateway, int* status) {
    return gateway.QueryReplyEncode(kBranch, kIdentity, kPassword, kPeriodStart, kOrderDate,
                                    status);
  });
}
void EncodeStockPositions(std::string* result) {
  EncodeStock(result, [](CGatewayStk& gateway, int* status) {
    return gateway.QueryInventoryEncode(kBranch, kIdentity, kPassword, status);
  });
}
void EncodeCreditInfo(std::string* result) {
  EncodeStock(result, [](CGatewayStk& gateway, int* status) {
    return gateway.QueryCreditInfoEncode(kBranch, kIdentity, kPassword, kStockCode, status);
  });
}
void EncodePayment(std::string* result) {
  EncodeStock(result, [](CGatewayStk& gateway, int* status) {
    return gateway.PaymentEncode(kBranch, kIdentity, kPassword, kPeriodStart, kOrderDate, status);
  });
}

void EncodeFuturesBook(std::string* result) {
  EncodeFutures(result, [](CGatewayFut& gateway, int* status) {
    return gateway.QueryOrderEncode(kBranch, kIdentity, kPassword, kOrderDate, 0, status);
  });
}
void EncodeFuturesFills(std::string* result) {
  EncodeFutures(result, [](CGatewayFut& gateway, int* status) {
    return gateway.QueryReplyEncode(kBranch, kIdentity, kPassword, kPeriodStart, kOrderDate,
                                    status);
  });
}
void EncodeFuturesPositions(std::string* result) {
  EncodeFutures(result, [](CGatewayFut& gateway, int* status) {
    return gateway.QueryInventoryEncode(kBranch, kIdentity, kPassword, status);
  });
}
void EncodeMargin(std::string* result) {
  EncodeFutures(result, [](CGatewayFut& gateway, int* status) {
    return gateway.QueryFinanceEncode(kBranch, kIdentity, kPassword, 3, status);
  });
}

constexpr Encoder kEncoderTable[kEncoders] = {
    {"AuthEncode", EncodeUser<&CGatewayPub::AuthEncode>},
    {"GetTotalAccountEncode", EncodeUser<&CGatewayPub::GetTotalAccountEncode>},
    {"OpenAccountEncode", EncodeOpenAccount},
    {"ChangePasswordEncode", EncodeChangePassword},
    {"QueryBankRemainEncode", EncodeUser<&CGatewayPub::QueryBankRemainEncode>},
    {"RegisterCertEncode", EncodeCert<&CGatewayPub::RegisterCertEncode>},
    {"GetCertEncode", EncodeCert<&CGatewayPub::GetCertEncode>},
    {"GetCertEncode2", EncodeCert<&CGatewayPub::GetCertEncode2>},
    {"ApplyCertEncode", EncodeUserCert<&CGatewayPub::ApplyCertEncode>},
    {"RevokeCertEncode", EncodeUserCert<&CGatewayPub::RevokeCertEncode>},
    {"ReNewCertEncode", EncodeUserCert<&CGatewayPub::ReNewCertEncode>},
    {"GetCertStatusEncode", EncodeCert<&CGatewayPub::GetCertStatusEncode>},
    {"InstallCertOKEncode", EncodeCert<&CGatewayPub::InstallCertOKEncode>},
    {"OpenCertEncode", EncodeCert<&CGatewayPub::OpenCertEncode>},
    {"SubmitOrderEncode", EncodeNewOrder<&CGatewayStk::SubmitOrderEncode>},
    {"SubmitOrderEncode1", EncodeNewOrder<&CGatewayStk::SubmitOrderEncode1>},
    {"SubmitOrderEncode2", EncodeBriefOrder},
    {"CancelOrderEncode", EncodeAmendment<&CGatewayStk::CancelOrderEncode>},
    {"CancelOrderEncode1", EncodeAmendment<&CGatewayStk::CancelOrderEncode1>},
    {"ChangeOrderEncode", EncodeAmendment<&CGatewayStk::ChangeOrderEncode>},
    {"ChangeOrderEncode1", EncodeAmendment<&CGatewayStk::ChangeOrderEncode1>},
    {"QueryOrderEncode", EncodeStockBook},
    {"QueryReplyEncode", EncodeStockFills},
    {"QueryInventoryEncode", EncodeStockPositions},
    {"QueryCreditInfoEncode", EncodeCreditInfo},
    {"PaymentEncode", EncodePayment},
    {"FutSubmitOrderEncode", EncodeFuturesOrder<&CGatewayFut::SubmitOrderEncode>},
    {"FutSubmitOrderEncode1", EncodeFuturesOrder<&CGatewayFut::SubmitOrderEncode1>},
    {"FutQueryOrderEncode", EncodeFuturesBook},
    {"FutQueryReplyEncode", EncodeFuturesFills},
    {"FutQueryInventoryEncode", EncodeFuturesPositions},
    {"QueryFinanceEncode", EncodeMargin},
};

template <typename TGateway, char* (TGateway::*kMethod)(const char*, int*)>
void Decode(const char* reply, std::string* result) {
  TGateway gateway;
  int status = 0;
  Keep((gateway.*kMethod)(reply, &status), result);
}

constexpr Decoder kDecoderTable[kDecoders] = {
    {"AuthDecode", Decode<CGatewayPub, &CGatewayPub::AuthDecode>},
    {"GetTotalAccountDecode", Decode<CGatewayPub, &CGatewayPub::GetTotalAccountDecode>},
    {"OpenAccountDecode", Decode<CGatewayPub, &CGatewayPub::OpenAccountDecode>},
    {"ChangePasswordDecode", Decode<CGatewayPub, &CGatewayPub::ChangePasswordDecode>},
    {"QueryBankRemainDecode", Decode<CGatewayPub, &CGatewayPub::QueryBankRemainDecode>},
    {"RegisterCertDecode", Decode<CGatewayPub, &CGatewayPub::RegisterCertDecode>},
    {"GetCertDecode", Decode<CGatewayPub, &CGatewayPub::GetCertDecode>},
    {"ApplyCertDecode", Decode<CGatewayPub, &CGatewayPub::ApplyCertDecode>},
    {"RevokeCertDecode", Decode<CGatewayPub, &CGatewayPub::RevokeCertDecode>},
    {"ReNewCertDecode", Decode<CGatewayPub, &CGatewayPub::ReNewCertDecode>},
    {"GetCertStatusDecode", Decode<CGatewayPub, &CGatewayPub::GetCertStatusDecode>},
    {"InstallCertOKDecode", Decode<CGatewayPub, &CGatewayPub::InstallCertOKDecode>},
    {"OpenCertDecode", Decode<CGatewayPub, &CGatewayPub::OpenCertDecode>},
    {"SubmitOrderDecode", Decode<CGatewayStk, &CGatewayStk::SubmitOrderDecode>},
    {"CancelChangeOrderDecode", Decode<CGatewayStk, &CGatewayStk::CancelChangeOrderDecode>},
    {"QueryOrderDecode", Decode<CGatewayStk, &CGatewayStk::QueryOrderDecode>},
    {"QueryReplyDecode", Decode<CGatewayStk, &CGatewayStk::QueryReplyDecode>},
    {"QueryInventoryDecode", Decode<CGatewayStk, &CGatewayStk::QueryInventoryDecode>},
    {"QueryInventoryDecodeJZG", Decode<CGatewayStk, &CGatewayStk::QueryInventoryDecodeJZG>},
    {"QueryCreditInfoDecode", Decode<CGatewayStk, &CGatewayStk::QueryCreditInfoDecode>},
    {"PaymentDecode", Decode<CGatewayStk, &CGatewayStk::PaymentDecode>},
    {"PaymentDecodeJZG", Decode<CGatewayStk, &CGatewayStk::PaymentDecodeJZG>},
    {"FutSubmitOrderDecode", Decode<CGatewayFut, &CGatewayFut::SubmitOrderDecode>},
    {"FutQueryOrderDecode", Decode<CGatewayFut, &CGatewayFut::QueryOrderDecode>},
    {"FutQueryReplyDecode", Decode<CGatewayFut, &CGatewayFut::QueryReplyDecode>},
    {"FutQueryInventoryDecode", Decode<CGatewayFut, &CGatewayFut::QueryInventoryDecode>},
    {"QueryFinanceDecode", Decode<CGatewayFut, &CGatewayFut::QueryFinanceDecode>},
};

template <typename TRow, size_t kRows>
const TRow& Find(const TRow (&rows)[kRows], std::string_view name) {
  for (const TRow& row : rows) {
    if (row.name == name) return row;
  }
  abort();
}

}  // namespace

const Encoder (&Encoders())[kEncoders] {
  return kEncoderTable;
}

const Decoder (&Decoders())[kDecoders] {
  return kDecoderTable;
}

const Encoder& FindEncoder(std::string_view name) {
  return Find(kEncoderTable, name);
}

const Decoder& FindDecoder(std::string_view name) {
  return Find(kDecoderTable, name);
}

}  // namespace bench
