// The texts that account operations show a user; each is UTF-8.
#ifndef QUORVANE_GATEWAY_ACCOUNT_MESSAGES_H_
#define QUORVANE_GATEWAY_ACCOUNT_MESSAGES_H_

// Certificate requests with an empty certificate message, or one that is too long to be sent. Both
// requests that fetch a certificate share theirs.
inline constexpr char kRegisterCertParameters[] = "RegisterCertEncode()傳入的參數錯誤";
inline constexpr char kGetCertParameters[] = "GetCertEncode()傳入的參數錯誤";
inline constexpr char kApplyCertParameters[] = "ApplyCertEncode()傳入的參數錯誤";
inline constexpr char kGetCertStatusParameters[] = "GetCertStatusEncode()傳入的參數錯誤";
inline constexpr char kReNewCertParameters[] = "ReNewCertEncode()傳入的參數錯誤";
inline constexpr char kInstallCertOKParameters[] = "InstallCertOKEncode()傳入的參數錯誤";
inline constexpr char kOpenCertParameters[] = "OpenCertEncode()傳入的參數錯誤";
inline constexpr char kRevokeCertParameters[] = "RevokeCertEncode()傳入的參數錯誤";

#endif  // QUORVANE_GATEWAY_ACCOUNT_MESSAGES_H_
