// OtherAssociationProvider: answers every association operation with one
// data element echoing its arguments (see answerAssociation).
#include "Behaviours.h"

namespace {

const CMPIBroker* broker = nullptr;

tvrtest::AssociationCall call(const char* operation, const CMPIResult* rslt, const CMPIObjectPath* cop,
                              const char* assocClass, const char* resultClass, const char* role,
                              const char* resultRole, const char** properties, bool hasAssocClassAndResultRole) {
  return tvrtest::AssociationCall{"Other", operation, broker, rslt, cop, assocClass, resultClass, role,
                                  resultRole, properties, hasAssocClassAndResultRole};
}

} // namespace

static CMPIStatus OtherAssociationCleanup(CMPIAssociationMI*, const CMPIContext*, CMPIBoolean) {
  return tvrtest::ok();
}

static CMPIStatus OtherAssociators(CMPIAssociationMI*, const CMPIContext*, const CMPIResult* rslt,
                                    const CMPIObjectPath* cop, const char* assocClass, const char* resultClass,
                                    const char* role, const char* resultRole, const char** properties) {
  return tvrtest::answerAssociation(
      call("associators", rslt, cop, assocClass, resultClass, role, resultRole, properties, true));
}

static CMPIStatus OtherAssociatorNames(CMPIAssociationMI*, const CMPIContext*, const CMPIResult* rslt,
                                        const CMPIObjectPath* cop, const char* assocClass,
                                        const char* resultClass, const char* role, const char* resultRole) {
  return tvrtest::answerAssociation(
      call("associatorNames", rslt, cop, assocClass, resultClass, role, resultRole, nullptr, true));
}

static CMPIStatus OtherReferences(CMPIAssociationMI*, const CMPIContext*, const CMPIResult* rslt,
                                   const CMPIObjectPath* cop, const char* resultClass, const char* role,
                                   const char** properties) {
  return tvrtest::answerAssociation(
      call("references", rslt, cop, nullptr, resultClass, role, nullptr, properties, false));
}

static CMPIStatus OtherReferenceNames(CMPIAssociationMI*, const CMPIContext*, const CMPIResult* rslt,
                                       const CMPIObjectPath* cop, const char* resultClass, const char* role) {
  return tvrtest::answerAssociation(
      call("referenceNames", rslt, cop, nullptr, resultClass, role, nullptr, nullptr, false));
}

CMAssociationMIStub(Other, OtherAssociationProvider, broker, CMNoHook)
