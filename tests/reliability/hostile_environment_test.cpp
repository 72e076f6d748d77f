// A machine and a system that misbehave under the providers: a hardware-tree
// file that changes, vanishes or breaks between requests, a system file that
// cannot be read, a full disk under the logger's file and a log file that
// cannot be opened. The providers still answer, and each problem is reported
// once, however many requests meet it.
#include "AnswerComparison.h"
#include "ProviderHarness.h"
#include "RecordedMachines.h"
#include "ReliabilityMachines.h"
#include "ReliabilitySupport.h"
#include "SyslogRecording.h"

#include <HX/HardwareSource.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <unistd.h>

#include <cstdio>
#include <filesystem>

namespace tvr::reliability {
namespace {

using broker::Response;
using ::testing::HasSubstr;
using ::testing::SizeIs;

constexpr int kRepeats = 3;

/// Logger lines of the hardware sources at level 6000 that mention \p text.
int instrumentationReportsMentioning(const test::LoggerCapture& capture, const std::string& text) {
  int count = 0;
  for (const test::LoggedLine& line : capture.lines())
    if (line.channel == KVLog::Channel::Log && line.category == "TVR.HX.Instrumentation" && line.level == 6000 &&
        line.text.find(text) != std::string::npos)
      ++count;
  return count;
}

int syslogReportsMentioning(const std::string& text) {
  int count = 0;
  for (const std::string& line : syslogTexts()) count += line.find(text) != std::string::npos;
  return count;
}

std::vector<std::string> slotTags(const Response& answer) {
  std::vector<std::string> tags;
  for (const broker::ObjectPath& path : answer.paths())
    if (const broker::Value* tag = path.key("Tag")) tags.push_back(tag->text);
  return tags;
}

/// A directory of its own for one test, removed with what is in it.
class ScratchDirectory {
public:
  ScratchDirectory() {
    std::string pattern = std::filesystem::temp_directory_path().string() + "/tvr-hostile-XXXXXX";
    if (!::mkdtemp(pattern.data())) throw std::runtime_error("cannot create " + pattern);
    path_ = pattern;
  }
  ~ScratchDirectory() {
    std::error_code ignored;
    std::filesystem::remove_all(path_, ignored);
  }
  std::string file(const std::string& name) const { return path_ + "/" + name; }

private:
  std::string path_;
};

class HostileEnvironment : public ::testing::Test {
protected:
  test::ProviderHarness harness;
  test::LoggerCapture capture;
};

// --- The hardware-tree file -------------------------------------------------

TEST_F(HostileEnvironment, TreeFileChangedBetweenRequestsIsReadForTheNextRequest) {
  test::TreeFile tree(kBladeMachine);
  harness.useTreeFile(tree.path());
  ASSERT_THAT(slotTags(harness.enumerateInstanceNames("TVRHX_Slot")), SizeIs(4));

  tree.rewrite(kBladeMachineAfterSwap);

  EXPECT_THAT(slotTags(harness.enumerateInstanceNames("TVRHX_Slot")),
              ::testing::ElementsAre("Mezzanine Slot 1", "PXU Slot 1"));
}

TEST_F(HostileEnvironment, VanishedTreeFileIsAnsweredEmptyAndReportedOnce) {
  test::TreeFile tree(kBladeMachine);
  harness.useTreeFile(tree.path());
  ASSERT_TRUE(harness.enumerateInstanceNames("TVRHX_Slot").ok());

  std::remove(tree.path().c_str());

  for (int i = 0; i < kRepeats; ++i)
    for (const char* className : {"TVRHX_Slot", "TVRHX_Connector", "TVRHX_NetworkCard", "TVRHX_Chassis"}) {
      const Response answer = harness.enumerateInstances(className);
      EXPECT_TRUE(answer.ok()) << className;
      EXPECT_TRUE(answer.done()) << className;
      EXPECT_TRUE(answer.items.empty()) << className;
    }
  EXPECT_EQ(instrumentationReportsMentioning(capture, tree.path()), 1);
}

TEST_F(HostileEnvironment, VanishedTreeFileLeavesPackageInSlotToItsOutOfRangeException) {
  test::TreeFile tree(kBladeMachine);
  harness.useTreeFile(tree.path());
  std::remove(tree.path().c_str());

  const Response answer = harness.enumerateInstanceNames("TVRHX_PackageInSlot");

  ASSERT_TRUE(answer.exception.has_value());
  EXPECT_EQ(answer.exception->type, "std::out_of_range");
  EXPECT_THAT(answer.exception->what, HasSubstr("vector::_M_range_check"));
}

TEST_F(HostileEnvironment, TreeFileCutShortIsAnsweredEmptyReportedOnceAndReadAgainWhenWhole) {
  const std::string whole = kBladeMachine;
  test::TreeFile tree(whole);
  harness.useTreeFile(tree.path());
  tree.rewrite(whole.substr(0, whole.size() / 2));

  for (int i = 0; i < kRepeats; ++i) {
    const Response answer = harness.enumerateInstances("TVRHX_NetworkCard");
    EXPECT_TRUE(answer.ok());
    EXPECT_TRUE(answer.items.empty());
  }
  EXPECT_EQ(instrumentationReportsMentioning(capture, tree.path()), 1);

  tree.rewrite(whole);
  EXPECT_THAT(harness.enumerateInstances("TVRHX_NetworkCard").instances(), SizeIs(3));
}

// --- The live machine's system files ----------------------------------------

/// Replaces the file at \p absolute of \p machine by a directory: a file that
/// exists but cannot be read (also not by root, as the tests may run).
void makeUnreadable(hxlive::RecordedMachine& machine, const std::string& absolute) {
  machine.remove(absolute);
  machine.makeDirectory(absolute);
}

std::size_t networkCardsOf(test::ProviderHarness& harness, const hxlive::RecordedMachine& machine) {
  HX::useLiveMachine(machine.root());
  return harness.enumerateInstances("TVRHX_NetworkCard").instances().size();
}

TEST_F(HostileEnvironment, UnreadableAttributeOfACardLeavesTheCardAnsweredAndIsReportedOnce) {
  hxlive::RecordedMachine intact;
  hxlive::recordRackServer(intact);
  const std::size_t cards = networkCardsOf(harness, intact);
  ASSERT_GT(cards, 0u);
  hxlive::RecordedMachine machine;
  hxlive::recordRackServer(machine);
  makeUnreadable(machine, machine.devicePath("0000:3b:00.0") + "/vendor");
  HX::useLiveMachine(machine.root());

  for (int i = 0; i < kRepeats; ++i) {
    const Response answer = harness.enumerateInstances("TVRHX_NetworkCard");
    EXPECT_TRUE(answer.ok());
    EXPECT_EQ(answer.instances().size(), cards);
  }
  EXPECT_EQ(instrumentationReportsMentioning(capture, "/sys/bus/pci/devices/0000:3b:00.0/vendor: cannot read"), 1);
}

TEST_F(HostileEnvironment, UnreadableSmbiosTableLeavesTheChassisAnsweredAndIsReportedOnce) {
  hxlive::RecordedMachine machine;
  hxlive::recordRackServer(machine);
  const std::string table = "/sys/firmware/dmi/tables/DMI";
  makeUnreadable(machine, table);
  HX::useLiveMachine(machine.root());

  for (int i = 0; i < kRepeats; ++i) {
    const Response answer = harness.enumerateInstances("TVRHX_Chassis");
    EXPECT_TRUE(answer.ok());
    EXPECT_THAT(answer.instances(), SizeIs(1));
  }
  EXPECT_EQ(instrumentationReportsMentioning(capture, machine.path(table)), 1);
}

// --- The logger's file -------------------------------------------------------

class HostileLogFile : public HostileEnvironment {
protected:
  /// The answers of a few requests of every kind, logged to /dev/null.
  std::vector<Response> answersLoggedToNowhere() {
    LoggingEverythingTo nowhere("/dev/null");
    return answers();
  }

  std::vector<Response> answers() {
    return {harness.enumerateInstances("TVRHX_Chassis"), harness.enumerateInstanceNames("TVRHX_Slot"),
            harness.om().associatorNames(harness.enumerateInstanceNames("TVRHX_Chassis").paths().at(0),
                                         broker::AssociationArgs{"TVRHX_SlotOnChassis", {}, {}, {}, {}})};
  }

  void expectSameAnswers(const std::vector<Response>& expected, const std::vector<Response>& actual) {
    ASSERT_EQ(expected.size(), actual.size());
    for (std::size_t i = 0; i < expected.size(); ++i) EXPECT_EQ(answerDifference(expected[i], actual[i]), "");
  }

  ScratchDirectory scratch;
};

TEST_F(HostileLogFile, FullDiskLeavesTheAnswersAsTheyWereAndIsReportedOnce) {
  harness.useTree(kBladeMachine);
  const std::vector<Response> expected = answersLoggedToNowhere();
  const std::string logFile = scratch.file("full-disk.log");
  ASSERT_EQ(::symlink("/dev/full", logFile.c_str()), 0);

  LoggingEverythingTo fullDisk(logFile);
  for (int i = 0; i < kRepeats; ++i) expectSameAnswers(expected, answers());

  EXPECT_EQ(syslogReportsMentioning(logFile), 1);
  EXPECT_EQ(syslogReportsMentioning(logFile + ": No space left on device"), 1);
}

TEST_F(HostileLogFile, LogFileThatCannotBeOpenedLeavesTheAnswersAsTheyWereAndIsReportedOnce) {
  harness.useTree(kBladeMachine);
  const std::vector<Response> expected = answersLoggedToNowhere();
  const std::string logFile = scratch.file("no-such-directory/tvr.log");

  LoggingEverythingTo unopenable(logFile);
  for (int i = 0; i < kRepeats; ++i) expectSameAnswers(expected, answers());

  EXPECT_EQ(syslogReportsMentioning(logFile), 1);
  EXPECT_EQ(syslogReportsMentioning(logFile + ": No such file or directory"), 1);
}

} // namespace
} // namespace tvr::reliability
