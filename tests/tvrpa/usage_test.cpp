// Usage errors: exit status 1 and a message that says what was wrong and
// what was expected instead.
#include "TvrpaRun.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using ::testing::HasSubstr;

void expectUsageError(const std::vector<std::string>& args, const std::string& message) {
  const ProgramResult r = tvrpa(args);
  EXPECT_EQ(r.exitStatus, 1) << message;
  EXPECT_THAT(r.err, HasSubstr("tvrpa: " + message));
  EXPECT_EQ(r.out, "") << message;
}

TEST(TvrpaUsage, NoCommandListsTheCommands) {
  expectUsageError({}, "no command given (expected ei, ein, gi, ai, ain, ri, rin, inventory, classes or help");
}

TEST(TvrpaUsage, UnknownCommandListsTheCommands) {
  expectUsageError({"frobnicate"}, "unknown command 'frobnicate' (expected ei, ein, gi, ai, ain, ri, rin, "
                                   "inventory, classes or help)");
}

TEST(TvrpaUsage, UnknownOptionIsNamed) {
  expectUsageError({"ei", "TVRHX_Chassis", "--bogus"}, "unknown option --bogus");
}

TEST(TvrpaUsage, OptionWithoutItsValueSaysWhatItNeeds) {
  expectUsageError({"ei", "TVRHX_Chassis", "--tree"}, "--tree needs FILE after it");
}

TEST(TvrpaUsage, FlagGivenAValueIsRefused) {
  expectUsageError({"ei", "TVRHX_Chassis", "--trace=yes"}, "--trace takes no value");
}

TEST(TvrpaUsage, EnumerationNeedsAClassName) { expectUsageError({"ei"}, "ei needs a class name, e.g. TVRHX_Chassis"); }

TEST(TvrpaUsage, EnumerationTakesOneClassName) {
  expectUsageError({"ein", "TVRHX_Chassis", "TVRHX_Slot"}, "ein takes one class name, got 2 arguments");
}

TEST(TvrpaUsage, EnumerationRefusesAnInstancePath) {
  expectUsageError({"ei", "TVRHX_Chassis.Tag=\"x\""},
                   "ei takes a class name such as TVRHX_Chassis, not an object path");
}

TEST(TvrpaUsage, GetInstanceNeedsAPath) { expectUsageError({"gi"}, "gi needs an object path, e.g. 'TVRHX_Chassis."); }

TEST(TvrpaUsage, GetInstanceNeedsKeys) {
  expectUsageError({"gi", "TVRHX_Chassis"}, "gi needs the keys of the instance");
}

TEST(TvrpaUsage, KeyWordsMustBeKeyEqualsValue) {
  expectUsageError({"gi", "TVRHX_Chassis", "Tag"}, "expected KEY=VALUE after the path, got 'Tag'");
}

TEST(TvrpaUsage, AssociationOperationNeedsAPath) { expectUsageError({"ai"}, "ai needs an object path"); }

TEST(TvrpaUsage, FormatOutsideTheCommandsFormatsListsThem) {
  expectUsageError({"ei", "TVRHX_Chassis", "--format", "xml"}, "--format for ei takes text, mof or json, got 'xml'");
  expectUsageError({"ei", "TVRHX_Chassis", "--format", "dot"}, "--format for ei takes text, mof or json, got 'dot'");
  expectUsageError({"inventory", "--format=mof"}, "--format for inventory takes text, json or dot, got 'mof'");
}

TEST(TvrpaUsage, OptionTheCommandDoesNotTakeIsRefusedWithTheOnesItTakes) {
  expectUsageError({"ein", "TVRHX_Chassis", "--properties", "Tag"},
                   "ein does not take --properties (it takes --tree, --namespace, --format, --trace, "
                   "--registration, --schema, --provider-library)");
  expectUsageError({"ei", "TVRHX_Chassis", "--assoc-class", "X"}, "ei does not take --assoc-class");
  expectUsageError({"ain", "X.K=\"v\"", "--properties", "a"}, "ain does not take --properties");
}

TEST(TvrpaUsage, ReferencesHaveNoResultRole) {
  expectUsageError({"ri", "X.K=\"v\"", "--result-role", "Dependent"}, "ri does not take --result-role");
}

TEST(TvrpaUsage, ReferencesTakeOneAssociationClassUnderEitherName) {
  expectUsageError({"rin", "X.K=\"v\"", "--assoc-class", "A", "--result-class", "B"},
                   "rin takes one association class, but --assoc-class and --result-class differ");
}

TEST(TvrpaUsage, InventoryTakesNoArguments) {
  expectUsageError({"inventory", "now"}, "inventory takes no arguments, got 'now'");
}

TEST(TvrpaUsage, EmptyNamespaceIsRefused) {
  expectUsageError({"ei", "TVRHX_Chassis", "--namespace="}, "--namespace needs a namespace, e.g. root/cimv2");
}

TEST(TvrpaUsage, UnreadableRegistrationIsAUsageError) {
  const ProgramResult r = tvrpa({"ei", "TVRHX_Chassis", "--registration", "/nonexistent/x.reg"});
  EXPECT_EQ(r.exitStatus, 1);
  EXPECT_THAT(r.err, HasSubstr("/nonexistent/x.reg"));
}

TEST(TvrpaUsage, UnreadableProviderLibraryIsAUsageError) {
  expectUsageError({"ei", "TVRHX_Chassis", "--provider-library", "/nonexistent/lib.so"},
                   "cannot read provider library /nonexistent/lib.so");
}

TEST(TvrpaUsage, RefusedTreeFileShowsTheAgentsMessage) {
  const TextFile broken(R"({"nodes": [{"type": "ChassisNode", "status": -1}]})", ".json");
  const ProgramResult r = tvrpa({"ei", "TVRHX_Chassis", "--tree", broken.path()});
  EXPECT_EQ(r.exitStatus, 1);
  EXPECT_THAT(r.err, HasSubstr(broken.path()));
  EXPECT_THAT(r.err, HasSubstr("/nodes/0/status"));
  EXPECT_EQ(r.out, "");
}

TEST(TvrpaUsage, RefusedTreeFileRefusesTheInventoryToo) {
  const TextFile broken(R"({"nodes": [{"type": "NoSuchNode"}]})", ".json");
  const ProgramResult r = tvrpa({"inventory", "--tree", broken.path()});
  EXPECT_EQ(r.exitStatus, 1);
  EXPECT_THAT(r.err, HasSubstr("/nodes/0/type"));
}

} // namespace
} // namespace tvr::test
