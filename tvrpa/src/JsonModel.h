// CIM data as JSON, the same way in every JSON tvrpa prints: paths with
// their text and typed keys, values with their CIM and CMPI types, statuses
// by code and CMPI name.
#pragma once

#include "Request.h"

#include "tvr/broker/Response.h"

#include <nlohmann/json.hpp>

#include <optional>
#include <string>

namespace tvrpa {

using Json = nlohmann::ordered_json;

/// {"text", "namespace", "host", "className", "keys": [binding...]}; a
/// reference key's value is the referenced path in this same form.
Json pathJson(const tvr::broker::ObjectPath& path);
/// The value itself: a string, number, boolean, array, path object or null.
Json valueJson(const tvr::broker::Value& value);
/// {"name", "type" (CIM), "cmpiType", "value"}.
Json bindingJson(const tvr::broker::Binding& binding);
/// One element of an answer: {"kind": "instance"|"path"|..., ...}.
Json itemJson(const tvr::broker::ResultItem& item);
/// {"code", "name", "message"}.
Json statusJson(CMPIrc rc, const std::optional<std::string>& message);
/// {"type", "what"} or null.
Json exceptionJson(const std::optional<tvr::broker::EscapedException>& exception);
/// {"provider", "className", "status", "exception"}.
Json outcomeJson(const tvr::broker::ProviderOutcome& outcome);
/// {"target", "assocClass", "resultClass", "role", "resultRole",
/// "properties", "everyAssociationProvider"}.
Json requestJson(const Request& request);

/// `value` pretty-printed with two-blank indentation; bytes that are not
/// UTF-8 are replaced rather than refused.
std::string dumped(const Json& value);

/// `value` pretty-printed, its lines after the first indented by `indent`
/// blanks, to nest it in a document written piece by piece.
std::string nested(const Json& value, std::size_t indent);

} // namespace tvrpa
