// The configuration file format: tvr::settings::parseConfig.

#include "TVR/Settings.h"

#include <fstream>
#include <iterator>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::settings {

// Printed by gtest when an expectation on entries fails.
void PrintTo(const ConfigEntry& entry, std::ostream* out) {
  *out << "{" << entry.key << " = \"" << entry.value << "\" at line " << entry.line << "}";
}

namespace {

using ::testing::ElementsAre;
using ::testing::Field;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using ::testing::StartsWith;

::testing::Matcher<const ConfigEntry&> entry(const std::string& key, const std::string& value,
                                             int line) {
  return ::testing::AllOf(Field(&ConfigEntry::key, key), Field(&ConfigEntry::value, value),
                          Field(&ConfigEntry::line, line));
}

TEST(ConfigParser, ReadsOneEntryPerLine) {
  const ParseResult result = parseConfig("A = 1\nB=two\n");
  EXPECT_THAT(result.entries, ElementsAre(entry("A", "1", 1), entry("B", "two", 2)));
  EXPECT_THAT(result.errors, IsEmpty());
}

TEST(ConfigParser, EmptyTextHasNoEntries) {
  const ParseResult result = parseConfig("");
  EXPECT_THAT(result.entries, IsEmpty());
  EXPECT_THAT(result.errors, IsEmpty());
}

TEST(ConfigParser, DropsBlanksAroundKeyAndValue) {
  const ParseResult result = parseConfig("  KEY \t=   some value \t");
  EXPECT_THAT(result.entries, ElementsAre(entry("KEY", "some value", 1)));
}

TEST(ConfigParser, SkipsCommentsAndBlankLines) {
  const ParseResult result = parseConfig("# a comment\n\n   \n   # indented comment\nK = v\n");
  EXPECT_THAT(result.entries, ElementsAre(entry("K", "v", 5)));
  EXPECT_THAT(result.errors, IsEmpty());
}

TEST(ConfigParser, HashInsideValueIsPartOfIt) {
  EXPECT_THAT(parseConfig("K = a # b").entries, ElementsAre(entry("K", "a # b", 1)));
}

TEST(ConfigParser, EqualsSignInsideValueIsPartOfIt) {
  EXPECT_THAT(parseConfig("K = a=b").entries, ElementsAre(entry("K", "a=b", 1)));
}

TEST(ConfigParser, EmptyValueIsAllowed) {
  EXPECT_THAT(parseConfig("K =").entries, ElementsAre(entry("K", "", 1)));
}

TEST(ConfigParser, QuotedValueKeepsItsBlanks) {
  EXPECT_THAT(parseConfig("K = \"  spaced  \"").entries, ElementsAre(entry("K", "  spaced  ", 1)));
}

TEST(ConfigParser, QuotedValueMayBeEmpty) {
  EXPECT_THAT(parseConfig("K = \"\"").entries, ElementsAre(entry("K", "", 1)));
}

TEST(ConfigParser, QuotedValueKeepsHashAndInnerQuotesVerbatim) {
  EXPECT_THAT(parseConfig("K = \"# not a \\ comment\"").entries,
              ElementsAre(entry("K", "# not a \\ comment", 1)));
}

TEST(ConfigParser, QuoteInsideUnquotedValueIsKept) {
  EXPECT_THAT(parseConfig("K = say \"hi\"").entries, ElementsAre(entry("K", "say \"hi\"", 1)));
}

TEST(ConfigParser, AcceptsCrLfLineEnds) {
  EXPECT_THAT(parseConfig("A = 1\r\nB = \"x\"\r\n").entries,
              ElementsAre(entry("A", "1", 1), entry("B", "x", 2)));
}

TEST(ConfigParser, RepeatedKeyGivesAnEntryPerLine) {
  EXPECT_THAT(parseConfig("K = 1\nK = 2\n").entries,
              ElementsAre(entry("K", "1", 1), entry("K", "2", 2)));
}

TEST(ConfigParser, MalformedLineIsReportedWithItsNumberAndOtherLinesKept) {
  const ParseResult result = parseConfig("A = 1\nthis is not an entry\nB = 2\n");
  EXPECT_THAT(result.entries, ElementsAre(entry("A", "1", 1), entry("B", "2", 3)));
  ASSERT_EQ(result.errors.size(), 1u);
  EXPECT_EQ(result.errors[0].line, 2);
  EXPECT_THAT(result.errors[0].message, StartsWith("line 2: "));
}

TEST(ConfigParser, EachMalformedLineIsReported) {
  const ParseResult result = parseConfig("bad\nA = 1\nalso bad\n");
  ASSERT_EQ(result.errors.size(), 2u);
  EXPECT_EQ(result.errors[0].line, 1);
  EXPECT_EQ(result.errors[1].line, 3);
}

TEST(ConfigParser, LineWithoutKeyIsMalformed) {
  const ParseResult result = parseConfig("= value");
  EXPECT_THAT(result.entries, IsEmpty());
  ASSERT_EQ(result.errors.size(), 1u);
  EXPECT_THAT(result.errors[0].message, HasSubstr("key"));
}

TEST(ConfigParser, KeyStartingWithDigitIsMalformed) {
  const ParseResult result = parseConfig("1KEY = value");
  EXPECT_THAT(result.entries, IsEmpty());
  EXPECT_EQ(result.errors.size(), 1u);
}

TEST(ConfigParser, KeyWithBlankInsideIsMalformed) {
  const ParseResult result = parseConfig("MY KEY = value");
  EXPECT_THAT(result.entries, IsEmpty());
  EXPECT_EQ(result.errors.size(), 1u);
}

TEST(ConfigParser, UnterminatedQuoteIsMalformed) {
  const ParseResult result = parseConfig("K = \"open");
  EXPECT_THAT(result.entries, IsEmpty());
  ASSERT_EQ(result.errors.size(), 1u);
  EXPECT_THAT(result.errors[0].message, HasSubstr("closing"));
}

TEST(ConfigParser, TextAfterClosingQuoteIsMalformed) {
  const ParseResult result = parseConfig("K = \"a\" b");
  EXPECT_THAT(result.entries, IsEmpty());
  EXPECT_EQ(result.errors.size(), 1u);
}

TEST(ConfigParser, ShippedDefaultFileSetsNothingAndNamesEveryKey) {
  const std::string text = [] {
    std::ifstream in(TVR_SHIPPED_CONFIG_FILE);
    return std::string(std::istreambuf_iterator<char>(in), {});
  }();
  ASSERT_FALSE(text.empty()) << "cannot read " << TVR_SHIPPED_CONFIG_FILE;
  const ParseResult result = parseConfig(text);
  EXPECT_THAT(result.entries, IsEmpty());
  EXPECT_THAT(result.errors, IsEmpty());
  for (const char* key : {"HX_HARDWARE_TREE", "HX_FS_ROOT", "KVLOG_LOG", "KVLOG_LOG_LEVEL",
                          "KVLOG_TRACE", "KVLOG_TRACE_LEVEL"})
    EXPECT_THAT(text, HasSubstr(std::string("\n#") + key + " =")) << key;
}

} // namespace
} // namespace tvr::settings
