// tvrpa inventory: every class enumerated once and drawn as one picture, as
// a tree, as JSON and as Graphviz DOT; and on the example blade system,
// every instance of every registered element class, whatever classes have
// been registered by now.
#include "TvrpaRun.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <set>

namespace tvr::test {
namespace {

using ::testing::HasSubstr;
using ::testing::StartsWith;

// The fixture machine (see fixture/FixtureProvider.cpp): R1 holds C1, rack B
// holds C2 and C2 holds rack B back, both cards plug into p0.
class TvrpaInventory : public ::testing::Test {
protected:
  ProgramResult run(const std::vector<std::string>& args) {
    return tvrpa(args + fixture_.args() + std::vector<std::string>{"--tree", bladeTree()});
  }

private:
  FixtureRegistration fixture_{fixtureMachine()};
};

TEST_F(TvrpaInventory, TextDrawsEachElementUnderWhatAnAssociationDrawsItFrom) {
  const ProgramResult r = run({"inventory"});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_EQ(r.out, "Inventory of tree file " + bladeTree() +
                       ", namespace root/cimv2: 5 elements, 5 ties\n"
                       "\n"
                       "FIX_Rack \"R1\"\n"
                       "└─ FIX_Holds → FIX_Card \"C1\"\n"
                       "   └─ FIX_Plugs → FIX_Port \"p0\"\n"
                       "FIX_Rack \"Rack \"B\" \\ 2\"\n"
                       "└─ FIX_Holds → FIX_Card \"C2\"\n"
                       "   ├─ FIX_Holds → FIX_Rack \"Rack \"B\" \\ 2\" (see above)\n"
                       "   └─ FIX_Plugs → FIX_Port \"p0\" (see above)\n"
                       "\n"
                       "Classes:\n"
                       "  FIX_Rack   element      FixRack   2 instances\n"
                       "  FIX_Card   element      FixCard   2 instances\n"
                       "  FIX_Holds  association  FixHolds  3 instances\n"
                       "  FIX_Plugs  association  FixPlugs  2 instances\n");
  EXPECT_EQ(r.err, "");
}

TEST_F(TvrpaInventory, JsonGivesClassesElementsAndTies) {
  const ProgramResult r = run({"inventory", "--format", "json"});
  ASSERT_EQ(r.exitStatus, 0) << r.err;
  const nlohmann::json doc = parseJson(r.out);
  EXPECT_EQ(doc["source"], "tree file " + bladeTree());
  EXPECT_EQ(doc["namespace"], "root/cimv2");
  ASSERT_EQ(doc["classes"].size(), 4u);
  EXPECT_EQ(doc["classes"][0]["className"], "FIX_Rack");
  EXPECT_EQ(doc["classes"][0]["kind"], "element");
  EXPECT_EQ(doc["classes"][0]["instances"], 2);
  EXPECT_EQ(doc["classes"][0]["done"], true);
  EXPECT_EQ(doc["classes"][0]["status"]["name"], "CMPI_RC_OK");
  EXPECT_EQ(doc["classes"][2]["kind"], "association");
  ASSERT_EQ(doc["elements"].size(), 5u);
  EXPECT_EQ(doc["elements"][0],
            nlohmann::json({{"id", 0},
                            {"className", "FIX_Rack"},
                            {"path", "root/cimv2:FIX_Rack.Name=\"R1\",CreationClassName=\"FIX_Rack\""},
                            {"label", "R1"},
                            {"enumerated", true}}));
  ASSERT_EQ(doc["ties"].size(), 5u);
  EXPECT_EQ(doc["ties"][0]["className"], "FIX_Holds");
  EXPECT_EQ(doc["ties"][0]["from"], nlohmann::json({{"role", "GroupComponent"}, {"element", 0}}));
  EXPECT_EQ(doc["ties"][0]["to"], nlohmann::json({{"role", "PartComponent"}, {"element", 2}}));
}

TEST_F(TvrpaInventory, TieDirectionFollowsTheRolesNotThePropertyOrder) {
  // FIX_Plugs sets Dependent before Antecedent; the edge still starts at the Antecedent.
  const nlohmann::json doc = parseJson(run({"inventory", "--format", "json"}).out);
  const nlohmann::json& plug = doc["ties"][3];
  EXPECT_EQ(plug["className"], "FIX_Plugs");
  EXPECT_EQ(plug["from"]["role"], "Antecedent");
  EXPECT_EQ(doc["elements"][plug["from"]["element"].get<int>()]["label"], "C1");
  EXPECT_EQ(plug["to"]["role"], "Dependent");
}

TEST_F(TvrpaInventory, ElementsOnlyAnAssociationNamesAreNotEnumerated) {
  const nlohmann::json doc = parseJson(run({"inventory", "--format", "json"}).out);
  const nlohmann::json& port = doc["elements"][4];
  EXPECT_EQ(port["className"], "FIX_Port");
  EXPECT_EQ(port["enumerated"], false);
}

TEST_F(TvrpaInventory, DotDrawsBoxesAndLabelledEdges) {
  const ProgramResult r = run({"inventory", "--format", "dot"});
  ASSERT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(r.out, StartsWith("digraph inventory {\n"));
  EXPECT_THAT(r.out, HasSubstr("  e0 [label=\"FIX_Rack\\nR1\", tooltip=\"root/cimv2:FIX_Rack.Name=\\\"R1\\\","
                               "CreationClassName=\\\"FIX_Rack\\\"\"];\n"));
  // Quotes and backslashes of the data cannot end a DOT string.
  EXPECT_THAT(r.out, HasSubstr("  e1 [label=\"FIX_Rack\\nRack \\\"B\\\" \\\\ 2\", "));
  EXPECT_THAT(r.out, HasSubstr("  e4 [label=\"FIX_Port\\np0\", tooltip=\"root/cimv2:FIX_Port.Name=\\\"p0\\\","
                               "CreationClassName=\\\"FIX_Port\\\"\", style=dashed];\n"));
  EXPECT_THAT(r.out, HasSubstr("  e0 -> e2 [label=\"FIX_Holds\", tooltip=\"GroupComponent -> PartComponent\"];\n"));
  EXPECT_THAT(r.out, HasSubstr("  e2 -> e4 [label=\"FIX_Plugs\", tooltip=\"Antecedent -> Dependent\"];\n"));
  EXPECT_THAT(r.out, testing::EndsWith("}\n"));
}

TEST(TvrpaInventoryWithFailures, FailingClassIsReportedAndTheRestIsDrawn) {
  std::vector<FixtureClass> classes = fixtureMachine();
  classes.insert(classes.begin() + 1, {"FIX_Broken", "FixFailing", "instance"});
  const FixtureRegistration registration(classes);
  const ProgramResult r = tvrpa(std::vector<std::string>{"inventory"} + registration.args());
  EXPECT_EQ(r.exitStatus, 2);
  EXPECT_EQ(r.err, "tvrpa: FIX_Broken: FixFailing (FIX_Broken) answered CMPI_RC_ERR_NOT_FOUND: the fixture has "
                   "nothing here\n");
  EXPECT_THAT(r.out, HasSubstr("└─ FIX_Holds → FIX_Card \"C1\"\n"));
  EXPECT_THAT(
      r.out, HasSubstr("  FIX_Broken  element      FixFailing  CMPI_RC_ERR_NOT_FOUND: the fixture has nothing here\n"));
}

TEST(TvrpaInventoryWithFailures, EscapedExceptionEndsTheRunWithThreeAfterDrawingTheRest) {
  std::vector<FixtureClass> classes = fixtureMachine();
  classes.push_back({"FIX_Throws", "FixThrowing", "instance"});
  const FixtureRegistration registration(classes);
  const ProgramResult r = tvrpa(std::vector<std::string>{"inventory", "--format", "json"} + registration.args());
  EXPECT_EQ(r.exitStatus, 3);
  const nlohmann::json doc = parseJson(r.out);
  EXPECT_EQ(doc["classes"][2]["className"], "FIX_Throws");
  EXPECT_EQ(doc["classes"][2]["exception"]["what"], "fixture provider gave up");
  EXPECT_EQ(doc["ties"].size(), 5u);
}

TEST(TvrpaInventoryWithFailures, AssociationWithoutAnInstanceProviderIsNotEnumerated) {
  const FixtureRegistration registration(
      {{"FIX_Rack", "FixRack", "instance"}, {"FIX_Holds", "FixHolds", "association"}});
  const ProgramResult r = tvrpa(std::vector<std::string>{"inventory"} + registration.args());
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(
      r.out,
      HasSubstr("  FIX_Holds  association  FixHolds  not enumerated: no instance provider is registered for it\n"));
}

TEST(TvrpaInventoryWithoutAssociations, ElementsStandOnTheirOwn) {
  const FixtureRegistration registration({{"FIX_Rack", "FixRack", "instance"}});
  const ProgramResult r = tvrpa(std::vector<std::string>{"inventory", "--tree", bladeTree()} + registration.args());
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(r.out, HasSubstr(": 2 elements, 0 ties\n\nFIX_Rack \"R1\"\nFIX_Rack \"Rack \"B\" \\ 2\"\n\nClasses:\n"));
}

// The registered element classes and the paths of their instances, as
// tvrpa ei gives them. (Not ein: a provider may answer the two differently,
// and the inventory shows what EnumerateInstances answers.)
std::map<std::string, std::set<std::string>> registeredElements() {
  std::map<std::string, std::set<std::string>> out;
  const nlohmann::json classes = parseJson(tvrpa({"classes", "--format", "json"}).out);
  for (const nlohmann::json& c : classes) {
    const auto kinds = c["kinds"].get<std::vector<std::string>>();
    if (std::find(kinds.begin(), kinds.end(), "association") != kinds.end()) continue;
    const std::string name = c["className"];
    const ProgramResult instances = tvrpa({"ei", name, "--tree", bladeTree(), "--format", "json"});
    EXPECT_EQ(instances.exitStatus, 0) << name << instances.err;
    const nlohmann::json answer = parseJson(instances.out);
    for (const nlohmann::json& item : answer["items"]) out[name].insert(item["path"]["text"].get<std::string>());
  }
  return out;
}

TEST(TvrpaInventoryOfTheExample, ShowsEveryInstanceOfEveryRegisteredElementClass) {
  const std::map<std::string, std::set<std::string>> expected = registeredElements();
  ASSERT_FALSE(expected.empty());
  const ProgramResult r = tvrpa({"inventory", "--tree", bladeTree(), "--format", "json"});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  const nlohmann::json doc = parseJson(r.out);
  std::map<std::string, std::set<std::string>> shown;
  for (const nlohmann::json& e : doc["elements"])
    if (e["enumerated"] == true) shown[e["className"]].insert(e["path"].get<std::string>());
  for (const auto& [className, paths] : expected) {
    EXPECT_EQ(shown[className], paths) << className;
    EXPECT_FALSE(paths.empty()) << className << " has no instance in the example";
  }
}

TEST(TvrpaInventoryOfTheExample, TextNamesEveryElementAndEveryClass) {
  const ProgramResult json = tvrpa({"inventory", "--tree", bladeTree(), "--format", "json"});
  const ProgramResult text = tvrpa({"inventory", "--tree", bladeTree()});
  EXPECT_EQ(text.exitStatus, 0) << text.err;
  EXPECT_THAT(text.out, StartsWith("Inventory of tree file " + bladeTree() + ", namespace root/cimv2: "));
  const nlohmann::json doc = parseJson(json.out);
  for (const nlohmann::json& e : doc["elements"]) {
    const std::string line = e["className"].get<std::string>() + " \"" + e["label"].get<std::string>() + "\"";
    EXPECT_THAT(text.out, HasSubstr(line)) << line;
  }
  for (const nlohmann::json& c : doc["classes"])
    EXPECT_THAT(text.out, HasSubstr("  " + c["className"].get<std::string>() + " ")) << c["className"];
}

// A chassis with `slots` slots and as many connectors.
std::string largeMachine(int slots) {
  std::string nodes;
  for (int i = 0; i < slots; ++i) {
    if (i) nodes += ",";
    nodes +=
        R"({"type": "SlotNode", "name": "Slot )" + std::to_string(i) + R"(", "properties": {"PropSlotNumber": 1}},)";
    nodes += R"({"type": "ConnectorNode", "name": "Connector )" + std::to_string(i) + R"("})";
  }
  return R"({"systemName": "large", "nodes": [{"type": "ChassisNode", "name": "Large", "children": [)" + nodes + "]}]}";
}

#if defined(__SANITIZE_ADDRESS__)
constexpr bool kMemoryIsMeasurable = false; // the sanitizer holds freed memory back on purpose
#else
constexpr bool kMemoryIsMeasurable = true;
#endif

TEST(TvrpaInventoryOfALargeMachine, HoldsLittleMoreThanItsLargestClassesRequest) {
  if (!kMemoryIsMeasurable) GTEST_SKIP() << "memory is not measurable under AddressSanitizer";
  // The inventory reads every class, but one request at a time, and keeps
  // only paths and names of what it saw: at its peak it holds little more
  // than a request for its largest class (20000 slots) alone. Keeping the
  // answers instead would cost some 80 MB more.
  const TextFile tree(largeMachine(20000), ".json");
  const ProgramResult largestClass = tvrpa({"ei", "TVRHX_Slot", "--tree", tree.path()});
  ASSERT_EQ(largestClass.exitStatus, 0) << largestClass.err;
  const ProgramResult inventory = tvrpa({"inventory", "--tree", tree.path(), "--format", "json"});
  ASSERT_EQ(inventory.exitStatus, 0) << inventory.err;
  EXPECT_EQ(parseJson(inventory.out)["elements"].size(), 40001u);
  EXPECT_LT(inventory.maxResidentKb - largestClass.maxResidentKb, 24 * 1024)
      << "inventory " << inventory.maxResidentKb << " KB, ei TVRHX_Slot " << largestClass.maxResidentKb << " KB";
}

} // namespace
} // namespace tvr::test
