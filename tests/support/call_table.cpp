#include "tests/support/call_table.h"

#include <dlfcn.h>

#include <utility>

namespace gateway_tests {
namespace {

template <typename TType>
struct TLetter;
template <>
struct TLetter<jint> {
  static constexpr char kValue = 'i';
  static jint Read(const jvalue& value) { return value.i; }
};
template <>
struct TLetter<jstring> {
  static constexpr char kValue = 'S';
  static jstring Read(const jvalue& value) { return static_cast<jstring>(value.l); }
};
template <>
struct TLetter<jbyte> {
  static constexpr char kValue = 'b';
  static jbyte Read(const jvalue& value) { return value.b; }
};
template <>
struct TLetter<jchar> {
  static constexpr char kValue = 'c';
  static jchar Read(const jvalue& value) { return value.c; }
};
template <>
struct TLetter<jintArray> {
  static constexpr char kValue = 's';
  static jintArray Read(const jvalue& value) { return static_cast<jintArray>(value.l); }
};

/// A Java argument list as types: knows its letters and how to make the call.
template <typename... TArguments>
struct TShape {
  static constexpr char kLetters[] = {TLetter<TArguments>::kValue..., '\0'};

  static jstring Call(void* entryPoint, JNIEnv* env, const jvalue* arguments) {
    return CallAt(entryPoint, env, arguments, std::index_sequence_for<TArguments...>());
  }

  template <size_t... kIndex>
  static jstring CallAt(void* entryPoint, JNIEnv* env, const jvalue* arguments,
                        std::index_sequence<kIndex...>) {
    using TFunction = jstring(JNICALL*)(JNIEnv*, jclass, TArguments...);
    auto function = reinterpret_cast<TFunction>(entryPoint);
    return function(env, nullptr, TLetter<TArguments>::Read(arguments[kIndex])...);
  }
};

using S = jstring;
using I = jint;
using B = jbyte;
using C = jchar;

template <typename... TArguments>
using TEncode = TShape<I, I, I, S, S, TArguments..., jintArray>;

using TOneText = TEncode<S>;
using TThreeTexts = TEncode<S, S, S>;
using TThreeTextsInt = TEncode<S, S, S, I>;
using TFourTexts = TEncode<S, S, S, S>;
using TFourTextsInt = TEncode<S, S, S, S, I>;
using TFiveTexts = TEncode<S, S, S, S, S>;
using TOpenAccount = TEncode<S, S, S, S, S, S, B, B>;
using TStockOrder = TEncode<S, S, S, S, S, I, I, I, B, B, B, B, B, B>;
using TStockChange = TEncode<S, S, S, S, S, S, I, I, I, B, B, B, B, B, B>;
using TStockOrderNoStatus = TShape<I, I, I, S, S, S, S, S, B, B>;
using TFuturesOrder =
    TEncode<S, S, S, S, S, S, S, S, S, S, S, S, S, B, B, B, C, C, C, C, C, C, I, I, I>;
using TDecode = TShape<S, jintArray>;
using TDecodeMarket = TShape<I, S, jintArray>;

template <typename TTypes>
constexpr TExport Row(const char* name, int keptStrings = 0) {
  return TExport{name, TTypes::kLetters, &TTypes::Call, keptStrings};
}

constexpr TExport kExports[kExportCount] = {
    // Login and account list.
    Row<TThreeTexts>("AuthEncode"),
    Row<TDecode>("AuthDecode"),
    Row<TThreeTexts>("GetTotalAccountEncode"),
    Row<TDecode>("GetTotalAccountDecode"),
    // Account maintenance.
    Row<TOpenAccount>("OpenAccountEncode", 3),
    Row<TDecode>("OpenAccountDecode"),
    Row<TFourTexts>("ChangePasswordEncode"),
    Row<TDecode>("ChangePasswordDecode"),
    Row<TThreeTexts>("QueryBankRemainEncode"),
    Row<TDecode>("QueryBankRemainDecode"),
    // Certificates.
    Row<TOneText>("RegisterCertEncode"),
    Row<TDecode>("RegisterCertDecode"),
    Row<TOneText>("GetCertEncode"),
    Row<TOneText>("GetCertEncode2"),
    Row<TDecode>("GetCertDecode"),
    Row<TFiveTexts>("ApplyCertEncode"),
    Row<TDecode>("ApplyCertDecode"),
    Row<TFiveTexts>("RevokeCertEncode"),
    Row<TDecode>("RevokeCertDecode"),
    Row<TFiveTexts>("ReNewCertEncode"),
    Row<TDecode>("ReNewCertDecode"),
    Row<TOneText>("GetCertStatusEncode"),
    Row<TDecode>("GetCertStatusDecode"),
    Row<TOneText>("InstallCertOKEncode"),
    Row<TDecode>("InstallCertOKDecode"),
    Row<TOneText>("OpenCertEncode"),
    Row<TDecode>("OpenCertDecode"),
    // Stock orders.
    Row<TStockOrder>("SubmitOrderEncode"),
    Row<TStockOrder>("SubmitOrderEncode1"),
    Row<TStockOrderNoStatus>("SubmitOrderEncode2"),
    Row<TStockChange>("CancelOrderEncode"),
    Row<TStockChange>("CancelOrderEncode1"),
    Row<TStockChange>("ChangeOrderEncode"),
    Row<TStockChange>("ChangeOrderEncode1"),
    Row<TDecode>("SubmitOrderDecode"),
    Row<TDecode>("CancelChangeOrderDecode"),
    // Stock lists, positions, settlement.
    Row<TFourTextsInt>("QueryOrderEncode"),
    Row<TDecodeMarket>("QueryOrderDecode"),
    Row<TFiveTexts>("QueryReplyEncode"),
    Row<TDecode>("QueryReplyDecode"),
    Row<TThreeTexts>("QueryInventoryEncode"),
    Row<TDecode>("QueryInventoryDecode"),
    Row<TDecode>("QueryInventoryDecodeJZG"),
    Row<TFourTexts>("QueryCreditInfoEncode"),
    Row<TDecode>("QueryCreditInfoDecode"),
    Row<TFiveTexts>("PaymentEncode"),
    Row<TDecode>("PaymentDecode"),
    Row<TDecode>("PaymentDecodeJZG"),
    // Futures and options.
    Row<TFuturesOrder>("FutSubmitOrderEncode"),
    Row<TFuturesOrder>("FutSubmitOrderEncode1"),
    Row<TDecode>("FutSubmitOrderDecode"),
    Row<TFourTextsInt>("FutQueryOrderEncode"),
    Row<TDecode>("FutQueryOrderDecode"),
    Row<TFiveTexts>("FutQueryReplyEncode"),
    Row<TDecode>("FutQueryReplyDecode"),
    Row<TThreeTexts>("FutQueryInventoryEncode"),
    Row<TDecode>("FutQueryInventoryDecode"),
    Row<TThreeTextsInt>("QueryFinanceEncode"),
    Row<TDecode>("QueryFinanceDecode"),
};

/// Where entry points are looked up: the shared library when the program can load it, else (a
/// program that links the objects themselves) the program.
void* LibraryHandle() {
  static void* const s_pHandle = [] {
    void* handle = dlopen("libquorvane.so", RTLD_NOW);
    return handle != nullptr ? handle : dlopen(nullptr, RTLD_NOW);
  }();
  return s_pHandle;
}

std::string_view JavaTypeOf(char letter) {
  switch (letter) {
    case 'i':
      return "I";
    case 'S':
      return "Ljava/lang/String;";
    case 'b':
      return "B";
    case 'c':
      return "C";
    default:
      return "[I";
  }
}

}  // namespace

std::string TExport::SymbolName() const {
  return std::string(kSymbolPrefix).append(m_szName);
}

std::string TExport::Descriptor() const {
  std::string text = "(";
  for (char letter : m_szShape) text.append(JavaTypeOf(letter));
  return text.append(")Ljava/lang/String;");
}

void* TExport::EntryPoint() const {
  return dlsym(LibraryHandle(), SymbolName().c_str());
}

const TExport (&AllExports())[kExportCount] {
  return kExports;
}

const TExport* FindExport(std::string_view name) {
  for (const TExport& row : kExports) {
    if (row.m_szName == name) return &row;
  }
  return nullptr;
}

}  // namespace gateway_tests
