// KVLog::KVMessageBuffer: accumulating text and handing it out per str().

#include "KVLog/KVMessageBuffer.h"

#include <iomanip>
#include <locale>
#include <ostream>
#include <sstream>
#include <string>

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

TEST(KVMessageBuffer, PaddedPointersPrintAsTheStreamPrintsThem) {
  int value = 0;
  const void* address = &value;
  std::ostringstream expected;
  expected << std::setw(24) << std::setfill('*') << address << '|' << std::left << std::setw(4) << nullptr;

  KVMessageBuffer buffer;
  std::ostream& out = buffer;
  EXPECT_EQ(buffer.str(out << std::setw(24) << std::setfill('*') << address << '|' << std::left << std::setw(4)
                           << nullptr),
            expected.str());
}

TEST(KVMessageBuffer, BufferMadeAfterAnotherIsDestroyedStartsAsANewOne) {
  {
    KVMessageBuffer used;
    std::ostream& out = used;
    out << std::hex << std::showbase << std::setfill('#') << std::setw(9) << "unfinished";
    out.setstate(std::ios_base::failbit);
  }
  KVMessageBuffer next;
  std::ostream& out = next;
  EXPECT_TRUE(out.good());
  EXPECT_EQ(next.str(out << 255 << ' ' << std::setw(4) << 7), "255    7");
}

TEST(KVMessageBuffer, LongTextComesOutWhole) {
  const std::string line(5000, 'x');
  KVMessageBuffer buffer;
  EXPECT_EQ(buffer.str(buffer << "<" << line.c_str() << ">"), "<" + line + ">");
}

/// Digit grouping in threes, as some locales have it.
struct GroupingInThrees : std::numpunct<char> {
  char do_thousands_sep() const override { return ','; }
  std::string do_grouping() const override { return "\3"; }
};

TEST(KVMessageBuffer, NumbersAndPointersFollowTheGlobalLocaleOfTheirTime) {
  int value = 0;
  const void* address = &value;
  const std::locale previous = std::locale::global(std::locale(std::locale::classic(), new GroupingInThrees));
  std::ostringstream expected;
  expected << 1234567 << ' ' << address;
  KVMessageBuffer grouped;
  std::ostream& groupedOut = grouped;
  const std::string groupedText = grouped.str(groupedOut << 1234567 << ' ' << address);
  std::locale::global(previous);

  EXPECT_EQ(groupedText, expected.str());
  KVMessageBuffer plain;
  std::ostream& plainOut = plain;
  EXPECT_EQ(plain.str(plainOut << 1234567), "1234567");
}

} // namespace
