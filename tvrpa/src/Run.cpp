#include "Run.h"

#include "AnswerWriter.h"
#include "ClassList.h"
#include "InventoryCollector.h"
#include "InventoryOutput.h"
#include "Request.h"
#include "Session.h"
#include "TraceEcho.h"

namespace tvrpa {

ExitStatus runCimOperation(const CommandLine& cl, std::ostream& out, std::ostream& err) {
  Session session(cl);
  tvr::broker::ObjectManager& om = session.objectManager();
  const Request request = requestFor(cl);
  TraceEcho echo(cl.trace, err);
  std::unique_ptr<AnswerWriter> writer = makeAnswerWriter(cl.format, out);

  echo.request(request);
  writer->begin(request);
  tvr::broker::Response response;
  response.operation = request.operation;
  const std::string nobody = whyNobodyIsAsked(request, om.registration());
  if (nobody.empty()) {
    tvr::broker::RequestOptions options;
    options.observer = writer.get();
    options.keepItems = false;
    options.keepTraces = false;
    options.traceObserver = echo.brokerTraceObserver();
    response = send(om, request, options);
  } else {
    err << "tvrpa: " << nobody << "\n";
  }
  writer->end(response);
  echo.finished(response, writer->itemCount());
  reportFailures(response, err);
  return exitStatusOf(response);
}

ExitStatus runInventory(const CommandLine& cl, std::ostream& out, std::ostream& err) {
  Session session(cl);
  TraceEcho echo(cl.trace, err);
  Inventory inventory;
  inventory.source = session.hardwareSource();
  inventory.nameSpace = cl.nameSpace;
  const ExitStatus status = collectInventory(session.objectManager(), inventory, echo, err);
  switch (cl.format) {
  case Format::Json: writeInventoryJson(out, inventory); break;
  case Format::Dot: writeInventoryDot(out, inventory); break;
  default: writeInventoryText(out, inventory); break;
  }
  return status;
}

ExitStatus runClasses(const CommandLine& cl, std::ostream& out) {
  const tvr::broker::RegistrationTable registration = loadRegistration(cl);
  if (cl.format == Format::Json)
    writeClassesJson(out, registration);
  else
    writeClassesText(out, registration);
  return kExitOk;
}

} // namespace tvrpa
