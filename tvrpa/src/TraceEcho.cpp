#include "TraceEcho.h"

#include <KVLog/KVLogConfig.h>

namespace tvrpa {

namespace {

std::string brokerLine(const tvr::broker::TraceLine& t) {
  const char* source = t.source == tvr::broker::TraceLine::Source::Trace ? "broker" : "broker-log";
  std::string out = "[" + std::string(source) + " " + std::to_string(t.level) + " " + t.component.value_or("(null)") +
                    "] " + t.text.value_or("(null)");
  if (t.string) out += " " + *t.string;
  return out;
}

std::string outcomeLine(const tvr::broker::ProviderOutcome& o) {
  std::string out = "[tvrpa] " + o.provider + " (" + o.className + "): ";
  if (o.exception)
    return out + "exception " + o.exception->type + (o.exception->what.empty() ? "" : ": " + o.exception->what);
  out += tvr::broker::statusName(o.rc);
  if (o.message) out += ": " + *o.message;
  return out;
}

} // namespace

TraceEcho::TraceEcho(bool enabled, std::ostream& err) : enabled_(enabled), err_(err) {
  if (!enabled_) return;
  listener_ = KVLog::addListener([this](const KVLog::Message& m) {
    const char* channel = m.channel == KVLog::Channel::Log ? "log" : "trace";
    line("[" + std::string(channel) + " " + std::to_string(m.level) + " " + m.category + "] " + m.text);
  });
}

TraceEcho::~TraceEcho() {
  if (listener_ >= 0) KVLog::removeListener(listener_);
}

void TraceEcho::line(const std::string& text) {
  std::lock_guard<std::mutex> lock(mutex_);
  err_ << text << "\n";
  err_.flush();
}

void TraceEcho::request(const Request& request) {
  if (enabled_) line("[tvrpa] " + describe(request));
}

void TraceEcho::note(const std::string& text) {
  if (enabled_) line("[tvrpa] " + text);
}

std::function<void(const tvr::broker::TraceLine&)> TraceEcho::brokerTraceObserver() {
  if (!enabled_) return {};
  return [this](const tvr::broker::TraceLine& t) { line(brokerLine(t)); };
}

void TraceEcho::finished(const tvr::broker::Response& response, std::size_t items) {
  if (!enabled_) return;
  for (const tvr::broker::ProviderOutcome& o : response.outcomes) line(outcomeLine(o));
  if (response.outcomes.empty() && response.rc != CMPI_RC_OK)
    line("[tvrpa] no provider asked: " + tvr::broker::statusName(response.rc) + ": " + response.message.value_or(""));
  line("[tvrpa] " + std::to_string(items) + (items == 1 ? " item" : " items") + ", returnDone called " +
       std::to_string(response.doneCount) + (response.doneCount == 1 ? " time" : " times"));
}

} // namespace tvrpa
