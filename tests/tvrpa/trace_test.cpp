// --trace: the request, the logger's lines, the broker's trace lines and
// how each provider ended, on standard error; the answer is unchanged.
#include "TvrpaRun.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>

namespace tvr::test {
namespace {

using ::testing::Contains;
using ::testing::HasSubstr;
using ::testing::StartsWith;

std::size_t indexOf(const std::vector<std::string>& lines, const std::string& prefix) {
  const auto found =
      std::find_if(lines.begin(), lines.end(), [&](const std::string& line) { return line.rfind(prefix, 0) == 0; });
  EXPECT_NE(found, lines.end()) << prefix;
  return static_cast<std::size_t>(found - lines.begin());
}

TEST(TvrpaTrace, ShowsTheRequestTheLoggerLinesAndTheOutcomeInOrder) {
  const ProgramResult r = tvrpa({"ei", "TVRHX_Chassis", "--tree", bladeTree(), "--trace"});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  const std::vector<std::string> lines = linesOf(r.err);
  ASSERT_FALSE(lines.empty());
  EXPECT_EQ(lines.front(), "[tvrpa] EnumerateInstances root/cimv2:TVRHX_Chassis properties=NULL");
  const std::size_t logEnter = indexOf(lines, "[log 3000 Korvane.ChassisProvider] ENTERING: Chassis_EnumInstances()");
  const std::size_t traceEnter =
      indexOf(lines, "[trace 3000 Korvane.ChassisProvider] ENTERING: Chassis_EnumInstances()");
  const std::size_t logExit = indexOf(lines, "[log 3000 Korvane.ChassisProvider] EXITING: Chassis_EnumInstances()");
  const std::size_t outcome = indexOf(lines, "[tvrpa] ChassisProvider (TVRHX_Chassis): CMPI_RC_OK");
  EXPECT_LT(logEnter, traceEnter);
  EXPECT_LT(traceEnter, logExit);
  EXPECT_LT(logExit, outcome);
  EXPECT_EQ(lines.back(), "[tvrpa] 2 items, returnDone called 1 time");
}

TEST(TvrpaTrace, BrokerTraceLinesStandAmongTheLoggerLinesWhereTheProviderMadeThem) {
  const ProgramResult r = tvrpa({"ei", "TVRHX_Chassis", "--tree", bladeTree(), "--trace"});
  const std::vector<std::string> lines = linesOf(r.err);
  const std::size_t madeEnter = indexOf(lines, "[log 3000 Korvane.PhysicalAssetObjFactory] ENTERING: makeChassisInstance()");
  const std::size_t brokerLine =
      indexOf(lines, "[broker 1 PhysicalAssetProvider] *** Returning an instance of Chassis ***");
  const std::size_t handlerExit = indexOf(lines, "[log 3000 Korvane.ChassisProvider] EXITING: Chassis_EnumInstances()");
  EXPECT_LT(madeEnter, brokerLine);
  EXPECT_LT(brokerLine, handlerExit);
}

TEST(TvrpaTrace, LeavesTheAnswerAsItIs) {
  const ProgramResult plain = tvrpa({"ei", "TVRHX_Chassis", "--tree", bladeTree()});
  const ProgramResult traced = tvrpa({"ei", "TVRHX_Chassis", "--tree", bladeTree(), "--trace"});
  EXPECT_EQ(traced.out, plain.out);
}

TEST(TvrpaTrace, WithoutItNothingGoesToStandardError) {
  const ProgramResult r = tvrpa({"ei", "TVRHX_Chassis", "--tree", bladeTree()});
  EXPECT_EQ(r.err, "");
}

TEST(TvrpaTrace, BrokerTraceLinesComeBeforeTheOutcomeOfTheirProvider) {
  const FixtureRegistration fixture(fixtureMachine());
  const ProgramResult r = tvrpa(std::vector<std::string>{"ain", "FIX_Rack.Name=\"R1\"", "--trace"} + fixture.args());
  const std::vector<std::string> lines = linesOf(r.err);
  EXPECT_EQ(lines.front(), "[tvrpa] AssociatorNames root/cimv2:FIX_Rack.Name=\"R1\" assocClass=NULL resultClass=NULL "
                           "role=NULL resultRole=NULL (every association provider, each with its own class)");
  EXPECT_LT(indexOf(lines, "[broker 1 FixHolds] AssociatorNames"),
            indexOf(lines, "[tvrpa] FixHolds (FIX_Holds): CMPI_RC_OK"));
  EXPECT_THAT(lines, Contains("[tvrpa] FixPlugs (FIX_Plugs): CMPI_RC_OK"));
  EXPECT_EQ(lines.back(), "[tvrpa] 1 item, returnDone called 0 times");
}

TEST(TvrpaTrace, NamesAFailingProvidersStatus) {
  const FixtureRegistration broken({{"FIX_Broken", "FixFailing", "instance"}});
  const ProgramResult r = tvrpa(std::vector<std::string>{"ein", "FIX_Broken", "--trace"} + broken.args());
  EXPECT_THAT(linesOf(r.err),
              Contains("[tvrpa] FixFailing (FIX_Broken): CMPI_RC_ERR_NOT_FOUND: the fixture has nothing here"));
}

TEST(TvrpaTrace, InventoryTracesOneRequestPerClass) {
  const FixtureRegistration fixture(fixtureMachine());
  const ProgramResult r = tvrpa(std::vector<std::string>{"inventory", "--trace"} + fixture.args());
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  std::vector<std::string> requests;
  for (const std::string& line : linesOf(r.err))
    if (line.rfind("[tvrpa] EnumerateInstances ", 0) == 0) requests.push_back(line);
  EXPECT_EQ(requests, (std::vector<std::string>{"[tvrpa] EnumerateInstances root/cimv2:FIX_Rack properties=NULL",
                                                "[tvrpa] EnumerateInstances root/cimv2:FIX_Card properties=NULL",
                                                "[tvrpa] EnumerateInstances root/cimv2:FIX_Holds properties=NULL",
                                                "[tvrpa] EnumerateInstances root/cimv2:FIX_Plugs properties=NULL"}));
}

} // namespace
} // namespace tvr::test
