// KVLog::KVMessageBuffer: accumulating text and handing it out per str().

#include "KVLog/KVMessageBuffer.h"

#include <ostream>
#include <sstream>

#include <gtest/gtest.h>

namespace {

using KVLog::KVMessageBuffer;

TEST(KVMessageBuffer, StrGivesTextInsertedSinceConstruction) {
  KVMessageBuffer buffer;
  EXPECT_EQ(buffer.str(buffer << "alpha" << ", " << "beta"), "alpha, beta");
}

TEST(KVMessageBuffer, StrOnNewBufferIsEmpty) {
  KVMessageBuffer buffer;
  EXPECT_EQ(buffer.str(buffer), "");
}

TEST(KVMessageBuffer, StrGivesOnlyTextInsertedSinceThePreviousStr) {
  KVMessageBuffer buffer;
  buffer << "first";
  EXPECT_EQ(buffer.str(buffer), "first");
  buffer << "second";
  EXPECT_EQ(buffer.str(buffer), "second");
  EXPECT_EQ(buffer.str(buffer), "");
}

TEST(KVMessageBuffer, SameListInsertedTwiceGivesSameTextTwice) {
  // A caller builds the parameter list once per channel.
  KVMessageBuffer buffer;
  std::ostream& out = buffer;
  const std::string forLog = buffer.str(out << 10 << ' ' << std::hex << 255 << std::showbase);
  const std::string forTrace = buffer.str(out << 10 << ' ' << std::hex << 255 << std::showbase);
  EXPECT_EQ(forLog, "10 ff");
  EXPECT_EQ(forTrace, "10 ff");
}

TEST(KVMessageBuffer, StrRestoresWidthPrecisionAndFill) {
  KVMessageBuffer buffer;
  std::ostream& out = buffer;
  out.width(8);
  out.fill('*');
  out.precision(2);
  buffer.str(out << 1.2345);
  EXPECT_EQ(buffer.str(out << 1.2345 << 'x'), "1.2345x");
}

TEST(KVMessageBuffer, StreamInsertionAndTextInsertionShareOneAccumulation) {
  KVMessageBuffer buffer;
  std::ostream& out = buffer;
  buffer << "count=";
  out << 42;
  buffer << ";";
  EXPECT_EQ(buffer.str(out), "count=42;");
}

TEST(KVMessageBuffer, NullTextFailsTheStream) {
  KVMessageBuffer buffer;
  std::ostream& out = buffer;
  const char* missing = nullptr;
  buffer << "a" << missing;
  EXPECT_TRUE(out.bad());
}

TEST(KVMessageBuffer, NullTextDropsTheRestOfTheList) {
  KVMessageBuffer buffer;
  std::ostream& out = buffer;
  const char* missing = nullptr;
  buffer << "a" << missing << "b";
  out << 7;
  EXPECT_EQ(buffer.str(buffer << "c"), "a");
}

TEST(KVMessageBuffer, StrAfterNullTextStartsClean) {
  KVMessageBuffer buffer;
  std::ostream& out = buffer;
  const char* missing = nullptr;
  buffer.str(buffer << "a" << missing);
  EXPECT_TRUE(out.good());
  EXPECT_EQ(buffer.str(buffer << "b" << "c"), "bc");
}

TEST(KVMessageBuffer, PointersPrintAsTheStreamPrintsThem) {
  int value = 0;
  const void* address = &value;
  const void* none = nullptr;
  std::ostringstream expected;
  expected << address << ' ' << none;

  KVMessageBuffer buffer;
  std::ostream& out = buffer;
  EXPECT_EQ(buffer.str(out << address << ' ' << none), expected.str());
}

TEST(KVMessageBuffer, ReturnedTextIsUnaffectedByLaterInsertions) {
  KVMessageBuffer buffer;
  const std::string& taken = buffer.str(buffer << "kept");
  buffer << "later";
  EXPECT_EQ(taken, "kept");
}

TEST(KVMessageBuffer, BuffersAreIndependent) {
  KVMessageBuffer first;
  KVMessageBuffer second;
  first << "one";
  second << "two";
  EXPECT_EQ(first.str(first), "one");
  EXPECT_EQ(second.str(second), "two");
}

} // namespace
