//===- FakeCmpi.h - Small stand-ins for object-manager CMPI objects -------===//
//
// Just enough of CMPI strings, object paths, instances, arrays and a broker
// to drive the provider utilities: each fake fills only the function-table
// slots those utilities call, and a test may swap in an empty table to see
// that missing slots are survived. Everything made belongs to a FakeWorld
// and is freed with it.
//
//===----------------------------------------------------------------------===//

#ifndef HX_TESTS_FAKECMPI_H
#define HX_TESTS_FAKECMPI_H

#include "cmpidt.h"
#include "cmpift.h"

#include <deque>
#include <memory>
#include <string>
#include <utility>
#include <vector>

namespace fakecmpi {

struct FakeString {
  CMPIString object{};
  std::string text;
};

struct NamedValue {
  std::string name;
  CMPIData data;
};

struct FakePath {
  CMPIObjectPath object{};
  std::string nameSpace;
  std::string host;
  std::string className;
  std::vector<NamedValue> keys;
  /// Names of keys as CMPIStrings, made once per key for getKeyAt.
  std::vector<CMPIString *> keyNames;
  class FakeWorld *world = nullptr;

  FakePath &key(const std::string &name, CMPIData data);
};

struct FakeInstance {
  CMPIInstance object{};
  std::vector<NamedValue> properties;
  std::vector<CMPIString *> propertyNames;
  class FakeWorld *world = nullptr;
  /// What setProperty answers; on success it records the property.
  CMPIrc setPropertyResult = CMPI_RC_OK;
  struct SetCall {
    std::string name;
    CMPIType type;
    CMPIValue value;
  };
  std::vector<SetCall> setCalls;

  FakeInstance &property(const std::string &name, CMPIData data);
};

struct FakeArray {
  CMPIArray object{};
  CMPIType elementType = CMPI_null;
  CMPICount size = 0;
  /// Element texts and the types they were set with, by index.
  std::vector<std::string> texts;
  std::vector<CMPIType> setTypes;
  CMPIrc setElementResult = CMPI_RC_OK;
};

struct FakeBroker {
  CMPIBroker object{};
  CMPIBrokerEncFT encodingTable{};
  std::vector<FakeArray *> arrays;
  /// What newArray answers: an error code, or whether it returns no array.
  CMPIrc newArrayResult = CMPI_RC_OK;
  bool newArrayReturnsNull = false;
  /// Applied to every array newArray makes.
  CMPIrc arraySetElementResult = CMPI_RC_OK;
  class FakeWorld *world = nullptr;
};

/// Owns every fake made through it.
class FakeWorld {
public:
  CMPIString *string(const std::string &text);
  FakePath &path(const std::string &nameSpace, const std::string &host,
                 const std::string &className);
  FakeInstance &instance();
  FakeArray &array(CMPIType elementType, CMPICount size);
  FakeBroker &broker();

  // Values as an object manager hands them out.
  CMPIData stringValue(const std::string &text);
  CMPIData charsValue(const std::string &text);
  static CMPIData nullValue(CMPIType type);
  static CMPIData refValue(const FakePath &path);
  static CMPIData booleanValue(bool value);
  static CMPIData uint8Value(CMPIUint8 value);
  static CMPIData uint16Value(CMPIUint16 value);
  static CMPIData uint32Value(CMPIUint32 value);
  static CMPIData uint64Value(CMPIUint64 value);
  static CMPIData sint32Value(CMPISint32 value);
  static CMPIData sint64Value(CMPISint64 value);
  static CMPIData real64Value(CMPIReal64 value);

  /// Function tables with every slot empty, for null-safety tests.
  static CMPIObjectPathFT *emptyPathTable();
  static CMPIInstanceFT *emptyInstanceTable();

private:
  std::deque<FakeString> Strings;
  std::deque<FakePath> Paths;
  std::deque<FakeInstance> Instances;
  std::deque<FakeArray> Arrays;
  std::deque<FakeBroker> Brokers;
};

} // namespace fakecmpi

#endif // HX_TESTS_FAKECMPI_H
