#include "Output.h"

#include "tvr/broker/PathText.h"

#include <nlohmann/json.hpp>

namespace tvrpa {

namespace {

using Json = nlohmann::ordered_json;
using tvr::broker::ObjectPath;
using tvr::broker::ResultItem;
using tvr::broker::Value;

Json pathJson(const ObjectPath& path);

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
  default: return v.asUnsigned();
  }
}

Json bindingJson(const tvr::broker::Binding& b) {
  return Json{{"name", b.name},
              {"type", tvr::broker::cimTypeName(b.value.type)},
              {"cmpiType", tvr::broker::typeName(b.value.type)},
              {"value", valueJson(b.value)}};
}

Json pathJson(const ObjectPath& path) {
  Json keys = Json::array();
  for (const auto& k : path.keys) keys.push_back(bindingJson(k));
  return Json{{"text", tvr::broker::formatObjectPath(path)},
              {"namespace", path.nameSpace},
              {"host", path.host},
              {"className", path.className},
              {"keys", keys}};
}

Json optionalText(const std::optional<std::string>& text) { return text ? Json(*text) : Json(nullptr); }

} // namespace

void writeJson(std::ostream& out, const tvr::broker::Response& response) {
  Json doc;
  doc["operation"] = tvr::broker::operationName(response.operation);
  doc["status"] = Json{{"code", static_cast<int>(response.rc)},
                       {"name", tvr::broker::statusName(response.rc)},
                       {"message", optionalText(response.message)}};
  doc["done"] = response.done();
  doc["exception"] = response.exception
                         ? Json{{"type", response.exception->type}, {"what", response.exception->what}}
                         : Json(nullptr);
  Json items = Json::array();
  for (const ResultItem& item : response.items) {
    switch (item.kind) {
    case ResultItem::Kind::ObjectPath: items.push_back(Json{{"kind", "path"}, {"path", pathJson(item.path)}}); break;
    case ResultItem::Kind::Instance: {
      Json properties = Json::array();
      for (const auto& p : item.instance.properties) properties.push_back(bindingJson(p));
      items.push_back(Json{{"kind", "instance"}, {"path", pathJson(item.path)}, {"properties", properties}});
      break;
    }
    case ResultItem::Kind::NullObjectPath: items.push_back(Json{{"kind", "null path"}}); break;
    case ResultItem::Kind::NullInstance: items.push_back(Json{{"kind", "null instance"}}); break;
    case ResultItem::Kind::Data:
      items.push_back(Json{{"kind", "data"},
                           {"type", tvr::broker::cimTypeName(item.data.type)},
                           {"value", valueJson(item.data)}});
      break;
    }
  }
  doc["items"] = items;
  out << doc.dump(2) << "\n";
}

} // namespace tvrpa
