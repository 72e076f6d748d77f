#include "Behaviours.h"

namespace tvrtest {

namespace {

std::string argument(const char* text) { return text ? text : "NULL"; }

std::string propertyList(const char** properties) {
  if (!properties) return "NULL";
  std::string out;
  for (const char** p = properties; *p; ++p) out += (out.empty() ? "" : ",") + std::string(*p);
  return "[" + out + "]";
}

} // namespace

CMPIStatus answerAssociation(const AssociationCall& call) {
  const std::string who = call.provider;
  const std::string sourceClass = classNameOf(call.source);
  if (sourceClass == "TVR_FailEverywhere" || sourceClass == "TVR_FailIn" + who)
    return failure(call.broker, CMPI_RC_ERR_NOT_FOUND, who + " found nothing");

  std::string echo = who + " " + call.operation;
  if (call.hasAssocClassAndResultRole) echo += " assocClass=" + argument(call.assocClass);
  echo += " resultClass=" + argument(call.resultClass) + " role=" + argument(call.role);
  if (call.hasAssocClassAndResultRole) echo += " resultRole=" + argument(call.resultRole);
  echo += " properties=" + propertyList(call.properties);
  returnText(call.result, echo);
  CMReturnDone(call.result);
  return ok();
}

} // namespace tvrtest
