#include "tvr/broker/Response.h"

namespace tvr::broker {

std::string TraceLine::str() const {
  std::string out = std::to_string(level);
  out += ' ';
  out += component.value_or("(null)");
  out += ": ";
  out += text.value_or("(null)");
  return out;
}

const char* operationName(Operation op) {
  switch (op) {
  case Operation::EnumerateInstanceNames: return "EnumerateInstanceNames";
  case Operation::EnumerateInstances: return "EnumerateInstances";
  case Operation::GetInstance: return "GetInstance";
  case Operation::Associators: return "Associators";
  case Operation::AssociatorNames: return "AssociatorNames";
  case Operation::References: return "References";
  case Operation::ReferenceNames: return "ReferenceNames";
  }
  return "Unknown";
}

std::vector<ObjectPath> Response::paths() const {
  std::vector<ObjectPath> out;
  for (const ResultItem& item : items)
    if (item.kind == ResultItem::Kind::ObjectPath || item.kind == ResultItem::Kind::Instance)
      out.push_back(item.path);
  return out;
}

std::vector<Instance> Response::instances() const {
  std::vector<Instance> out;
  for (const ResultItem& item : items)
    if (item.kind == ResultItem::Kind::Instance) out.push_back(item.instance);
  return out;
}

std::string statusName(CMPIrc rc) {
  switch (rc) {
  case CMPI_RC_OK: return "CMPI_RC_OK";
  case CMPI_RC_ERR_FAILED: return "CMPI_RC_ERR_FAILED";
  case CMPI_RC_ERR_ACCESS_DENIED: return "CMPI_RC_ERR_ACCESS_DENIED";
  case CMPI_RC_ERR_INVALID_NAMESPACE: return "CMPI_RC_ERR_INVALID_NAMESPACE";
  case CMPI_RC_ERR_INVALID_PARAMETER: return "CMPI_RC_ERR_INVALID_PARAMETER";
  case CMPI_RC_ERR_INVALID_CLASS: return "CMPI_RC_ERR_INVALID_CLASS";
  case CMPI_RC_ERR_NOT_FOUND: return "CMPI_RC_ERR_NOT_FOUND";
  case CMPI_RC_ERR_NOT_SUPPORTED: return "CMPI_RC_ERR_NOT_SUPPORTED";
  case CMPI_RC_ERR_CLASS_HAS_CHILDREN: return "CMPI_RC_ERR_CLASS_HAS_CHILDREN";
  case CMPI_RC_ERR_CLASS_HAS_INSTANCES: return "CMPI_RC_ERR_CLASS_HAS_INSTANCES";
  case CMPI_RC_ERR_INVALID_SUPERCLASS: return "CMPI_RC_ERR_INVALID_SUPERCLASS";
  case CMPI_RC_ERR_ALREADY_EXISTS: return "CMPI_RC_ERR_ALREADY_EXISTS";
  case CMPI_RC_ERR_NO_SUCH_PROPERTY: return "CMPI_RC_ERR_NO_SUCH_PROPERTY";
  case CMPI_RC_ERR_TYPE_MISMATCH: return "CMPI_RC_ERR_TYPE_MISMATCH";
  case CMPI_RC_ERR_QUERY_LANGUAGE_NOT_SUPPORTED: return "CMPI_RC_ERR_QUERY_LANGUAGE_NOT_SUPPORTED";
  case CMPI_RC_ERR_INVALID_QUERY: return "CMPI_RC_ERR_INVALID_QUERY";
  case CMPI_RC_ERR_METHOD_NOT_AVAILABLE: return "CMPI_RC_ERR_METHOD_NOT_AVAILABLE";
  case CMPI_RC_ERR_METHOD_NOT_FOUND: return "CMPI_RC_ERR_METHOD_NOT_FOUND";
  case CMPI_RC_DO_NOT_UNLOAD: return "CMPI_RC_DO_NOT_UNLOAD";
  case CMPI_RC_NEVER_UNLOAD: return "CMPI_RC_NEVER_UNLOAD";
  case CMPI_RC_ERR_INVALID_HANDLE: return "CMPI_RC_ERR_INVALID_HANDLE";
  case CMPI_RC_ERR_INVALID_DATA_TYPE: return "CMPI_RC_ERR_INVALID_DATA_TYPE";
  case CMPI_RC_ERROR_SYSTEM: return "CMPI_RC_ERROR_SYSTEM";
  case CMPI_RC_ERROR: return "CMPI_RC_ERROR";
  }
  return "CMPI_RC(" + std::to_string(static_cast<unsigned>(rc)) + ")";
}

} // namespace tvr::broker
