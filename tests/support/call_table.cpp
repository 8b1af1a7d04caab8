#include "tests/support/call_table.h"

#include <dlfcn.h>

#include <utility>

namespace gateway_tests {
namespace {

template <typename Type>
struct Letter;
template <>
struct Letter<jint> {
  static constexpr char kValue = 'i';
  static jint Read(const jvalue& value) { return value.i; }
};
template <>
struct Letter<jstring> {
  static constexpr char kValue = 'S';
  static jstring Read(const jvalue& value) { return static_cast<jstring>(value.l); }
};
template <>
struct Letter<jbyte> {
  static constexpr char kValue = 'b';
  static jbyte Read(const jvalue& value) { return value.b; }
};
template <>
struct Letter<jchar> {
  static constexpr char kValue = 'c';
  static jchar Read(const jvalue& value) { return value.c; }
};
template <>
struct Letter<jintArray> {
  static constexpr char kValue = 's';
  static jintArray Read(const jvalue& value) { return static_cast<jintArray>(value.l); }
};

// A Java argument list as types: knows its letters and how to make the call.
template <typename... Arguments>
struct Shape {
  static constexpr char kLetters[] = {Letter<Arguments>::kValue..., '\0'};

  static jstring Call(void* entryPoint, JNIEnv* env, const jvalue* arguments) {
    return CallAt(entryPoint, env, arguments, std::index_sequence_for<Arguments...>());
  }

  template <size_t... kIndex>
  static jstring CallAt(void* entryPoint, JNIEnv* env, const jvalue* arguments,
                        std::index_sequence<kIndex...>) {
    using Function = jstring(JNICALL*)(JNIEnv*, jclass, Arguments...);
    auto function = reinterpret_cast<Function>(entryPoint);
    return function(env, nullptr, Letter<Arguments>::Read(arguments[kIndex])...);
  }
};

using S = jstring;
using I = jint;
using B = jbyte;
using C = jchar;

template <typename... Arguments>
using Encode = Shape<I, I, I, S, S, Arguments..., jintArray>;

using OneText = Encode<S>;
using ThreeTexts = Encode<S, S, S>;
using ThreeTextsInt = Encode<S, S, S, I>;
using FourTexts = Encode<S, S, S, S>;
using FourTextsInt = Encode<S, S, S, S, I>;
using FiveTexts = Encode<S, S, S, S, S>;
using OpenAccount = Encode<S, S, S, S, S, S, B, B>;
using StockOrder = Encode<S, S, S, S, S, I, I, I, B, B, B, B, B, B>;
using StockChange = Encode<S, S, S, S, S, S, I, I, I, B, B, B, B, B, B>;
using StockOrderNoStatus = Shape<I, I, I, S, S, S, S, S, B, B>;
using FuturesOrder =
    Encode<S, S, S, S, S, S, S, S, S, S, S, S, S, B, B, B, C, C, C, C, C, C, I, I, I>;
using Decode = Shape<S, jintArray>;
using DecodeMarket = Shape<I, S, jintArray>;

template <typename Types>
constexpr Export Row(const char* name, int keptStrings = 0) {
  return Export{name, Types::kLetters, &Types::Call, keptStrings};
}

constexpr Export kExports[kExportCount] = {
    // Login and account list.
    Row<ThreeTexts>("AuthEncode"),
    Row<Decode>("AuthDecode"),
    Row<ThreeTexts>("GetTotalAccountEncode"),
    Row<Decode>("GetTotalAccountDecode"),
    // Account maintenance.
    Row<OpenAccount>("OpenAccountEncode", 3),
    Row<Decode>("OpenAccountDecode"),
    Row<FourTexts>("ChangePasswordEncode"),
    Row<Decode>("ChangePasswordDecode"),
    Row<ThreeTexts>("QueryBankRemainEncode"),
    Row<Decode>("QueryBankRemainDecode"),
    // Certificates.
    Row<OneText>("RegisterCertEncode"),
    Row<Decode>("RegisterCertDecode"),
    Row<OneText>("GetCertEncode"),
    Row<OneText>("GetCertEncode2"),
    Row<Decode>("GetCertDecode"),
    Row<FiveTexts>("ApplyCertEncode"),
    Row<Decode>("ApplyCertDecode"),
    Row<FiveTexts>("RevokeCertEncode"),
    Row<Decode>("RevokeCertDecode"),
    Row<FiveTexts>("ReNewCertEncode"),
    Row<Decode>("ReNewCertDecode"),
    Row<OneText>("GetCertStatusEncode"),
    Row<Decode>("GetCertStatusDecode"),
    Row<OneText>("InstallCertOKEncode"),
    Row<Decode>("InstallCertOKDecode"),
    Row<OneText>("OpenCertEncode"),
    Row<Decode>("OpenCertDecode"),
    // Stock orders.
    Row<StockOrder>("SubmitOrderEncode"),
    Row<StockOrder>("SubmitOrderEncode1"),
    Row<StockOrderNoStatus>("SubmitOrderEncode2"),
    Row<StockChange>("CancelOrderEncode"),
    Row<StockChange>("CancelOrderEncode1"),
    Row<StockChange>("ChangeOrderEncode"),
    Row<StockChange>("ChangeOrderEncode1"),
    Row<Decode>("SubmitOrderDecode"),
    Row<Decode>("CancelChangeOrderDecode"),
    // Stock lists, positions, settlement.
    Row<FourTextsInt>("QueryOrderEncode"),
    Row<DecodeMarket>("QueryOrderDecode"),
    Row<FiveTexts>("QueryReplyEncode"),
    Row<Decode>("QueryReplyDecode"),
    Row<ThreeTexts>("QueryInventoryEncode"),
    Row<Decode>("QueryInventoryDecode"),
    Row<Decode>("QueryInventoryDecodeJZG"),
    Row<FourTexts>("QueryCreditInfoEncode"),
    Row<Decode>("QueryCreditInfoDecode"),
    Row<FiveTexts>("PaymentEncode"),
    Row<Decode>("PaymentDecode"),
    Row<Decode>("PaymentDecodeJZG"),
    // Futures and options.
    Row<FuturesOrder>("FutSubmitOrderEncode"),
    Row<FuturesOrder>("FutSubmitOrderEncode1"),
    Row<Decode>("FutSubmitOrderDecode"),
    Row<FourTextsInt>("FutQueryOrderEncode"),
    Row<Decode>("FutQueryOrderDecode"),
    Row<FiveTexts>("FutQueryReplyEncode"),
    Row<Decode>("FutQueryReplyDecode"),
    Row<ThreeTexts>("FutQueryInventoryEncode"),
    Row<Decode>("FutQueryInventoryDecode"),
    Row<ThreeTextsInt>("QueryFinanceEncode"),
    Row<Decode>("QueryFinanceDecode"),
};

// Where entry points are looked up: the shared library when the program can load it, else (a
// program that links the objects themselves) the program.
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

std::string Export::SymbolName() const {
  return std::string(kSymbolPrefix).append(name);
}

std::string Export::Descriptor() const {
  std::string text = "(";
  for (char letter : shape) text.append(JavaTypeOf(letter));
  return text.append(")Ljava/lang/String;");
}

void* Export::EntryPoint() const {
  return dlsym(LibraryHandle(), SymbolName().c_str());
}

const Export (&AllExports())[kExportCount] {
  return kExports;
}

const Export* FindExport(std::string_view name) {
  for (const Export& row : kExports) {
    if (row.name == name) return &row;
  }
  return nullptr;
}

}  // namespace gateway_tests
