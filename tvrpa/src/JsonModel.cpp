#include "JsonModel.h"

#include "tvr/broker/PathText.h"

namespace tvrpa {

namespace {

using tvr::broker::ResultItem;
using tvr::broker::Value;

Json optionalText(const std::optional<std::string>& text) { return text ? Json(*text) : Json(nullptr); }

} // namespace

Json valueJson(const Value& v) {
  if (v.null) return nullptr;
  if (v.isArray()) {
    Json array = Json::array();
    for (const Value& e : v.elements) array.push_back(valueJson(e));
    return array;
  }
  if (v.isText()) return v.text;
  switch (v.type) {
  case CMPI_boolean: return v.scalar.boolean != 0;
  case CMPI_char16: return std::string(1, static_cast<char>(v.scalar.char16));
  case CMPI_real32: return v.scalar.real32;
  case CMPI_real64: return v.scalar.real64;
  case CMPI_sint8:
  case CMPI_sint16:
  case CMPI_sint32:
  case CMPI_sint64: return v.asSigned();
  case CMPI_ref: return v.ref ? pathJson(*v.ref) : Json(nullptr);
  case CMPI_instance: {
    if (!v.instance) return nullptr;
    Json properties = Json::array();
    for (const auto& p : v.instance->properties) properties.push_back(bindingJson(p));
    return Json{{"path", pathJson(v.instance->path)}, {"properties", properties}};
  }
  default: return v.asUnsigned();
  }
}

Json bindingJson(const tvr::broker::Binding& b) {
  return Json{{"name", b.name},
              {"type", tvr::broker::cimTypeName(b.value.type)},
              {"cmpiType", tvr::broker::typeName(b.value.type)},
              {"value", valueJson(b.value)}};
}

Json pathJson(const tvr::broker::ObjectPath& path) {
  Json keys = Json::array();
  for (const auto& k : path.keys) keys.push_back(bindingJson(k));
  return Json{{"text", tvr::broker::formatObjectPath(path)},
              {"namespace", path.nameSpace},
              {"host", path.host},
              {"className", path.className},
              {"keys", keys}};
}

Json itemJson(const ResultItem& item) {
  switch (item.kind) {
  case ResultItem::Kind::ObjectPath: return Json{{"kind", "path"}, {"path", pathJson(item.path)}};
  case ResultItem::Kind::Instance: {
    Json properties = Json::array();
    for (const auto& p : item.instance.properties) properties.push_back(bindingJson(p));
    return Json{{"kind", "instance"}, {"path", pathJson(item.path)}, {"properties", properties}};
  }
  case ResultItem::Kind::NullObjectPath: return Json{{"kind", "null path"}};
  case ResultItem::Kind::NullInstance: return Json{{"kind", "null instance"}};
  case ResultItem::Kind::Data:
    return Json{{"kind", "data"}, {"type", tvr::broker::cimTypeName(item.data.type)}, {"value", valueJson(item.data)}};
  }
  return nullptr;
}

Json statusJson(CMPIrc rc, const std::optional<std::string>& message) {
  return Json{
      {"code", static_cast<int>(rc)}, {"name", tvr::broker::statusName(rc)}, {"message", optionalText(message)}};
}

Json exceptionJson(const std::optional<tvr::broker::EscapedException>& exception) {
  if (!exception) return nullptr;
  return Json{{"type", exception->type}, {"what", exception->what}};
}

Json outcomeJson(const tvr::broker::ProviderOutcome& outcome) {
  return Json{{"provider", outcome.provider},
              {"className", outcome.className},
              {"status", statusJson(outcome.rc, outcome.message)},
              {"exception", exceptionJson(outcome.exception)}};
}

Json requestJson(const Request& request) {
  const tvr::broker::AssociationArgs& a = request.args;
  Json properties = nullptr;
  if (a.properties) properties = Json(*a.properties);
  return Json{{"target", pathJson(request.target)},
              {"assocClass", optionalText(a.assocClass)},
              {"resultClass", optionalText(a.resultClass)},
              {"role", optionalText(a.role)},
              {"resultRole", optionalText(a.resultRole)},
              {"properties", properties},
              {"everyAssociationProvider", request.everyAssociationProvider}};
}

std::string dumped(const Json& value) {
  // Hardware strings are not always valid UTF-8; a bad byte must not cost
  // the whole answer.
  return value.dump(2, ' ', false, Json::error_handler_t::replace);
}

std::string nested(const Json& value, std::size_t indent) {
  const std::string text = dumped(value);
  std::string out;
  const std::string margin = "\n" + std::string(indent, ' ');
  for (char c : text) {
    if (c == '\n')
      out += margin;
    else
      out += c;
  }
  return out;
}

} // namespace tvrpa
