// What one request to a provider produced, as the embedded object manager
// saw it: the answer's elements in order, the status, whether the answer was
// completed, and every trace call the provider made through the broker.
#pragma once

#include "tvr/broker/Value.h"

#include <cmpidt.h>

#include <optional>
#include <string>
#include <vector>

namespace tvr::broker {

/// One element a provider handed to its result object.
struct ResultItem {
  enum class Kind {
    ObjectPath,     ///< returnObjectPath with a path
    Instance,       ///< returnInstance with an instance
    Data,           ///< returnData
    NullObjectPath, ///< returnObjectPath with a null (or hollow) path
    NullInstance,   ///< returnInstance with a null (or hollow) instance
  };
  Kind kind = Kind::Instance;
  ObjectPath path;   ///< for ObjectPath; for Instance the instance's own path
  Instance instance; ///< for Instance
  Value data;        ///< for Data
};

/// One call of the broker's trace function (`CMTraceMessage`), or of its
/// log function (`CMLogMessage`: `level` is then the severity and
/// `component` the message id).
struct TraceLine {
  enum class Source { Trace, LogMessage };
  Source source = Source::Trace;
  int level = 0;
  std::optional<std::string> component; ///< nullopt when the provider passed null
  std::optional<std::string> text;
  std::optional<std::string> string; ///< the CMPIString argument, if any
  const void* broker = nullptr;      ///< which broker the call went through

  std::string str() const; ///< "level component: text", for messages
};

/// An exception that left a provider's handler instead of a status.
struct EscapedException {
  std::string type; ///< demangled type name, e.g. "std::out_of_range"
  std::string what; ///< what() for standard exceptions, empty otherwise
};

/// The CMPI operations the object manager can send.
enum class Operation {
  EnumerateInstanceNames,
  EnumerateInstances,
  GetInstance,
  Associators,
  AssociatorNames,
  References,
  ReferenceNames,
};

const char* operationName(Operation op);

/// How one provider's handler ended.
struct ProviderOutcome {
  std::string provider;  ///< provider name, as registered
  std::string className; ///< the registration the request went through
  CMPIrc rc = CMPI_RC_OK;
  std::optional<std::string> message;
  std::optional<EscapedException> exception;
};

/// The answer of one provider (or, for association requests that reach
/// several providers, of every provider asked, merged in the order asked).
struct Response {
  Operation operation = Operation::EnumerateInstances;
  std::vector<ProviderOutcome> outcomes; ///< one per provider asked, in order

  CMPIrc rc = CMPI_RC_OK;
  std::optional<std::string> message; ///< the status message, if any
  int doneCount = 0;                  ///< how often returnDone was called
  std::vector<ResultItem> items;
  std::vector<TraceLine> traces;
  std::optional<EscapedException> exception;

  bool ok() const { return rc == CMPI_RC_OK && !exception; }
  bool done() const { return doneCount > 0; }
  /// Paths of all items that carry one (object paths and instances).
  std::vector<ObjectPath> paths() const;
  /// All returned instances, in order (null instances left out).
  std::vector<Instance> instances() const;
};

/// The CMPI name of a status code, e.g. "CMPI_RC_ERR_NOT_SUPPORTED".
std::string statusName(CMPIrc rc);

} // namespace tvr::broker
