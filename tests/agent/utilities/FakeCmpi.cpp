//===- FakeCmpi.cpp - Small stand-ins for object-manager CMPI objects -----===//

#include "FakeCmpi.h"

#include <cstring>

namespace fakecmpi {
namespace {

CMPIStatus status(CMPIrc rc) { return CMPIStatus{rc, nullptr}; }

void report(CMPIStatus *rc, CMPIrc code) {
  if (rc)
    *rc = status(code);
}

CMPIData notFound() {
  CMPIData data{};
  data.type = CMPI_null;
  data.state = CMPI_notFound;
  return data;
}

// --- strings ----------------------------------------------------------------

const char *stringChars(const CMPIString *string, CMPIStatus *rc) {
  report(rc, CMPI_RC_OK);
  return static_cast<const FakeString *>(string->hdl)->text.c_str();
}

CMPIStringFT *stringTable() {
  static CMPIStringFT Table = [] {
    CMPIStringFT table{};
    table.ftVersion = CMPIVersion200;
    table.getCharPtr = stringChars;
    return table;
  }();
  return &Table;
}

// --- object paths -----------------------------------------------------------

const FakePath &pathOf(const CMPIObjectPath *path) {
  return *static_cast<const FakePath *>(path->hdl);
}

CMPIString *pathNameSpace(const CMPIObjectPath *path, CMPIStatus *rc) {
  report(rc, CMPI_RC_OK);
  const FakePath &fake = pathOf(path);
  return fake.nameSpace.empty() ? nullptr : fake.world->string(fake.nameSpace);
}

CMPIString *pathHost(const CMPIObjectPath *path, CMPIStatus *rc) {
  report(rc, CMPI_RC_OK);
  const FakePath &fake = pathOf(path);
  return fake.host.empty() ? nullptr : fake.world->string(fake.host);
}

CMPIString *pathClassName(const CMPIObjectPath *path, CMPIStatus *rc) {
  report(rc, CMPI_RC_OK);
  const FakePath &fake = pathOf(path);
  return fake.world->string(fake.className);
}

/// Exact, case-sensitive lookup: the utilities must not rely on the object
/// manager ignoring case for them.
CMPIData pathKey(const CMPIObjectPath *path, const char *name, CMPIStatus *rc) {
  for (const NamedValue &key : pathOf(path).keys)
    if (key.name == name) {
      report(rc, CMPI_RC_OK);
      return key.data;
    }
  report(rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
  return notFound();
}

CMPIData pathKeyAt(const CMPIObjectPath *path, CMPICount index,
                   CMPIString **name, CMPIStatus *rc) {
  const FakePath &fake = pathOf(path);
  if (index >= fake.keys.size()) {
    report(rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
    return notFound();
  }
  if (name)
    *name = fake.keyNames[index];
  report(rc, CMPI_RC_OK);
  return fake.keys[index].data;
}

CMPICount pathKeyCount(const CMPIObjectPath *path, CMPIStatus *rc) {
  report(rc, CMPI_RC_OK);
  return static_cast<CMPICount>(pathOf(path).keys.size());
}

CMPIObjectPathFT *pathTable() {
  static CMPIObjectPathFT Table = [] {
    CMPIObjectPathFT table{};
    table.ftVersion = CMPIVersion200;
    table.getNameSpace = pathNameSpace;
    table.getHostname = pathHost;
    table.getClassName = pathClassName;
    table.getKey = pathKey;
    table.getKeyAt = pathKeyAt;
    table.getKeyCount = pathKeyCount;
    return table;
  }();
  return &Table;
}

// --- instances --------------------------------------------------------------

FakeInstance &instanceOf(const CMPIInstance *instance) {
  return *static_cast<FakeInstance *>(instance->hdl);
}

CMPIData instanceProperty(const CMPIInstance *instance, const char *name,
                          CMPIStatus *rc) {
  for (const NamedValue &property : instanceOf(instance).properties)
    if (property.name == name) {
      report(rc, CMPI_RC_OK);
      return property.data;
    }
  report(rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
  return notFound();
}

CMPIData instancePropertyAt(const CMPIInstance *instance, CMPICount index,
                            CMPIString **name, CMPIStatus *rc) {
  const FakeInstance &fake = instanceOf(instance);
  if (index >= fake.properties.size()) {
    report(rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
    return notFound();
  }
  if (name)
    *name = fake.propertyNames[index];
  report(rc, CMPI_RC_OK);
  return fake.properties[index].data;
}

CMPICount instancePropertyCount(const CMPIInstance *instance, CMPIStatus *rc) {
  report(rc, CMPI_RC_OK);
  return static_cast<CMPICount>(instanceOf(instance).properties.size());
}

CMPIStatus instanceSetProperty(const CMPIInstance *instance, const char *name,
                               const CMPIValue *value, CMPIType type) {
  FakeInstance &fake = instanceOf(instance);
  if (fake.setPropertyResult == CMPI_RC_OK)
    fake.setCalls.push_back({name, type, *value});
  return status(fake.setPropertyResult);
}

CMPIInstanceFT *instanceTable() {
  static CMPIInstanceFT Table = [] {
    CMPIInstanceFT table{};
    table.ftVersion = CMPIVersion200;
    table.getProperty = instanceProperty;
    table.getPropertyAt = instancePropertyAt;
    table.getPropertyCount = instancePropertyCount;
    table.setProperty = instanceSetProperty;
    return table;
  }();
  return &Table;
}

// --- arrays -----------------------------------------------------------------

CMPIStatus arraySetElementAt(CMPIArray *array, CMPICount index,
                             const CMPIValue *value, CMPIType type) {
  FakeArray &fake = *static_cast<FakeArray *>(array->hdl);
  if (fake.setElementResult != CMPI_RC_OK)
    return status(fake.setElementResult);
  if (index >= fake.size)
    return status(CMPI_RC_ERR_NO_SUCH_PROPERTY);
  // CMPI_chars values arrive as the text pointer itself.
  fake.texts[index] =
      type == CMPI_chars ? reinterpret_cast<const char *>(value) : "";
  fake.setTypes[index] = type;
  return status(CMPI_RC_OK);
}

CMPIArrayFT *arrayTable() {
  static CMPIArrayFT Table = [] {
    CMPIArrayFT table{};
    table.ftVersion = CMPIVersion200;
    table.setElementAt = arraySetElementAt;
    return table;
  }();
  return &Table;
}

// --- broker -----------------------------------------------------------------

CMPIArray *brokerNewArray(const CMPIBroker *broker, CMPICount max,
                          CMPIType type, CMPIStatus *rc) {
  FakeBroker &fake = *static_cast<FakeBroker *>(broker->hdl);
  report(rc, fake.newArrayResult);
  if (fake.newArrayResult != CMPI_RC_OK || fake.newArrayReturnsNull)
    return nullptr;
  FakeArray &array = fake.world->array(type, max);
  array.setElementResult = fake.arraySetElementResult;
  fake.arrays.push_back(&array);
  return &array.object;
}

} // namespace

FakePath &FakePath::key(const std::string &name, CMPIData data) {
  data.state |= CMPI_keyValue; // as object managers mark key values
  keys.push_back({name, data});
  keyNames.push_back(world->string(name));
  return *this;
}

FakeInstance &FakeInstance::property(const std::string &name, CMPIData data) {
  properties.push_back({name, data});
  propertyNames.push_back(world->string(name));
  return *this;
}

CMPIString *FakeWorld::string(const std::string &text) {
  FakeString &fake = Strings.emplace_back();
  fake.text = text;
  fake.object.hdl = &fake;
  fake.object.ft = stringTable();
  return &fake.object;
}

FakePath &FakeWorld::path(const std::string &nameSpace,
                          const std::string &host,
                          const std::string &className) {
  FakePath &fake = Paths.emplace_back();
  fake.nameSpace = nameSpace;
  fake.host = host;
  fake.className = className;
  fake.world = this;
  fake.object.hdl = &fake;
  fake.object.ft = pathTable();
  return fake;
}

FakeInstance &FakeWorld::instance() {
  FakeInstance &fake = Instances.emplace_back();
  fake.world = this;
  fake.object.hdl = &fake;
  fake.object.ft = instanceTable();
  return fake;
}

FakeArray &FakeWorld::array(CMPIType elementType, CMPICount size) {
  FakeArray &fake = Arrays.emplace_back();
  fake.elementType = elementType;
  fake.size = size;
  fake.texts.resize(size);
  fake.setTypes.resize(size, CMPI_null);
  fake.object.hdl = &fake;
  fake.object.ft = arrayTable();
  return fake;
}

FakeBroker &FakeWorld::broker() {
  FakeBroker &fake = Brokers.emplace_back();
  fake.world = this;
  fake.encodingTable.ftVersion = CMPIVersion200;
  fake.encodingTable.newArray = brokerNewArray;
  fake.object.hdl = &fake;
  fake.object.eft = &fake.encodingTable;
  return fake;
}

CMPIData FakeWorld::stringValue(const std::string &text) {
  CMPIData data{};
  data.type = CMPI_string;
  data.state = CMPI_goodValue;
  data.value.string = string(text);
  return data;
}

CMPIData FakeWorld::charsValue(const std::string &text) {
  // The text lives in a FakeString so that it outlives the value.
  CMPIString *holder = string(text);
  CMPIData data{};
  data.type = CMPI_chars;
  data.state = CMPI_goodValue;
  data.value.chars =
      const_cast<char *>(static_cast<FakeString *>(holder->hdl)->text.c_str());
  return data;
}

CMPIData FakeWorld::nullValue(CMPIType type) {
  CMPIData data{};
  data.type = type;
  data.state = CMPI_nullValue;
  return data;
}

CMPIData FakeWorld::refValue(const FakePath &path) {
  CMPIData data{};
  data.type = CMPI_ref;
  data.value.ref = const_cast<CMPIObjectPath *>(&path.object);
  return data;
}

CMPIData FakeWorld::booleanValue(bool value) {
  CMPIData data{};
  data.type = CMPI_boolean;
  data.value.boolean = value ? 1 : 0;
  return data;
}

CMPIData FakeWorld::uint8Value(CMPIUint8 value) {
  CMPIData data{};
  data.type = CMPI_uint8;
  data.value.uint8 = value;
  return data;
}

CMPIData FakeWorld::uint16Value(CMPIUint16 value) {
  CMPIData data{};
  data.type = CMPI_uint16;
  data.value.uint16 = value;
  return data;
}

CMPIData FakeWorld::uint32Value(CMPIUint32 value) {
  CMPIData data{};
  data.type = CMPI_uint32;
  data.value.uint32 = value;
  return data;
}

CMPIData FakeWorld::uint64Value(CMPIUint64 value) {
  CMPIData data{};
  data.type = CMPI_uint64;
  data.value.uint64 = value;
  return data;
}

CMPIData FakeWorld::sint32Value(CMPISint32 value) {
  CMPIData data{};
  data.type = CMPI_sint32;
  data.value.sint32 = value;
  return data;
}

CMPIData FakeWorld::sint64Value(CMPISint64 value) {
  CMPIData data{};
  data.type = CMPI_sint64;
  data.value.sint64 = value;
  return data;
}

CMPIData FakeWorld::real64Value(CMPIReal64 value) {
  CMPIData data{};
  data.type = CMPI_real64;
  data.value.real64 = value;
  return data;
}

CMPIObjectPathFT *FakeWorld::emptyPathTable() {
  static CMPIObjectPathFT Table{};
  return &Table;
}

CMPIInstanceFT *FakeWorld::emptyInstanceTable() {
  static CMPIInstanceFT Table{};
  return &Table;
}

} // namespace fakecmpi
