// What the object manager records of a provider's answer: elements, their
// kinds and values, completion, status and escaped exceptions.
#include "BrokerTestSupport.h"

#include <pwd.h>
#include <unistd.h>

namespace tvr::broker::test {
namespace {

using Kind = ResultItem::Kind;
using ResultsTest = TestProviderTest;

Instance allTypesInstance(ObjectManager& om) {
  const Response r = om.getInstance(keyedPath("TVR_AllTypes", {{"CreationClassName", "TVR_AllTypes"}, {"Name", "one"}}));
  EXPECT_TRUE(r.ok()) << statusName(r.rc) << " " << r.message.value_or("");
  const std::vector<Instance> instances = r.instances();
  EXPECT_EQ(instances.size(), 1u);
  return instances.empty() ? Instance() : instances[0];
}

std::vector<std::string> propertyNames(const Instance& instance) {
  std::vector<std::string> names;
  for (const Binding& b : instance.properties) names.push_back(b.name);
  return names;
}

TEST_F(ResultsTest, ElementsAreRecordedInProviderOrderWithTheirKinds) {
  const Response r = om.enumerateInstances(classPath("TVR_Sequence"));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(kindsOf(r), (std::vector<Kind>{Kind::ObjectPath, Kind::Instance, Kind::Data, Kind::NullInstance,
                                           Kind::NullObjectPath, Kind::Instance}));
  EXPECT_EQ(*r.items[0].path.key("Id"), Value::chars("a"));
  EXPECT_EQ(*r.items[1].instance.property("Id"), Value::chars("b"));
  EXPECT_EQ(r.items[2].data, Value::chars("between"));
  EXPECT_EQ(*r.items[5].instance.property("Id"), Value::chars("c"));
}

TEST_F(ResultsTest, InstanceItemsCarryTheInstancesPath) {
  const Response r = om.enumerateInstances(classPath("TVR_Sequence"));
  ASSERT_EQ(r.items.size(), 6u);
  ObjectPath expected("root/tvrtest", "TVR_Sequence");
  expected.setKey("Id", Value::chars("b"));
  EXPECT_EQ(r.items[1].path, expected);
  EXPECT_EQ(r.items[1].instance.path, expected);
}

TEST_F(ResultsTest, PathsAndInstancesLeaveOutDataAndNullElements) {
  const Response r = om.enumerateInstances(classPath("TVR_Sequence"));
  const std::vector<ObjectPath> paths = r.paths();
  ASSERT_EQ(paths.size(), 3u);
  EXPECT_EQ(*paths[0].key("Id"), Value::chars("a"));
  EXPECT_EQ(*paths[1].key("Id"), Value::chars("b"));
  EXPECT_EQ(*paths[2].key("Id"), Value::chars("c"));
  EXPECT_EQ(r.instances().size(), 2u);
}

TEST_F(ResultsTest, ObjectPathsAreRecordedWithNamespaceClassAndKeys) {
  const Response r = om.enumerateInstanceNames(classPath("TVR_AllTypes"));
  ASSERT_EQ(r.paths().size(), 2u);
  ObjectPath expected("root/tvrtest", "TVR_AllTypes");
  expected.setKey("CreationClassName", Value::chars("TVR_AllTypes"));
  expected.setKey("Name", Value::chars("two"));
  EXPECT_EQ(r.paths()[1], expected);
}

TEST_F(ResultsTest, EveryScalarTypeKeepsTheTypeTheProviderSet) {
  const Instance inst = allTypesInstance(om);
  EXPECT_EQ(*inst.property("Chars"), Value::chars("plain text"));
  EXPECT_EQ(*inst.property("String"), Value::string(R"(quoted "text" and \ backslash)"));
  EXPECT_EQ(*inst.property("BooleanTrue"), Value::boolean(true));
  EXPECT_EQ(*inst.property("BooleanFalse"), Value::boolean(false));
  EXPECT_EQ(*inst.property("Uint8"), Value::uint8(200));
  EXPECT_EQ(*inst.property("Uint16"), Value::uint16(65000));
  EXPECT_EQ(*inst.property("Uint32"), Value::uint32(4000000000u));
  EXPECT_EQ(*inst.property("Uint64"), Value::uint64(18000000000000000000ull));
  EXPECT_EQ(*inst.property("Sint8"), Value::sint8(-100));
  EXPECT_EQ(*inst.property("Sint16"), Value::sint16(-32000));
  EXPECT_EQ(*inst.property("Sint32"), Value::sint32(-2000000000));
  EXPECT_EQ(*inst.property("Sint64"), Value::sint64(-9000000000000000000ll));
  EXPECT_EQ(*inst.property("Real32"), Value::real32(1.5f));
  EXPECT_EQ(*inst.property("Real64"), Value::real64(-2.25));
}

TEST_F(ResultsTest, Char16KeepsItsTypeAndCode) {
  const Instance inst = allTypesInstance(om);
  const Value* c = inst.property("Char16");
  ASSERT_NE(c, nullptr);
  EXPECT_EQ(c->type, CMPI_char16);
  EXPECT_FALSE(c->null);
  EXPECT_EQ(c->scalar.char16, 'Z');
}

TEST_F(ResultsTest, DateTimeIsRecordedInItsTextForm) {
  const Instance inst = allTypesInstance(om);
  const Value* when = inst.property("DateTime");
  ASSERT_NE(when, nullptr);
  EXPECT_EQ(when->type, CMPI_dateTime);
  EXPECT_EQ(when->text, "20240229123456.789012+000");
}

TEST_F(ResultsTest, ReferenceIsRecordedAsAPath) {
  const Instance inst = allTypesInstance(om);
  const Value* ref = inst.property("Ref");
  ASSERT_NE(ref, nullptr);
  ASSERT_EQ(ref->type, CMPI_ref);
  ObjectPath expected("root/tvrtest", "TVR_Other");
  expected.setKey("Id", Value::chars("7"));
  EXPECT_EQ(*ref->ref, expected);
}

TEST_F(ResultsTest, StringArrayTakesCharsAsStringsAndKeepsUnsetElementsNull) {
  const Instance inst = allTypesInstance(om);
  const Value* strings = inst.property("Strings");
  ASSERT_NE(strings, nullptr);
  EXPECT_EQ(*strings, Value::array(CMPI_string, {Value::string("alpha"), Value::string("beta"),
                                                 Value::nullOf(CMPI_string)}));
}

TEST_F(ResultsTest, Uint16ArrayKeepsItsElements) {
  const Instance inst = allTypesInstance(om);
  const Value* numbers = inst.property("Uint16s");
  ASSERT_NE(numbers, nullptr);
  EXPECT_EQ(*numbers, Value::array(CMPI_uint16, {Value::uint16(1), Value::uint16(2), Value::uint16(65535)}));
}

TEST_F(ResultsTest, NullValueKeepsItsType) {
  EXPECT_EQ(*allTypesInstance(om).property("NullString"), Value::nullOf(CMPI_string));
}

TEST_F(ResultsTest, PropertiesKeepTheOrderFirstSetWithThePathsKeysFirst) {
  EXPECT_EQ(propertyNames(allTypesInstance(om)),
            (std::vector<std::string>{"CreationClassName", "Name", "Chars", "Replaced", "String", "BooleanTrue",
                                      "BooleanFalse", "Uint8", "Uint16", "Uint32", "Uint64", "Sint8", "Sint16",
                                      "Sint32", "Sint64", "Real32", "Real64", "Char16", "DateTime", "Ref", "Strings",
                                      "Uint16s", "NullString"}));
}

TEST_F(ResultsTest, KeyPropertiesCopiedFromThePathKeepTheirType) {
  const Instance inst = allTypesInstance(om);
  EXPECT_EQ(*inst.property("CreationClassName"), Value::chars("TVR_AllTypes"));
  EXPECT_EQ(*inst.property("Name"), Value::chars("one"));
}

TEST_F(ResultsTest, SettingAPropertyAgainUnderAnotherSpellingReplacesItInPlace) {
  const Instance inst = allTypesInstance(om);
  ASSERT_GE(inst.properties.size(), 4u);
  EXPECT_EQ(inst.properties[3].name, "Replaced");
  EXPECT_EQ(inst.properties[3].value, Value::uint8(2));
  EXPECT_EQ(inst.property("REPLACED"), nullptr);
}

TEST_F(ResultsTest, PropertyListReachesTheProviderAndItsFilterKeepsKeys) {
  const Response r = om.enumerateInstances(classPath("TVR_AllTypes"), std::vector<std::string>{"uint8", "Ref"});
  ASSERT_EQ(r.instances().size(), 2u);
  EXPECT_EQ(propertyNames(r.instances()[0]), (std::vector<std::string>{"CreationClassName", "Name", "Uint8", "Ref"}));
}

TEST_F(ResultsTest, NullInstanceIsRecordedAndMissingReturnDoneCountsZero) {
  const Response r = om.enumerateInstances(classPath("TVR_NullInstance"));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(kindsOf(r), std::vector<Kind>{Kind::NullInstance});
  EXPECT_EQ(r.doneCount, 0);
  EXPECT_FALSE(r.done());
  EXPECT_TRUE(r.instances().empty());
}

TEST_F(ResultsTest, EveryReturnDoneIsCounted) {
  const Response r = om.enumerateInstanceNames(classPath("TVR_DoneTwice"));
  EXPECT_EQ(r.doneCount, 2);
  EXPECT_TRUE(r.done());
}

TEST_F(ResultsTest, ErrorStatusAndItsMessageAreRecorded) {
  const Response r = om.getInstance(classPath("TVR_Error"));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_NOT_FOUND);
  EXPECT_EQ(r.message, "no such widget");
  EXPECT_FALSE(r.ok());
  ASSERT_EQ(r.outcomes.size(), 1u);
  EXPECT_EQ(r.outcomes[0].rc, CMPI_RC_ERR_NOT_FOUND);
  EXPECT_EQ(r.outcomes[0].message, "no such widget");
}

TEST_F(ResultsTest, EscapedStandardExceptionIsReportedWithTypeAndWhat) {
  const Response r = om.enumerateInstances(classPath("TVR_Throws"));
  ASSERT_TRUE(r.exception);
  EXPECT_EQ(r.exception->type, "std::out_of_range");
  EXPECT_EQ(r.exception->what, "widget index 7 is out of range");
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_FALSE(r.ok());
  ASSERT_EQ(r.outcomes.size(), 1u);
  EXPECT_EQ(r.outcomes[0].exception->type, "std::out_of_range");
}

TEST_F(ResultsTest, ElementsReturnedBeforeAnExceptionAreKept) {
  const Response r = om.enumerateInstances(classPath("TVR_Throws"));
  ASSERT_EQ(r.paths().size(), 1u);
  EXPECT_EQ(*r.paths()[0].key("Id"), Value::chars("before the throw"));
}

TEST_F(ResultsTest, EscapedNonStandardExceptionIsReportedWithItsTypeAndNoWhat) {
  const Response r = om.enumerateInstanceNames(classPath("TVR_Throws"));
  ASSERT_TRUE(r.exception);
  EXPECT_EQ(r.exception->type, "tvrtest::(anonymous namespace)::ProviderFault");
  EXPECT_EQ(r.exception->what, "");
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
}

TEST_F(ResultsTest, NextRequestWorksAfterAnEscapedException) {
  EXPECT_TRUE(om.enumerateInstances(classPath("TVR_Throws")).exception);
  const Response after = om.enumerateInstanceNames(classPath("TVR_AllTypes"));
  EXPECT_TRUE(after.ok());
  EXPECT_FALSE(after.exception);
  EXPECT_EQ(after.paths().size(), 2u);
}

TEST_F(ResultsTest, InstancePathWithoutKeysStaysWithoutKeysForAnUnknownClass) {
  const Response r = om.enumerateInstances(classPath("TVR_Keyless"));
  ASSERT_EQ(r.instances().size(), 1u);
  EXPECT_TRUE(r.items[0].path.keys.empty());
}

TEST_F(ResultsTest, InstancePathWithoutKeysTakesThemFromPropertiesWhenTheClassKeysAreKnown) {
  ObjectManagerOptions options = testProviderOptions();
  options.classKeys["tvr_keyless"] = {"Id"};
  ObjectManager knowing(std::move(options));
  const Response r = knowing.enumerateInstances(classPath("TVR_Keyless"));
  ASSERT_EQ(r.instances().size(), 1u);
  ObjectPath expected("root/tvrtest", "TVR_Keyless");
  expected.setKey("Id", Value::chars("k1"));
  EXPECT_EQ(r.items[0].path, expected);
  EXPECT_EQ(r.items[0].instance.path, expected);
}

struct RecordingObserver : ResultObserver {
  void onItem(const ResultItem& item) override { kinds.push_back(item.kind); }
  std::vector<Kind> kinds;
};

TEST_F(ResultsTest, ObserverSeesEveryElementAndItemsMayBeDropped) {
  RecordingObserver observer;
  RequestOptions options;
  options.observer = &observer;
  options.keepItems = false;
  const Response r = om.enumerateInstances(classPath("TVR_Sequence"), std::nullopt, options);
  EXPECT_TRUE(r.ok());
  EXPECT_TRUE(r.items.empty());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_EQ(observer.kinds, (std::vector<Kind>{Kind::ObjectPath, Kind::Instance, Kind::Data, Kind::NullInstance,
                                               Kind::NullObjectPath, Kind::Instance}));
}

TEST_F(ResultsTest, NullBrokerRunsTheHandlerWithoutABrokerAndRestoresItAfterwards) {
  RequestOptions options;
  options.nullBroker = true;
  const Response without = om.enumerateInstanceNames(classPath("TVR_AllTypes"), options);
  EXPECT_EQ(without.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(dataTexts(without), std::vector<std::string>{"no broker"});
  const Response after = om.enumerateInstanceNames(classPath("TVR_AllTypes"));
  EXPECT_TRUE(after.ok());
  EXPECT_EQ(after.paths().size(), 2u);
}

TEST_F(ResultsTest, ContextCarriesNamespaceFlagsAndPrincipal) {
  const passwd* user = getpwuid(geteuid());
  ASSERT_NE(user, nullptr);
  const std::vector<std::string> texts = dataTexts(om.enumerateInstances(classPath("TVR_Context")));
  ASSERT_GE(texts.size(), 3u);
  EXPECT_EQ(texts[0], "entry CMPIInitNameSpace=root/tvrtest");
  EXPECT_EQ(texts[1], "entry CMPIInvocationFlags=0");
  EXPECT_EQ(texts[2], std::string("entry CMPIPrincipal=") + user->pw_name);
}

TEST_F(ResultsTest, ContextTakesNewEntriesAndLooksThemUpWithoutRegardToCase) {
  const std::vector<std::string> texts = dataTexts(om.enumerateInstances(classPath("TVR_Context")));
  ASSERT_EQ(texts.size(), 5u);
  EXPECT_EQ(texts[3], "added added 0");
  EXPECT_EQ(texts[4], "missing " + std::to_string(CMPI_RC_ERR_NO_SUCH_PROPERTY));
}

TEST(ResponseNames, StatusNamesAndOperationNames) {
  EXPECT_EQ(statusName(CMPI_RC_OK), "CMPI_RC_OK");
  EXPECT_EQ(statusName(CMPI_RC_ERR_INVALID_HANDLE), "CMPI_RC_ERR_INVALID_HANDLE");
  EXPECT_EQ(statusName(CMPI_RC_ERR_NOT_FOUND), "CMPI_RC_ERR_NOT_FOUND");
  EXPECT_EQ(statusName(static_cast<CMPIrc>(77)), "CMPI_RC(77)");
  EXPECT_STREQ(operationName(Operation::ReferenceNames), "ReferenceNames");
  EXPECT_STREQ(operationName(Operation::EnumerateInstanceNames), "EnumerateInstanceNames");
}

} // namespace
} // namespace tvr::broker::test
