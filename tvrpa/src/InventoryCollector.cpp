#include "InventoryCollector.h"

#include <strings.h>

namespace tvrpa {

namespace {

using tvr::broker::ClassRegistration;
using tvr::broker::ResultItem;

bool serves(const ClassRegistration& reg, const std::string& nameSpace) {
  for (const std::string& ns : reg.namespaces)
    if (strcasecmp(ns.c_str(), nameSpace.c_str()) == 0) return true;
  return false;
}

// Takes what the picture needs from each instance as it comes, and lets the
// instance go.
class Gatherer : public tvr::broker::ResultObserver {
public:
  Gatherer(Inventory& inventory, InventoryClass& report) : inventory_(inventory), report_(report) {}
  void onItem(const ResultItem& item) override {
    if (item.kind != ResultItem::Kind::Instance) return;
    ++report_.instances;
    if (!report_.association)
      inventory_.addElement(item.path);
    else if (!inventory_.addAssociation(item.instance))
      ++report_.unreadable;
  }

private:
  Inventory& inventory_;
  InventoryClass& report_;
};

ExitStatus enumerate(tvr::broker::ObjectManager& om, Inventory& inventory, InventoryClass& report, TraceEcho& echo,
                     std::ostream& err) {
  Request request;
  request.operation = tvr::broker::Operation::EnumerateInstances;
  request.target = tvr::broker::ObjectPath(inventory.nameSpace, report.className);
  echo.request(request);
  Gatherer gatherer(inventory, report);
  tvr::broker::RequestOptions options;
  options.observer = &gatherer;
  options.keepItems = false;
  options.keepTraces = false;
  options.traceObserver = echo.brokerTraceObserver();
  report.answer = send(om, request, options);
  report.done = report.answer.done();
  echo.finished(report.answer, report.instances);
  reportFailures(report.answer, err, report.className);
  return exitStatusOf(report.answer);
}

} // namespace

ExitStatus collectInventory(tvr::broker::ObjectManager& om, Inventory& inventory, TraceEcho& echo, std::ostream& err) {
  for (bool associations : {false, true})
    for (const ClassRegistration& reg : om.registration().classes()) {
      if (reg.association != associations || !serves(reg, inventory.nameSpace)) continue;
      if (!reg.instance && !reg.association) continue;
      InventoryClass report;
      report.className = reg.className;
      report.provider = reg.provider;
      report.association = reg.association;
      if (!reg.instance) report.whyNotAsked = "no instance provider is registered for it";
      inventory.classes.push_back(std::move(report));
    }

  ExitStatus status = kExitOk;
  for (InventoryClass& report : inventory.classes) {
    if (!report.whyNotAsked.empty()) {
      echo.note(report.className + " is not enumerated: " + report.whyNotAsked);
      continue;
    }
    report.asked = true;
    status = worse(status, enumerate(om, inventory, report, echo, err));
  }
  return status;
}

} // namespace tvrpa
