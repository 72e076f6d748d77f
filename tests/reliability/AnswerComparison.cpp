#include "AnswerComparison.h"

#include "tvr/broker/PathText.h"

namespace tvr::reliability {

namespace {

using broker::ResultItem;
using broker::TraceLine;

std::string text(const std::optional<std::string>& value) { return value ? "\"" + *value + "\"" : "null"; }

std::string exceptionText(const std::optional<broker::EscapedException>& exception) {
  return exception ? exception->type + "(" + exception->what + ")" : "none";
}

bool sameException(const std::optional<broker::EscapedException>& a,
                   const std::optional<broker::EscapedException>& b) {
  if (!a || !b) return !a && !b;
  return a->type == b->type && a->what == b->what;
}

bool sameItem(const ResultItem& a, const ResultItem& b) {
  return a.kind == b.kind && a.path == b.path && a.instance == b.instance && a.data == b.data;
}

bool sameTrace(const TraceLine& a, const TraceLine& b) {
  return a.source == b.source && a.level == b.level && a.component == b.component && a.text == b.text &&
         a.string == b.string && a.broker == b.broker;
}

std::string itemText(const ResultItem& item) {
  switch (item.kind) {
  case ResultItem::Kind::ObjectPath: return "path " + broker::formatObjectPath(item.path);
  case ResultItem::Kind::Instance: return "instance " + broker::formatObjectPath(item.path);
  case ResultItem::Kind::Data: return "data " + broker::formatValue(item.data);
  case ResultItem::Kind::NullObjectPath: return "null path";
  case ResultItem::Kind::NullInstance: return "null instance";
  }
  return "?";
}

} // namespace

std::string answerDifference(const broker::Response& expected, const broker::Response& actual) {
  if (expected.rc != actual.rc)
    return "status " + broker::statusName(actual.rc) + ", expected " + broker::statusName(expected.rc);
  if (expected.message != actual.message)
    return "message " + text(actual.message) + ", expected " + text(expected.message);
  if (!sameException(expected.exception, actual.exception))
    return "exception " + exceptionText(actual.exception) + ", expected " + exceptionText(expected.exception);
  if (expected.doneCount != actual.doneCount)
    return "completed " + std::to_string(actual.doneCount) + " times, expected " +
           std::to_string(expected.doneCount);
  if (expected.items.size() != actual.items.size())
    return std::to_string(actual.items.size()) + " elements, expected " + std::to_string(expected.items.size());
  for (std::size_t i = 0; i < expected.items.size(); ++i)
    if (!sameItem(expected.items[i], actual.items[i]))
      return "element " + std::to_string(i) + " is " + itemText(actual.items[i]) + ", expected " +
             itemText(expected.items[i]) + (expected.items[i].path == actual.items[i].path ? " (other values)" : "");
  if (expected.traces.size() != actual.traces.size())
    return std::to_string(actual.traces.size()) + " broker trace calls, expected " +
           std::to_string(expected.traces.size());
  for (std::size_t i = 0; i < expected.traces.size(); ++i)
    if (!sameTrace(expected.traces[i], actual.traces[i]))
      return "broker trace call " + std::to_string(i) + " is \"" + actual.traces[i].str() + "\", expected \"" +
             expected.traces[i].str() + "\"";
  if (expected.outcomes.size() != actual.outcomes.size())
    return std::to_string(actual.outcomes.size()) + " providers asked, expected " +
           std::to_string(expected.outcomes.size());
  for (std::size_t i = 0; i < expected.outcomes.size(); ++i) {
    const broker::ProviderOutcome& a = expected.outcomes[i];
    const broker::ProviderOutcome& b = actual.outcomes[i];
    if (a.provider != b.provider || a.className != b.className || a.rc != b.rc || a.message != b.message ||
        !sameException(a.exception, b.exception))
      return "provider " + std::to_string(i) + " (" + b.provider + ") ended otherwise than " + a.provider;
  }
  return std::string();
}

} // namespace tvr::reliability
