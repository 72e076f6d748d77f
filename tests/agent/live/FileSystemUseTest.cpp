//===- FileSystemUseTest.cpp - What a selection reads, and what does not --===//
//
// inotify reports every open of a file in the recorded tree, so these tests
// see exactly which files a selection reads and that reading properties,
// stepping and copying read none.
//
//===----------------------------------------------------------------------===//

#include "LiveSourceTesting.h"
#include "RecordedMachines.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <map>

#include <sys/inotify.h>
#include <unistd.h>

namespace {

using namespace hxlive;

/// Watches every directory of a tree for opened files.
class OpenWatch {
public:
  explicit OpenWatch(const std::string &root)
      : Fd(::inotify_init1(IN_NONBLOCK | IN_CLOEXEC)) {
    EXPECT_GE(Fd, 0);
    watch(root);
    for (const auto &entry :
         std::filesystem::recursive_directory_iterator(root))
      if (entry.is_directory() && !entry.is_symlink())
        watch(entry.path().string());
    // Walking the tree to watch it opened its directories.
    opened();
  }
  OpenWatch(const OpenWatch &) = delete;
  OpenWatch &operator=(const OpenWatch &) = delete;
  ~OpenWatch() { ::close(Fd); }

  /// The files and directories opened since the last call, with how often.
  std::map<std::string, int> opened() {
    std::map<std::string, int> counts;
    alignas(inotify_event) char buffer[65536];
    for (;;) {
      ssize_t got = ::read(Fd, buffer, sizeof buffer);
      if (got <= 0)
        break;
      for (char *at = buffer; at < buffer + got;) {
        const auto *event = reinterpret_cast<const inotify_event *>(at);
        const std::string name = event->len ? event->name : "";
        // A directory's open is reported to its own watch (no name) and to
        // its parent's (with its name); the first is counted.
        if (!((event->mask & IN_ISDIR) && !name.empty()))
          ++counts[Watched[event->wd] + (name.empty() ? "" : "/" + name)];
        at += sizeof(inotify_event) + event->len;
      }
    }
    return counts;
  }

private:
  void watch(const std::string &directory) {
    int wd = ::inotify_add_watch(Fd, directory.c_str(), IN_OPEN);
    if (wd >= 0)
      Watched[wd] = directory;
  }

  int Fd;
  std::map<int, std::string> Watched;
};

bool endsWith(const std::string &text, const std::string &tail) {
  return text.size() >= tail.size() &&
         text.compare(text.size() - tail.size(), tail.size(), tail) == 0;
}

std::string describe(const std::map<std::string, int> &counts) {
  std::string text;
  for (const auto &[path, count] : counts)
    text += "  " + path + " x" + std::to_string(count) + "\n";
  return text;
}

class FileSystemUse : public ::testing::Test {
protected:
  void SetUp() override {
    recordRackServer(Machine);
    HX::useLiveMachine(Machine.root());
  }
  RecordedMachine Machine;
};

TEST_F(FileSystemUse, EachSelectionOpensEveryFileAtMostOnce) {
  for (NodeType type : {SystemNode, ChassisNode, SlotNode, ConnectorNode,
                        NetworkCardNode, StorageControllerNode}) {
    OpenWatch watch(Machine.root());
    HX::Instrumentation cursor;
    cursor.selectNode(type);
    const std::map<std::string, int> opened = watch.opened();

    EXPECT_FALSE(opened.empty()) << nameOf(type);
    for (const auto &[path, count] : opened)
      EXPECT_EQ(count, 1) << nameOf(type) << " opened " << path << " " << count
                          << " times";
  }
}

TEST_F(FileSystemUse, CardSelectionReadsNoFirmwareFiles) {
  nodesOf(NetworkCardNode);
  OpenWatch watch(Machine.root());

  nodesOf(NetworkCardNode);

  for (const auto &[path, count] : watch.opened())
    EXPECT_EQ(path.find("/sys/firmware"), std::string::npos) << path;
}

TEST_F(FileSystemUse, ChassisSelectionReadsOnlyTheFirmwareTable) {
  OpenWatch watch(Machine.root());

  nodesOf(ChassisNode);

  const std::map<std::string, int> opened = watch.opened();
  EXPECT_EQ(
      opened,
      (std::map<std::string, int>{
          {Machine.path("/sys/firmware/dmi/tables/DMI"), 1},
          {Machine.path("/sys/firmware/dmi/tables/smbios_entry_point"), 1}}))
      << describe(opened);
}

TEST_F(FileSystemUse, RepeatedCardSelectionReadsOnlyWhatCanChange) {
  nodesOf(NetworkCardNode);
  OpenWatch watch(Machine.root());

  nodesOf(NetworkCardNode);

  const std::map<std::string, int> opened = watch.opened();
  for (const auto &[path, count] : opened)
    for (const char *unchanging :
         {"/vpd", "/config", "/class", "/vendor", "/device",
          "/subsystem_vendor", "/subsystem_device", "/address",
          "/addr_assign_type", "/pci.ids"})
      EXPECT_FALSE(endsWith(path, unchanging)) << path;
  EXPECT_EQ(opened.count(Machine.path(Machine.devicePath("0000:3b:00.0") +
                                      "/net/ens1f0/flags")),
            1u)
      << describe(opened);
}

TEST_F(FileSystemUse, ReadingStepsAndCopiesDoNotTouchTheFileSystem) {
  for (NodeType type : {SystemNode, ChassisNode, SlotNode, ConnectorNode,
                        NetworkCardNode, StorageControllerNode}) {
    HX::Instrumentation cursor;
    cursor.selectNode(type);
    OpenWatch watch(Machine.root());

    std::vector<SeenNode> nodes;
    for (HX::Instrumentation copy = cursor; copy; ++copy) {
      HX::Instrumentation another(copy);
      nodes.push_back(seen(another));
    }

    EXPECT_FALSE(nodes.empty()) << nameOf(type);
    EXPECT_TRUE(watch.opened().empty()) << nameOf(type);
  }
}

TEST_F(FileSystemUse, ReadingCarriesOnAfterTheTreeIsGone) {
  HX::Instrumentation cursor;
  cursor.selectNode(NetworkCardNode);
  std::filesystem::remove_all(Machine.path("/sys"));

  ASSERT_TRUE(cursor);
  std::string name;
  EXPECT_TRUE(cursor.getProperty(PropNodeName, name));
  EXPECT_EQ(name, "ens1f0");
  EXPECT_EQ(cursor.getNodeDescription(),
            "Intel Corporation Ethernet Controller X710 for 10GbE SFP+");
}

} // namespace
