// The library's exports against the table of native methods.

#include <gtest/gtest.h>

#include <set>
#include <string>

#include "tests/support/call_table.h"

namespace gateway_tests {
namespace {

TEST(ExportTable, HoldsEachMethodOnce) {
  std::set<std::string_view> names;
  int decoders = 0;
  for (const Export& row : AllExports()) {
    EXPECT_TRUE(names.insert(row.name).second) << row.name;
    decoders += row.IsDecoder() ? 1 : 0;
  }
  EXPECT_EQ(names.size(), 59U);
  EXPECT_EQ(decoders, 27);
}

TEST(ExportTable, DerivesTheJavaDescriptor) {
  EXPECT_EQ(FindExport("AuthDecode")->Descriptor(), "(Ljava/lang/String;[I)Ljava/lang/String;");
  EXPECT_EQ(FindExport("SubmitOrderEncode2")->Descriptor(),
            "(IIILjava/lang/String;Ljava/lang/String;Ljava/lang/String;Ljava/lang/String;"
            "Ljava/lang/String;BB)Ljava/lang/String;");
  EXPECT_EQ(FindExport("QueryOrderDecode")->shape, "iSs");
  EXPECT_EQ(FindExport("FutSubmitOrderEncode1")->shape, "iiiSSSSSSSSSSSSSSSbbbcccccciiis");
}

TEST(ExportTable, EachMethodIsExported) {
  std::string missing;
  for (const Export& row : AllExports()) {
    if (row.EntryPoint() == nullptr) missing.append(" ").append(row.name);
  }
  EXPECT_EQ(missing, "");
}

}  // namespace
}  // namespace gateway_tests
