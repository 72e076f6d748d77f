#include "AnswerWriter.h"

#include "JsonModel.h"
#include "MofText.h"

#include "tvr/broker/PathText.h"

#include <algorithm>

namespace tvrpa {

namespace {

using tvr::broker::ResultItem;

// Paths one per line; an instance as its path and one line per property,
// instances separated by a blank line. Values are written with escapes, so
// a property with a line break still takes one line.
class TextWriter : public AnswerWriter {
public:
  explicit TextWriter(std::ostream& out) : out_(out) {}
  void begin(const Request&) override {}
  void end(const tvr::broker::Response&) override { out_.flush(); }

protected:
  void write(const ResultItem& item) override {
    const bool block = item.kind == ResultItem::Kind::Instance || item.kind == ResultItem::Kind::NullInstance;
    if (block && !first_) out_ << "\n";
    first_ = false;
    switch (item.kind) {
    case ResultItem::Kind::ObjectPath: out_ << tvr::broker::formatObjectPath(item.path) << "\n"; break;
    case ResultItem::Kind::NullObjectPath: out_ << "(null object path)\n"; break;
    case ResultItem::Kind::NullInstance: out_ << "(null instance)\n"; break;
    case ResultItem::Kind::Data: out_ << mofValue(item.data) << "\n"; break;
    case ResultItem::Kind::Instance: {
      out_ << tvr::broker::formatObjectPath(item.path) << "\n";
      std::size_t width = 0;
      for (const auto& p : item.instance.properties) width = std::max(width, p.name.size());
      for (const auto& p : item.instance.properties)
        out_ << "    " << p.name << std::string(width - p.name.size(), ' ') << " = " << mofValue(p.value) << "\n";
      break;
    }
    }
  }

private:
  std::ostream& out_;
  bool first_ = true;
};

// Instances as MOF declarations, each after a comment with its path; all
// else as in text.
class MofWriter : public AnswerWriter {
public:
  explicit MofWriter(std::ostream& out) : out_(out) {}
  void begin(const Request&) override {}
  void end(const tvr::broker::Response&) override { out_.flush(); }

protected:
  void write(const ResultItem& item) override {
    const bool block = item.kind == ResultItem::Kind::Instance || item.kind == ResultItem::Kind::NullInstance;
    if (block && !first_) out_ << "\n";
    first_ = false;
    switch (item.kind) {
    case ResultItem::Kind::Instance:
      out_ << "// " << tvr::broker::formatObjectPath(item.path) << "\n" << instanceMof(item.instance);
      break;
    case ResultItem::Kind::NullInstance: out_ << "// (null instance)\n"; break;
    case ResultItem::Kind::ObjectPath: out_ << tvr::broker::formatObjectPath(item.path) << "\n"; break;
    case ResultItem::Kind::NullObjectPath: out_ << "(null object path)\n"; break;
    case ResultItem::Kind::Data: out_ << mofValue(item.data) << "\n"; break;
    }
  }

private:
  std::ostream& out_;
  bool first_ = true;
};

// One JSON object, written in pieces: the request first, then each element
// as it comes, then what is known only at the end (status, done, providers).
class JsonWriter : public AnswerWriter {
public:
  explicit JsonWriter(std::ostream& out) : out_(out) {}

  void begin(const Request& request) override {
    out_ << "{\n  \"operation\": " << Json(tvr::broker::operationName(request.operation)).dump()
         << ",\n  \"request\": " << nested(requestJson(request), 2) << ",\n  \"items\": [";
  }

  void end(const tvr::broker::Response& response) override {
    out_ << (itemCount() ? "\n  ]" : "]");
    Json providers = Json::array();
    for (const tvr::broker::ProviderOutcome& o : response.outcomes) providers.push_back(outcomeJson(o));
    out_ << ",\n  \"status\": " << nested(statusJson(response.rc, response.message), 2)
         << ",\n  \"done\": " << (response.done() ? "true" : "false")
         << ",\n  \"exception\": " << nested(exceptionJson(response.exception), 2)
         << ",\n  \"providers\": " << nested(providers, 2) << "\n}\n";
    out_.flush();
  }

protected:
  void write(const ResultItem& item) override {
    out_ << (itemCount() > 1 ? ",\n    " : "\n    ") << nested(itemJson(item), 4);
  }

private:
  std::ostream& out_;
};

} // namespace

std::unique_ptr<AnswerWriter> makeAnswerWriter(Format format, std::ostream& out) {
  switch (format) {
  case Format::Mof: return std::make_unique<MofWriter>(out);
  case Format::Json: return std::make_unique<JsonWriter>(out);
  default: return std::make_unique<TextWriter>(out);
  }
}

} // namespace tvrpa
