// tvrpa classes: what the registration serves, with provider and kind.
#include "TvrpaRun.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using ::testing::HasSubstr;

TEST(TvrpaClasses, TextListsEachClassWithProviderKindAndNamespaces) {
  const FixtureRegistration fixture(fixtureMachine());
  const ProgramResult r = tvrpa(std::vector<std::string>{"classes"} + fixture.registrationArgs());
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_EQ(r.out, "CLASS      PROVIDER  KIND                  NAMESPACES\n"
                   "FIX_Rack   FixRack   instance              root/cimv2\n"
                   "FIX_Card   FixCard   instance              root/cimv2\n"
                   "FIX_Holds  FixHolds  instance association  root/cimv2\n"
                   "FIX_Plugs  FixPlugs  instance association  root/cimv2\n");
}

TEST(TvrpaClasses, JsonGivesKindsAndLocation) {
  const FixtureRegistration fixture(fixtureMachine());
  const ProgramResult r = tvrpa(std::vector<std::string>{"classes", "--format", "json"} + fixture.registrationArgs());
  const nlohmann::json doc = parseJson(r.out);
  ASSERT_EQ(doc.size(), 4u);
  EXPECT_EQ(doc[2], nlohmann::json({{"className", "FIX_Holds"},
                                    {"provider", "FixHolds"},
                                    {"location", "tvrpafixture"},
                                    {"kinds", {"instance", "association"}},
                                    {"namespaces", {"root/cimv2"}}}));
}

TEST(TvrpaClasses, ProjectRegistrationServesTheChassis) {
  const ProgramResult r = tvrpa({"classes"});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(r.out, HasSubstr("TVRHX_Chassis "));
  EXPECT_THAT(r.out, HasSubstr(" ChassisProvider "));
}

TEST(TvrpaClasses, DoesNotTakeATree) {
  const ProgramResult r = tvrpa({"classes", "--tree", bladeTree()});
  EXPECT_EQ(r.exitStatus, 1);
  EXPECT_THAT(r.err, HasSubstr("classes does not take --tree (it takes --format, --registration)"));
}

} // namespace
} // namespace tvr::test
