// A reply of more than half a gigabyte, as no gateway sends it: its pages are one and the same.

#include <gtest/gtest.h>
#include <sys/mman.h>
#include <unistd.h>

#include <cstring>
#include <string_view>

#include "gateway/stock/gateway_stk.h"

namespace gateway_tests {
namespace {

constexpr size_t kBlock = size_t{1} << 20;

// A terminated text of `blocks` times kBlock bytes: it begins with `head` and ends with `tail`,
// with nothing but 'x' between.
class CLongText {
 public:
  CLongText(std::string_view head, std::string_view tail, size_t blocks)
      : m_nSize(blocks * kBlock) {
    const int file = memfd_create("long text", 0);
    if (file < 0 || ftruncate(file, kBlock) != 0) return;
    void* const room = mmap(nullptr, m_nSize, PROT_NONE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
    if (room == MAP_FAILED) return;
    char* const text = static_cast<char*>(room);
    for (size_t i = 0; i < blocks; ++i) {
      // The first block and the last are copies of their own.
      const int share = i == 0 || i == blocks - 1 ? MAP_PRIVATE : MAP_SHARED;
      if (mmap(text + i * kBlock, kBlock, PROT_READ | PROT_WRITE, share | MAP_FIXED, file, 0) ==
          MAP_FAILED) {
        return;
      }
    }
    close(file);
    memset(text + kBlock, 'x', kBlock);
    memcpy(text, head.data(), head.size());
    char* const end = text + m_nSize - 1;
    memcpy(end - tail.size(), tail.data(), tail.size());
    *end = '\0';
    m_pText = text;
  }
  ~CLongText() { munmap(m_pText, m_nSize); }
  CLongText(const CLongText&) = delete;
  CLongText& operator=(const CLongText&) = delete;

  // Null when the machine did not give it.
  const char* Text() const { return m_pText; }

 private:
  size_t m_nSize;
  char* m_pText = nullptr;
};

TEST(LongReplies, PositionsAreListedFromAReplyOfAnySize) {
  const CLongText reply("|00=|67=1|68=0000|29=2330|75=7|01=|", "|00=|67=900000|68=0000|01=", 600);
  ASSERT_NE(reply.Text(), nullptr);
  CGatewayStk gateway;
  int status = 0;
  const char* const result = gateway.QueryInventoryDecode(reply.Text(), &status);
  EXPECT_EQ(status, 1);
  EXPECT_STREQ(result, "<0>!1!2330@7|0!<1>!0!<2>!0!<3>!0!");
}

}  // namespace
}  // namespace gateway_tests
