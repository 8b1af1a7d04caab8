// What the dictionary tells of each decoder's reply, as constant data.
#ifndef TESTS_FUZZ_REPLY_TABLES_H_
#define TESTS_FUZZ_REPLY_TABLES_H_

#include <cstddef>
#include <cstdint>

namespace gateway_fuzz {

inline constexpr size_t kUnbounded = 0;

// A field: its tag, the size of its buffer, and whether blank values are passed over.
struct Field {
  const char* tag;
  size_t bound;
  bool skipBlank;
};

// The answer to a reply that is none.
struct Failure {
  int32_t status;
  const char* text;
};

// What a decoder reads of a reply. Lists of fields end with one that has no tag.
struct Table {
  const char* decoder;
  size_t recordSize;       // of the buffer that a record must fit
  int endMark;             // a record whose 67 is as high ends the list; 0 where none does
  bool endsAtEmptyRecord;  // so does a record that is empty, or too long
  bool onlyFirst;          // reads one record alone
  Field head[16];          // of the whole reply
  Field record[64];
  Failure failures[3];  // a gateway that is down, a broker that is, nothing at all
};

inline constexpr Table kTables[] = {
#include "tests/fuzz/reply_tables.inc"
};

}  // namespace gateway_fuzz

#endif  // TESTS_FUZZ_REPLY_TABLES_H_
