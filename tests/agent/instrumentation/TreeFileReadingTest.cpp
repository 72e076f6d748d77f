//===- TreeFileReadingTest.cpp - When and how a tree file is read ---------===//
//
// A tree file is read again when it changes or is replaced, kept while it
// stays the same, loads at sizes the providers' tests use, and serves
// cursors on several threads at once.
//
//===----------------------------------------------------------------------===//

#include "HX/HardwareSource.h"
#include "HX/Instrumentation.h"

#include "ScratchDirectory.h"

#include <gtest/gtest.h>

#include <atomic>
#include <cstdio>
#include <string>
#include <thread>

#include <fcntl.h>
#include <sys/stat.h>

namespace {

using namespace HX::NodeLexicon;
using HX::Instrumentation;

std::string slotNamed(const std::string &name) {
  return R"({"nodes": [{"type": "SlotNode", "name": ")" + name + R"("}]})";
}

std::string firstSlotName() {
  Instrumentation cursor;
  cursor.selectNode(SlotNode);
  std::string name = "(none)";
  cursor.getProperty(PropNodeName, name);
  return name;
}

void setModificationTime(const std::string &path, time_t seconds, long nanos) {
  const timespec times[2] = {{seconds, nanos}, {seconds, nanos}};
  ASSERT_EQ(::utimensat(AT_FDCWD, path.c_str(), times, 0), 0);
}

class TreeFileReadingTest : public ::testing::Test {
protected:
  hxtest::ScratchDirectory Scratch;
};

TEST_F(TreeFileReadingTest, FileRewrittenInPlaceIsReadAtTheNextSelect) {
  const std::string path = Scratch.write("t.json", slotNamed("First"));
  HX::useHardwareTree(path);
  ASSERT_EQ(firstSlotName(), "First");

  Scratch.write("t.json", slotNamed("Second, longer"));

  EXPECT_EQ(firstSlotName(), "Second, longer");
}

TEST_F(TreeFileReadingTest, SameSizeRewriteWithNewTimestampIsRead) {
  const std::string path = Scratch.write("t.json", slotNamed("AAAA"));
  setModificationTime(path, 1700000000, 1);
  HX::useHardwareTree(path);
  ASSERT_EQ(firstSlotName(), "AAAA");

  Scratch.write("t.json", slotNamed("BBBB"));
  setModificationTime(path, 1700000000, 2);

  EXPECT_EQ(firstSlotName(), "BBBB");
}

TEST_F(TreeFileReadingTest, FileReplacedByRenameIsReadAtTheNextSelect) {
  const std::string path = Scratch.write("t.json", slotNamed("Old"));
  HX::useHardwareTree(path);
  ASSERT_EQ(firstSlotName(), "Old");

  const std::string staged = Scratch.write("staged.json", slotNamed("New"));
  ASSERT_EQ(std::rename(staged.c_str(), path.c_str()), 0);

  EXPECT_EQ(firstSlotName(), "New");
}

TEST_F(TreeFileReadingTest, BrokenFileRepairedIsReadAgain) {
  const std::string path = Scratch.write("t.json", R"({"nodes": [}")");
  HX::useHardwareTree(path);
  Instrumentation cursor;
  EXPECT_THROW(cursor.selectNode(SlotNode), HX::InstrumentationError);

  Scratch.write("t.json", slotNamed("Repaired"));

  EXPECT_EQ(firstSlotName(), "Repaired");
}

TEST_F(TreeFileReadingTest, FileRemovedAfterUseMakesSelectNodeThrow) {
  const std::string path = Scratch.write("t.json", slotNamed("Here"));
  HX::useHardwareTree(path);
  ASSERT_EQ(firstSlotName(), "Here");

  ASSERT_EQ(std::remove(path.c_str()), 0);

  Instrumentation cursor;
  EXPECT_THROW(cursor.selectNode(SlotNode), HX::InstrumentationError);
}

/// One root slot holding \p children unnamed slots: children + 1 nodes.
std::string wideTree(unsigned children) {
  std::string json = R"({"nodes": [{"type": "SlotNode", "children": [)";
  for (unsigned i = 0; i < children; ++i)
    json += i == 0 ? R"({"type": "SlotNode"})" : R"(,{"type": "SlotNode"})";
  return json + "]}]}";
}

TEST_F(TreeFileReadingTest, TreeOf65537NodesLoadsAndWalksEveryNode) {
  HX::useHardwareTree(Scratch.write("big.json", wideTree(65536)));
  Instrumentation cursor;
  std::size_t walked = 0;
  std::string lastPath;

  for (cursor.selectNode(SlotNode); cursor; ++cursor) {
    ++walked;
    lastPath = cursor.getPathToNode();
  }

  EXPECT_EQ(walked, 65537u);
  EXPECT_EQ(cursor.convertPathToString(lastPath), "/SlotNode#0/SlotNode#65535");
}

TEST_F(TreeFileReadingTest, UnchangedFileIsNotParsedAgain) {
  HX::useHardwareTree(Scratch.write("big.json", wideTree(999)));
  Instrumentation cursor;
  cursor.selectNode(SlotNode);
  const std::uint64_t readsAfterFirst = HX::hardwareTreeReads();
  for (int i = 0; i < 20; ++i)
    cursor.selectNode(SlotNode);
  EXPECT_EQ(HX::hardwareTreeReads(), readsAfterFirst);
  EXPECT_TRUE(cursor);
}

TEST_F(TreeFileReadingTest, ChangedFileIsReadOnceAtTheNextSelection) {
  const std::string path = Scratch.write("t.json", wideTree(3));
  HX::useHardwareTree(path);
  Instrumentation cursor;
  cursor.selectNode(SlotNode);
  const std::uint64_t before = HX::hardwareTreeReads();
  Scratch.write("t.json", wideTree(4));
  cursor.selectNode(SlotNode);
  cursor.selectNode(SlotNode);
  EXPECT_EQ(HX::hardwareTreeReads(), before + 1);
}

TEST_F(TreeFileReadingTest, CursorsOnTwoThreadsWalkOneFileIndependently) {
  HX::useHardwareTree(Scratch.write("t.json", wideTree(999)));
  std::atomic<int> wrongWalks{0};

  auto walkRepeatedly = [&wrongWalks] {
    for (int round = 0; round < 200; ++round) {
      Instrumentation cursor;
      std::size_t walked = 0;
      for (cursor.selectNode(SlotNode); cursor; ++cursor) {
        std::string path = cursor.convertPathToString(cursor.getPathToNode());
        if (path.empty())
          ++wrongWalks;
        ++walked;
      }
      if (walked != 1000)
        ++wrongWalks;
    }
  };
  std::thread first(walkRepeatedly);
  std::thread second(walkRepeatedly);
  first.join();
  second.join();

  EXPECT_EQ(wrongWalks.load(), 0);
}

TEST_F(TreeFileReadingTest, CursorsOnTwoThreadsSurviveTheFileChangingUnderThem) {
  const std::string path = Scratch.write("t.json", wideTree(99));
  HX::useHardwareTree(path);
  std::atomic<bool> done{false};
  std::atomic<int> wrongWalks{0};

  std::thread walker([&] {
    while (!done) {
      Instrumentation cursor;
      std::size_t walked = 0;
      try {
        for (cursor.selectNode(SlotNode); cursor; ++cursor)
          ++walked;
      } catch (const HX::InstrumentationError &) {
        ++wrongWalks; // a rename never exposes a half-written file
        continue;
      }
      if (walked != 100 && walked != 200)
        ++wrongWalks;
    }
  });
  for (int round = 0; round < 50; ++round) {
    const std::string staged =
        Scratch.write("staged.json", wideTree(round % 2 ? 99 : 199));
    EXPECT_EQ(std::rename(staged.c_str(), path.c_str()), 0);
  }
  done = true;
  walker.join();

  EXPECT_EQ(wrongWalks.load(), 0);
}

} // namespace
