#ifndef TESTS_SUPPORT_CALL_TABLE_H_
#define TESTS_SUPPORT_CALL_TABLE_H_

#include <jni.h>

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

#include "tests/support/call_count.h"

namespace gateway_tests {

// Calls an entry point through a pointer of its true type.
using Caller = jstring (*)(void* entryPoint, JNIEnv* env, const jvalue* arguments);

// One native method of the host class.
struct Export {
  // Method name in Java, "AuthEncode".
  std::string_view name;
  // One letter for each Java argument: i int, S String, b byte, c char, s the status int[].
  std::string_view shape;
  // Names of the Java arguments in their order, parted by blanks, without the status array.
  std::string_view argumentNames;
  Caller call;
  // Number of last strings that the export keeps on purpose (never releases).
  int keptStrings;

  bool IsDecoder() const { return name.find("Decode") != std::string_view::npos; }
  bool HasStatus() const { return shape.back() == 's'; }
  // "Java_..._AuthEncode".
  std::string SymbolName() const;
  // The Java method descriptor, "(III...[I)Ljava/lang/String;".
  std::string Descriptor() const;
  std::vector<std::string_view> ArgumentNames() const;
  // Address of the entry point in the loaded library; null while the library lacks it.
  void* EntryPoint() const;
};

inline constexpr std::string_view kSymbolPrefix = "Java_com_brindlex_kernel_quorvane_gatewayjni_";

// All native methods; the one table that vector runners, fuzz targets and thread tests share.
const Export (&AllExports())[kExportCount];

// The row of that name, or null.
const Export* FindExport(std::string_view name);

}  // namespace gateway_tests

#endif  // TESTS_SUPPORT_CALL_TABLE_H_
