// Inputs with which the fuzz targets (fuzz/) broke a promise of the code they
// feed, pinned here after the fix so that every build checks them, not only
// the fuzz build.
#include "ProviderHarness.h"

#include "tvr/broker/PathText.h"

#include <HX/HardwareSource.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::reliability {
namespace {

using broker::ObjectPath;
using broker::parseObjectPath;
using ::testing::HasSubstr;
using ::testing::StartsWith;

// --- The hardware-tree file reader (tree_file_fuzzer) ------------------------

/// A tree whose only fault is a number too large for any number type.
const char* const kTreeWithAHugeNumber = R"({"nodes": [{"type": "SlotNode", "name": "S", "status": 1e400}]})";

TEST(TreeFileFinding, NumberBeyondEveryNumberTypeIsRefusedLikeAnyBrokenFile) {
  test::TreeFile tree(kTreeWithAHugeNumber);

  const std::optional<std::string> refusal = HX::checkHardwareTree(tree.path());

  ASSERT_TRUE(refusal.has_value());
  EXPECT_THAT(*refusal, StartsWith(tree.path() + ": "));
  EXPECT_THAT(*refusal, HasSubstr("1e400"));
}

TEST(TreeFileFinding, TreeRewrittenWithANumberBeyondEveryNumberTypeIsRefusedNotServedFromTheOldFile) {
  test::ProviderHarness harness;
  test::LoggerCapture capture;
  test::TreeFile tree(R"({"nodes": [{"type": "SlotNode", "name": "Old Slot"}]})");
  harness.useTreeFile(tree.path());
  ASSERT_EQ(harness.enumerateInstanceNames("TVRHX_Slot").paths().size(), 1u);

  tree.rewrite(kTreeWithAHugeNumber);

  for (int i = 0; i < 3; ++i) {
    const broker::Response answer = harness.enumerateInstanceNames("TVRHX_Slot");
    EXPECT_TRUE(answer.ok());
    EXPECT_TRUE(answer.paths().empty()) << "request " << i;
  }
  int refusals = 0;
  for (const std::string& text : capture.texts(KVLog::Channel::Log)) refusals += text.find("1e400") != std::string::npos;
  EXPECT_EQ(refusals, 1);
}

// --- The object path text form (object_path_fuzzer) --------------------------

std::optional<ObjectPath> readBack(const ObjectPath& path) {
  return parseObjectPath(broker::formatObjectPath(path, broker::PathFormat{true, true}));
}

TEST(ObjectPathFinding, MinusZeroIsReadAsTheNumberZeroAndReadsBackAsIt) {
  const std::optional<ObjectPath> path = parseObjectPath("C.K=-0");

  ASSERT_TRUE(path.has_value());
  EXPECT_EQ(*path->key("K"), broker::Value::uint64(0));
  EXPECT_EQ(readBack(*path), path);
}

TEST(ObjectPathFinding, NotANumberIsNoKeyValue) {
  broker::PathParseError error;

  EXPECT_FALSE(parseObjectPath("C.K=nan(e)", &error).has_value());
  EXPECT_EQ(error.column, 5u);
}

TEST(ObjectPathFinding, BareValueWithANulByteInsideIsNoNumber) {
  const std::string text("C.K=1\0x", 7);

  EXPECT_FALSE(parseObjectPath(text).has_value());
}

TEST(ObjectPathFinding, EmptyHostNameIsRefused) {
  broker::PathParseError error;

  EXPECT_FALSE(parseObjectPath("///root:C", &error).has_value());
  EXPECT_EQ(error.message, "empty host name after '//'");
  EXPECT_EQ(error.column, 3u);
}

TEST(ObjectPathFinding, NamespaceStartingWithASlashIsRefused) {
  broker::PathParseError error;

  EXPECT_FALSE(parseObjectPath("//h///:C", &error).has_value());
  EXPECT_EQ(error.message, "a namespace cannot start with '/'");
  EXPECT_FALSE(parseObjectPath("/x:C").has_value());
}

TEST(ObjectPathFinding, NamespaceWithSlashesInsideReadsBack) {
  const std::optional<ObjectPath> path = parseObjectPath("//h/root//cimv2/:C");

  ASSERT_TRUE(path.has_value());
  EXPECT_EQ(path->nameSpace, "root//cimv2/");
  EXPECT_EQ(readBack(*path), path);
}

} // namespace
} // namespace tvr::reliability
