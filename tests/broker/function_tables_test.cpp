// The encapsulated objects' functions called the right way: arrays,
// date-times, object paths, instances, strings, arguments, enumerations and
// the broker's helpers.
#include "BrokerTestSupport.h"

#include <sys/time.h>

namespace tvr::broker::test {
namespace {

/// A broker to call without a request: what it makes is long-lived.
class ObjectsTest : public TestProviderTest {
protected:
  const CMPIBroker* b = om.broker();
  CMPIStatus rc{CMPI_RC_ERROR_SYSTEM, nullptr};

  std::string text(CMPIString* s) {
    const char* chars = s ? CMGetCharsPtr(s, nullptr) : nullptr;
    return chars ? chars : "<null>";
  }
  CMPIObjectPath* disk() {
    CMPIObjectPath* p = CMNewObjectPath(b, "root/tvrtest", "TVR_Disk", nullptr);
    CMAddKey(p, "DeviceID", "sda", CMPI_chars);
    return p;
  }
};

// --- Arrays -----------------------------------------------------------------

using ArrayTest = ObjectsTest;

TEST_F(ArrayTest, NewArrayHasItsSizeTypeAndNullElements) {
  CMPIArray* a = CMNewArray(b, 3, CMPI_uint16, &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  EXPECT_EQ(CMGetArrayCount(a, nullptr), 3u);
  EXPECT_EQ(CMGetArrayType(a, nullptr), CMPI_uint16);
  const CMPIData d = CMGetArrayElementAt(a, 2, &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  EXPECT_TRUE(CMIsNullValue(d));
  EXPECT_EQ(d.type, CMPI_uint16);
}

TEST_F(ArrayTest, ElementSetIsReadBack) {
  CMPIArray* a = CMNewArray(b, 2, CMPI_sint64, nullptr);
  CMPISint64 n = -42;
  EXPECT_EQ(CMSetArrayElementAt(a, 1, &n, CMPI_sint64).rc, CMPI_RC_OK);
  const CMPIData d = CMGetArrayElementAt(a, 1, nullptr);
  EXPECT_EQ(d.type, CMPI_sint64);
  EXPECT_FALSE(CMIsNullValue(d));
  EXPECT_EQ(d.value.sint64, -42);
}

TEST_F(ArrayTest, IndexPastTheEndIsRefused) {
  CMPIArray* a = CMNewArray(b, 2, CMPI_uint8, nullptr);
  CMPIUint8 n = 1;
  EXPECT_EQ(CMSetArrayElementAt(a, 2, &n, CMPI_uint8).rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
  CMGetArrayElementAt(a, 2, &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
  CMGetArrayElementAt(a, 0xFFFFFFFFu, &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
}

TEST_F(ArrayTest, ElementOfAnotherTypeIsRefusedAndLeavesTheElementAlone) {
  CMPIArray* a = CMNewArray(b, 1, CMPI_uint16, nullptr);
  CMPIUint32 wide = 7;
  EXPECT_EQ(CMSetArrayElementAt(a, 0, &wide, CMPI_uint32).rc, CMPI_RC_ERR_TYPE_MISMATCH);
  EXPECT_EQ(CMSetArrayElementAt(a, 0, "7", CMPI_chars).rc, CMPI_RC_ERR_TYPE_MISMATCH);
  EXPECT_TRUE(CMIsNullValue(CMGetArrayElementAt(a, 0, nullptr)));
}

TEST_F(ArrayTest, StringArrayTakesCharsAndGivesStrings) {
  CMPIArray* a = CMNewArray(b, 2, CMPI_string, nullptr);
  EXPECT_EQ(CMSetArrayElementAt(a, 0, "from chars", CMPI_chars).rc, CMPI_RC_OK);
  CMPIString* s = CMNewString(b, "from string", nullptr);
  EXPECT_EQ(CMSetArrayElementAt(a, 1, &s, CMPI_string).rc, CMPI_RC_OK);
  const CMPIData first = CMGetArrayElementAt(a, 0, nullptr);
  EXPECT_EQ(first.type, CMPI_string);
  EXPECT_EQ(text(first.value.string), "from chars");
  EXPECT_EQ(text(CMGetArrayElementAt(a, 1, nullptr).value.string), "from string");
}

TEST_F(ArrayTest, CharsArrayIsAStringArray) {
  CMPIArray* a = CMNewArray(b, 1, CMPI_chars, nullptr);
  EXPECT_EQ(CMGetArrayType(a, nullptr), CMPI_string);
  EXPECT_EQ(CMSetArrayElementAt(a, 0, "text", CMPI_chars).rc, CMPI_RC_OK);
}

TEST_F(ArrayTest, ArrayTypeCodeGivesTheElementType) {
  EXPECT_EQ(CMGetArrayType(CMNewArray(b, 1, CMPI_uint16A, nullptr), nullptr), CMPI_uint16);
}

TEST_F(ArrayTest, EmptyArrayIsAllowed) {
  CMPIArray* a = CMNewArray(b, 0, CMPI_boolean, &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  EXPECT_EQ(CMGetArrayCount(a, nullptr), 0u);
}

TEST_F(ArrayTest, ImplausiblyLargeArrayIsRefused) {
  EXPECT_EQ(CMNewArray(b, 0xFFFFFFFFu, CMPI_uint8, &rc), nullptr);
  EXPECT_EQ(rc.rc, CMPI_RC_ERR_INVALID_PARAMETER);
}

TEST_F(ArrayTest, CloneIsIndependent) {
  CMPIArray* a = CMNewArray(b, 1, CMPI_uint8, nullptr);
  CMPIUint8 one = 1;
  CMPIUint8 two = 2;
  CMSetArrayElementAt(a, 0, &one, CMPI_uint8);
  CMPIArray* copy = CMClone(a, &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  CMSetArrayElementAt(a, 0, &two, CMPI_uint8);
  EXPECT_EQ(CMGetArrayElementAt(copy, 0, nullptr).value.uint8, 1);
}

// --- Date-times -------------------------------------------------------------

using DateTimeTest = ObjectsTest;

constexpr CMPIUint64 kLeapDayMicros = 1709210096789012ull; // 2024-02-29 12:34:56.789012 UTC

TEST_F(DateTimeTest, TextReadsBackUnchanged) {
  CMPIDateTime* d = CMNewDateTimeFromChars(b, "20240229123456.789012+000", &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  EXPECT_EQ(text(CMGetStringFormat(d, nullptr)), "20240229123456.789012+000");
  EXPECT_EQ(CMGetBinaryFormat(d, nullptr), kLeapDayMicros);
  EXPECT_FALSE(CMIsInterval(d, nullptr));
}

TEST_F(DateTimeTest, UtcOffsetIsFoldedIntoTheTime) {
  EXPECT_EQ(CMGetBinaryFormat(CMNewDateTimeFromChars(b, "20240229133456.789012+060", nullptr), nullptr),
            kLeapDayMicros);
  CMPIDateTime* west = CMNewDateTimeFromChars(b, "20240229103456.789012-120", nullptr);
  EXPECT_EQ(CMGetBinaryFormat(west, nullptr), kLeapDayMicros);
  EXPECT_EQ(text(CMGetStringFormat(west, nullptr)), "20240229123456.789012+000");
}

TEST_F(DateTimeTest, IntervalTextReadsBackUnchanged) {
  CMPIDateTime* d = CMNewDateTimeFromChars(b, "00000001020304.000005:000", &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  EXPECT_TRUE(CMIsInterval(d, nullptr));
  EXPECT_EQ(CMGetBinaryFormat(d, nullptr), 93784000005ull);
  EXPECT_EQ(text(CMGetStringFormat(d, nullptr)), "00000001020304.000005:000");
}

TEST_F(DateTimeTest, BinaryIntervalIsWrittenInIntervalForm) {
  CMPIDateTime* d = CMNewDateTimeFromBinary(b, 93784000005ull, 1, &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  EXPECT_TRUE(CMIsInterval(d, nullptr));
  EXPECT_EQ(text(CMGetStringFormat(d, nullptr)), "00000001020304.000005:000");
}

TEST_F(DateTimeTest, BinaryPointInTimeIsWrittenInUtc) {
  CMPIDateTime* d = CMNewDateTimeFromBinary(b, kLeapDayMicros, 0, nullptr);
  EXPECT_EQ(text(CMGetStringFormat(d, nullptr)), "20240229123456.789012+000");
}

TEST_F(DateTimeTest, NowIsAPointInTimeCloseToTheClock) {
  timeval now{};
  gettimeofday(&now, nullptr);
  const CMPIUint64 clock = static_cast<CMPIUint64>(now.tv_sec) * 1000000ull;
  CMPIDateTime* d = CMNewDateTime(b, &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  EXPECT_FALSE(CMIsInterval(d, nullptr));
  EXPECT_GE(CMGetBinaryFormat(d, nullptr), clock);
  EXPECT_LT(CMGetBinaryFormat(d, nullptr), clock + 60ull * 1000000ull);
}

TEST_F(DateTimeTest, MalformedTextIsAnInvalidParameter) {
  for (const char* bad : {"", "20240229123456.789012+00", "20240229123456.789012+0000", "2024022912345x.789012+000",
                          "20240229123456,789012+000", "20240229123456.789012*000", "20241329123456.789012+000",
                          "20240200123456.789012+000", "20240229243456.789012+000", "20240229126056.789012+000"}) {
    EXPECT_EQ(CMNewDateTimeFromChars(b, bad, &rc), nullptr) << bad;
    EXPECT_EQ(rc.rc, CMPI_RC_ERR_INVALID_PARAMETER) << bad;
  }
}

TEST_F(DateTimeTest, TimeBeforeTheEpochCannotBeHeld) {
  EXPECT_EQ(CMNewDateTimeFromChars(b, "19691231235959.000000+000", &rc), nullptr);
  EXPECT_EQ(rc.rc, CMPI_RC_ERR_INVALID_PARAMETER);
}

TEST_F(DateTimeTest, CloneKeepsTimeAndKind) {
  CMPIDateTime* copy = CMClone(CMNewDateTimeFromChars(b, "00000001020304.000005:000", nullptr), &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  EXPECT_TRUE(CMIsInterval(copy, nullptr));
  EXPECT_EQ(CMGetBinaryFormat(copy, nullptr), 93784000005ull);
}

// --- Object paths -----------------------------------------------------------

using ObjectPathTest = ObjectsTest;

TEST_F(ObjectPathTest, GetKeyOfAMissingKeyIsNotFound) {
  const CMPIData d = CMGetKey(disk(), "SystemName", &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_ERR_NOT_FOUND);
  EXPECT_TRUE(d.state & CMPI_notFound);
}

TEST_F(ObjectPathTest, GetKeyIgnoresCaseAndGivesAKeyValueAsString) {
  const CMPIData d = CMGetKey(disk(), "deviceid", &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  EXPECT_EQ(d.type, CMPI_string);
  EXPECT_TRUE(CMIsKeyValue(d));
  EXPECT_EQ(text(d.value.string), "sda");
}

TEST_F(ObjectPathTest, GetKeyAtGivesNameAndValueAndRefusesAnIndexPastTheEnd) {
  CMPIObjectPath* p = disk();
  CMPIString* name = nullptr;
  const CMPIData d = CMGetKeyAt(p, 0, &name, &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  EXPECT_EQ(text(name), "DeviceID");
  EXPECT_EQ(text(d.value.string), "sda");
  CMGetKeyAt(p, 1, &name, &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
}

TEST_F(ObjectPathTest, AddKeyAgainReplacesTheValueInPlace) {
  CMPIObjectPath* p = disk();
  CMPIUint16 slot = 3;
  CMAddKey(p, "Slot", &slot, CMPI_uint16);
  CMAddKey(p, "DEVICEID", "sdb", CMPI_chars);
  EXPECT_EQ(CMGetKeyCount(p, nullptr), 2u);
  CMPIString* name = nullptr;
  const CMPIData d = CMGetKeyAt(p, 0, &name, nullptr);
  EXPECT_EQ(text(name), "DeviceID");
  EXPECT_EQ(text(d.value.string), "sdb");
}

TEST_F(ObjectPathTest, NamespaceHostAndClassAreSetAndRead) {
  CMPIObjectPath* p = disk();
  EXPECT_EQ(CMSetNameSpace(p, "root/other").rc, CMPI_RC_OK);
  EXPECT_EQ(CMSetHostname(p, "node1").rc, CMPI_RC_OK);
  EXPECT_EQ(CMSetClassName(p, "TVR_Partition").rc, CMPI_RC_OK);
  EXPECT_EQ(text(CMGetNameSpace(p, nullptr)), "root/other");
  EXPECT_EQ(text(CMGetHostname(p, nullptr)), "node1");
  EXPECT_EQ(text(CMGetClassName(p, nullptr)), "TVR_Partition");
}

TEST_F(ObjectPathTest, NamespaceAndHostAreCopiedFromAnotherPath) {
  CMPIObjectPath* source = CMNewObjectPath(b, "root/source", "X", nullptr);
  CMSetHostname(source, "source-host");
  CMPIObjectPath* p = disk();
  EXPECT_EQ(CMSetNameSpaceFromObjectPath(p, source).rc, CMPI_RC_OK);
  EXPECT_EQ(text(CMGetNameSpace(p, nullptr)), "root/source");
  EXPECT_EQ(text(CMGetHostname(p, nullptr)), "");
  EXPECT_EQ(CMSetHostAndNameSpaceFromObjectPath(p, source).rc, CMPI_RC_OK);
  EXPECT_EQ(text(CMGetHostname(p, nullptr)), "source-host");
}

TEST_F(ObjectPathTest, CloneIsIndependent) {
  CMPIObjectPath* p = disk();
  CMPIObjectPath* copy = CMClone(p, &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  CMAddKey(p, "DeviceID", "changed", CMPI_chars);
  EXPECT_EQ(text(CMGetKey(copy, "DeviceID", nullptr).value.string), "sda");
}

TEST_F(ObjectPathTest, ToStringWritesHostNamespaceClassAndKeys) {
  CMPIObjectPath* p = disk();
  CMSetHostname(p, "node1");
  EXPECT_EQ(text(p->ft->toString(p, &rc)), R"(//node1/root/tvrtest:TVR_Disk.DeviceID="sda")");
  EXPECT_EQ(text(CDToString(b, p, nullptr)), R"(//node1/root/tvrtest:TVR_Disk.DeviceID="sda")");
}

TEST_F(ObjectPathTest, ClassPathIsAComparesTheClassNameWithoutRegardToCase) {
  EXPECT_TRUE(CMClassPathIsA(b, disk(), "tvr_disk", &rc));
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  EXPECT_FALSE(CMClassPathIsA(b, disk(), "CIM_LogicalDevice", &rc));
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
}

// --- Instances ----------------------------------------------------------------

using InstanceObjectTest = ObjectsTest;

TEST_F(InstanceObjectTest, NewInstanceStartsWithThePathsKeysAsProperties) {
  CMPIInstance* inst = CMNewInstance(b, disk(), &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  EXPECT_EQ(CMGetPropertyCount(inst, nullptr), 1u);
  EXPECT_EQ(text(CMGetProperty(inst, "DeviceID", nullptr).value.string), "sda");
}

TEST_F(InstanceObjectTest, GetPropertyOfAMissingPropertyIsNoSuchProperty) {
  const CMPIData d = CMGetProperty(CMNewInstance(b, disk(), nullptr), "Size", &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
  EXPECT_TRUE(d.state & CMPI_notFound);
}

TEST_F(InstanceObjectTest, GetPropertyIgnoresCase) {
  CMPIInstance* inst = CMNewInstance(b, disk(), nullptr);
  CMPIUint64 size = 512;
  CMSetProperty(inst, "Size", &size, CMPI_uint64);
  const CMPIData d = CMGetProperty(inst, "SIZE", &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  EXPECT_EQ(d.type, CMPI_uint64);
  EXPECT_EQ(d.value.uint64, 512u);
}

TEST_F(InstanceObjectTest, GetPropertyAtRefusesAnIndexPastTheEnd) {
  CMPIString* name = nullptr;
  CMGetPropertyAt(CMNewInstance(b, disk(), nullptr), 1, &name, &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
}

TEST_F(InstanceObjectTest, ObjectPathOfAnInstanceCarriesItsKeys) {
  CMPIObjectPath* p = CMGetObjectPath(CMNewInstance(b, disk(), nullptr), &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  EXPECT_EQ(text(CMGetClassName(p, nullptr)), "TVR_Disk");
  EXPECT_EQ(text(CMGetKey(p, "DeviceID", nullptr).value.string), "sda");
}

TEST_F(InstanceObjectTest, SetObjectPathReplacesThePath) {
  CMPIInstance* inst = CMNewInstance(b, disk(), nullptr);
  CMPIObjectPath* other = CMNewObjectPath(b, "root/tvrtest", "TVR_Other", nullptr);
  EXPECT_EQ(CMSetObjectPath(inst, other).rc, CMPI_RC_OK);
  EXPECT_EQ(text(CMGetClassName(CMGetObjectPath(inst, nullptr), nullptr)), "TVR_Other");
}

TEST_F(InstanceObjectTest, PropertyFilterDropsPropertiesNotListedAndKeepsKeys) {
  CMPIInstance* inst = CMNewInstance(b, disk(), nullptr);
  const char* properties[] = {"Size", nullptr};
  const char* keys[] = {"DeviceID", nullptr};
  EXPECT_EQ(CMSetPropertyFilter(inst, properties, keys).rc, CMPI_RC_OK);
  CMPIUint64 n = 1;
  EXPECT_EQ(CMSetProperty(inst, "size", &n, CMPI_uint64).rc, CMPI_RC_OK);
  EXPECT_EQ(CMSetProperty(inst, "Name", "dropped", CMPI_chars).rc, CMPI_RC_OK);
  EXPECT_EQ(CMSetProperty(inst, "DeviceID", "sdc", CMPI_chars).rc, CMPI_RC_OK);
  EXPECT_EQ(CMGetPropertyCount(inst, nullptr), 2u);
  CMGetProperty(inst, "Name", &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
  EXPECT_EQ(text(CMGetProperty(inst, "DeviceID", nullptr).value.string), "sdc");
}

TEST_F(InstanceObjectTest, CloneIsIndependent) {
  CMPIInstance* inst = CMNewInstance(b, disk(), nullptr);
  CMPIInstance* copy = CMClone(inst, &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  CMSetProperty(inst, "Name", "only in the original", CMPI_chars);
  EXPECT_EQ(CMGetPropertyCount(copy, nullptr), 1u);
}

TEST_F(InstanceObjectTest, ToStringListsThePathAndProperties) {
  CMPIInstance* inst = CMNewInstance(b, disk(), nullptr);
  CMPIUint16 n = 7;
  CMSetProperty(inst, "Slot", &n, CMPI_uint16);
  EXPECT_EQ(text(CDToString(b, inst, &rc)), R"(instance of root/tvrtest:TVR_Disk.DeviceID="sda" { DeviceID="sda"; Slot=7; })");
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
}

TEST_F(InstanceObjectTest, ArrayOfAnotherElementTypeThanDeclaredIsATypeMismatch) {
  CMPIInstance* inst = CMNewInstance(b, disk(), nullptr);
  CMPIArray* strings = CMNewArray(b, 1, CMPI_string, nullptr);
  EXPECT_EQ(CMSetProperty(inst, "Numbers", &strings, CMPI_uint16A).rc, CMPI_RC_ERR_TYPE_MISMATCH);
}

TEST_F(InstanceObjectTest, UnknownTypeCodeIsAnInvalidDataType) {
  CMPIInstance* inst = CMNewInstance(b, disk(), nullptr);
  CMPIUint8 n = 1;
  EXPECT_EQ(CMSetProperty(inst, "Odd", &n, static_cast<CMPIType>(0x77)).rc, CMPI_RC_ERR_INVALID_DATA_TYPE);
  EXPECT_EQ(CMGetPropertyCount(inst, nullptr), 1u);
}

// --- Strings, arguments, enumerations and the broker's helpers -------------------

using HelpersTest = ObjectsTest;

TEST_F(HelpersTest, StringKeepsItsTextInTheHandle) {
  CMPIString* s = CMNewString(b, "handle text", &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  EXPECT_STREQ(CMGetCharPtr(s), "handle text");
  EXPECT_STREQ(CMGetCharsPtr(s, nullptr), "handle text");
  EXPECT_EQ(text(CMClone(s, nullptr)), "handle text");
}

TEST_F(HelpersTest, NullStringHasNoText) {
  CMPIString* s = CMNewString(b, nullptr, &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  ASSERT_NE(s, nullptr);
  EXPECT_EQ(CMGetCharsPtr(s, &rc), nullptr);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
}

TEST_F(HelpersTest, ArgumentsAreAddedReplacedAndLookedUp) {
  CMPIArgs* args = CMNewArgs(b, nullptr);
  CMPIUint32 n = 1;
  CMPIUint32 m = 2;
  CMAddArg(args, "Count", &n, CMPI_uint32);
  CMAddArg(args, "Label", "text", CMPI_chars);
  CMAddArg(args, "COUNT", &m, CMPI_uint32);
  EXPECT_EQ(CMGetArgCount(args, nullptr), 2u);
  EXPECT_EQ(CMGetArg(args, "count", nullptr).value.uint32, 2u);
  CMPIString* name = nullptr;
  EXPECT_EQ(text(CMGetArgAt(args, 1, &name, nullptr).value.string), "text");
  EXPECT_EQ(text(name), "Label");
  CMGetArg(args, "Missing", &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
  CMGetArgAt(args, 2, nullptr, &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
}

TEST_F(HelpersTest, EnumerationIsWalkedOnceAndEndsWithNoSuchProperty) {
  CMPIEnumeration* found = CBEnumInstanceNames(b, nullptr, CMNewObjectPath(b, kTestNamespace, "TVR_AllTypes", nullptr), &rc);
  ASSERT_NE(found, nullptr);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  CMPIEnumeration* copy = CMClone(found, nullptr);
  int seen = 0;
  while (CMHasNext(found, nullptr)) {
    const CMPIData d = CMGetNext(found, &rc);
    EXPECT_EQ(rc.rc, CMPI_RC_OK);
    EXPECT_EQ(d.type, CMPI_ref);
    ++seen;
  }
  EXPECT_EQ(seen, 2);
  CMGetNext(found, &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
  EXPECT_TRUE(CMHasNext(copy, nullptr));
  CMPIArray* all = CMToArray(copy, &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  EXPECT_EQ(CMGetArrayCount(all, nullptr), 2u);
  EXPECT_EQ(CMGetArrayType(all, nullptr), CMPI_ref);
}

TEST_F(HelpersTest, IsOfTypeAndGetTypeNameTheKind) {
  CMPIObjectPath* p = disk();
  EXPECT_TRUE(CDIsOfType(b, p, "CMPIObjectPath", &rc));
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  EXPECT_FALSE(CDIsOfType(b, p, "CMPIInstance", &rc));
  EXPECT_EQ(text(CDGetType(b, CMNewInstance(b, p, nullptr), nullptr)), "CMPIInstance");
  EXPECT_EQ(text(CDGetType(b, CMNewString(b, "s", nullptr), nullptr)), "CMPIString");
  EXPECT_EQ(text(CDGetType(b, CMNewArray(b, 0, CMPI_uint8, nullptr), nullptr)), "CMPIArray");
  EXPECT_EQ(text(CDGetType(b, CMNewDateTime(b, nullptr), nullptr)), "CMPIDateTime");
  EXPECT_EQ(text(CDGetType(b, CMNewArgs(b, nullptr), nullptr)), "CMPIArgs");
  EXPECT_EQ(text(CDGetType(b, b, nullptr)), "CMPIBroker");
}

TEST_F(HelpersTest, ToStringOfAStringIsItsText) { EXPECT_EQ(text(CDToString(b, CMNewString(b, "as is", nullptr), nullptr)), "as is"); }

TEST_F(HelpersTest, GetMessageFillsInItsArguments) {
  CMPIString* m = b->eft->getMessage(b, "TVR0002", "disk $0 has $1 errors, $2", &rc, 3, CMPI_chars, "sda",
                                     CMPI_sint32, -3, CMPI_boolean, 1);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  EXPECT_EQ(text(m), "disk sda has -3 errors, true");
}

TEST_F(HelpersTest, GetMessageLeavesMissingArgumentsEmpty) {
  EXPECT_EQ(text(b->eft->getMessage(b, "id", "[$0][$1]", nullptr, 1, CMPI_uint64, 18446744073709551615ull)),
            "[18446744073709551615][]");
}

TEST_F(HelpersTest, MessageFilesGiveTheDefaultMessage) {
  CMPIMsgFileHandle handle = reinterpret_cast<CMPIMsgFileHandle>(1);
  EXPECT_EQ(b->eft->openMessageFile(b, "tvr-messages", &handle).rc, CMPI_RC_OK);
  CMPIString* s = CMNewString(b, "attached", nullptr);
  EXPECT_EQ(text(b->eft->getMessage2(b, "id", handle, "$0 and $1", &rc, 2, CMPI_string, s, CMPI_real64, 0.5)),
            "attached and 0.500000");
  EXPECT_EQ(b->eft->closeMessageFile(b, handle).rc, CMPI_RC_OK);
}

TEST_F(HelpersTest, BrokerNamesItselfAndItsCapabilities) {
  EXPECT_STREQ(CBBrokerName(b), "TVR embedded object manager");
  EXPECT_EQ(CBBrokerVersion(b), CMPIVersion200);
  EXPECT_TRUE(CBGetClassification(b) & CMPI_MB_Supports_MemEnhancements);
  EXPECT_EQ(b->eft->ftVersion, CMPICurrentVersion);
}

} // namespace
} // namespace tvr::broker::test
