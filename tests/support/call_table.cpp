#include "tests/support/call_table.h"

#include <dlfcn.h>

#include <algorithm>
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

using I = jint;
using S = jstring;
using B = jbyte;
using C = jchar;
using Status = jintArray;

template <typename... Arguments>
constexpr Export Row(const char* name, const char* argumentNames, int keptStrings = 0) {
  using Types = Shape<Arguments...>;
  return Export{name, Types::kLetters, argumentNames, &Types::Call, keptStrings};
}

constexpr Export kExports[kExportCount] = {
#include "tests/support/call_rows.inc"
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

std::vector<std::string_view> Export::ArgumentNames() const {
  std::vector<std::string_view> names;
  for (std::string_view rest = argumentNames; !rest.empty();) {
    const size_t end = std::min(rest.find(' '), rest.size());
    names.push_back(rest.substr(0, end));
    rest.remove_prefix(std::min(end + 1, rest.size()));
  }
  return names;
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
