// --help on the tool and on each command, and the manual page written from
// the same text.
#include "TvrpaRun.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <fstream>
#include <sstream>

namespace tvr::test {
namespace {

using ::testing::HasSubstr;
using ::testing::Not;
using ::testing::StartsWith;

const std::vector<std::string> kCommands = {"ei", "ein", "gi", "ai", "ain", "ri", "rin", "inventory", "classes"};

TEST(TvrpaHelp, ToolHelpListsEveryCommandAndOption) {
  const ProgramResult r = tvrpa({"--help"});
  EXPECT_EQ(r.exitStatus, 0);
  EXPECT_THAT(r.out, StartsWith("Usage: tvrpa COMMAND [ARGUMENTS] [OPTIONS]\n"));
  for (const std::string& c : kCommands) EXPECT_THAT(r.out, HasSubstr("\n  " + c + " ")) << c;
  for (const char* option : {"--tree FILE", "--namespace NS", "--format FORMAT", "--properties a,b,c",
                             "--assoc-class CLASS", "--result-class CLASS", "--role ROLE", "--result-role ROLE",
                             "--trace", "--registration FILE", "--provider-library PATH"})
    EXPECT_THAT(r.out, HasSubstr(option)) << option;
  EXPECT_THAT(r.out, HasSubstr("Exit status:"));
  EXPECT_EQ(r.err, "");
}

TEST(TvrpaHelp, EachCommandHasItsOwnHelpWithExamples) {
  for (const std::string& c : kCommands) {
    const ProgramResult r = tvrpa({c, "--help"});
    EXPECT_EQ(r.exitStatus, 0) << c;
    EXPECT_THAT(r.out, StartsWith("Usage: tvrpa " + c)) << c;
    EXPECT_THAT(r.out, HasSubstr("Examples:\n  tvrpa " + c)) << c;
  }
}

TEST(TvrpaHelp, CommandHelpListsOnlyTheOptionsTheCommandTakes) {
  const ProgramResult ai = tvrpa({"ai", "--help"});
  EXPECT_THAT(ai.out, HasSubstr("--result-role ROLE"));
  const ProgramResult ri = tvrpa({"ri", "--help"});
  EXPECT_THAT(ri.out, Not(HasSubstr("--result-role")));
  const ProgramResult ein = tvrpa({"ein", "--help"});
  EXPECT_THAT(ein.out, Not(HasSubstr("--properties")));
}

TEST(TvrpaHelp, HelpCommandGivesTheSameTextAsTheOption) {
  EXPECT_EQ(tvrpa({"help", "gi"}).out, tvrpa({"gi", "--help"}).out);
  EXPECT_EQ(tvrpa({"help"}).out, tvrpa({"--help"}).out);
}

TEST(TvrpaHelp, HelpWinsOverAnUnfinishedCommandLine) {
  const ProgramResult r = tvrpa({"ai", "--assoc-class", "X", "--bogus", "--help"});
  EXPECT_EQ(r.exitStatus, 0);
  EXPECT_THAT(r.out, StartsWith("Usage: tvrpa ai PATH"));
}

TEST(TvrpaHelp, HelpOnAnUnknownCommandIsAUsageError) {
  const ProgramResult r = tvrpa({"help", "frobnicate"});
  EXPECT_EQ(r.exitStatus, 1);
  EXPECT_THAT(r.err, HasSubstr("no help on 'frobnicate'"));
}

TEST(TvrpaHelp, ManualPageIsRoffOfTheSameText) {
  const ProgramResult r = tvrpa({"--man"});
  EXPECT_EQ(r.exitStatus, 0);
  EXPECT_THAT(r.out, HasSubstr(".TH TVRPA 1 "));
  EXPECT_THAT(r.out, HasSubstr(".SH SYNOPSIS\n"));
  EXPECT_THAT(r.out, HasSubstr(".SH \"EXIT STATUS\"\n"));
  for (const std::string& c : kCommands) EXPECT_THAT(r.out, HasSubstr(".SS \"" + c)) << c;
  // Option names are escaped for roff, so they do not break into hyphens.
  EXPECT_THAT(r.out, HasSubstr("\\-\\-assoc\\-class"));
  EXPECT_THAT(r.out, Not(HasSubstr(" --assoc-class")));
}

TEST(TvrpaHelp, BuildWritesTheManualPageTheToolPrints) {
  std::ifstream in(TVRPA_MAN_PAGE);
  ASSERT_TRUE(in) << TVRPA_MAN_PAGE;
  std::ostringstream page;
  page << in.rdbuf();
  EXPECT_EQ(page.str(), tvrpa({"--man"}).out);
}

} // namespace
} // namespace tvr::test
