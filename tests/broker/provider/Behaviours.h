// The broker test provider: one small CMPI provider library whose behaviour
// is chosen by the class a request names, so that every broker test shows in
// its request what the provider is asked to do.
//
// The instance provider (InstanceProvider.cpp) looks the class of each
// request up in a table and runs the behaviour registered for it. The
// behaviours are grouped by theme: answers (AnswerBehaviours.cpp), up-calls
// (UpCallBehaviours.cpp), the broker's thread and memory services
// (ServiceBehaviours.cpp) and probes of the broker's argument checks
// (ProbeBehaviours.cpp). Two association providers (EchoAssociationProvider,
// OtherAssociationProvider) echo the arguments they were given.
#pragma once

#include <cmpidt.h>
#include <cmpift.h>
#include <cmpimacs.h>

#include <string>

namespace tvrtest {

/// The instance operations the behaviours serve.
enum class Operation { EnumerateInstanceNames, EnumerateInstances, GetInstance };

/// One call of the instance provider, as the behaviour sees it.
struct Request {
  const CMPIBroker* broker;
  const CMPIContext* context;
  const CMPIResult* result;
  const CMPIObjectPath* path;
  const char** properties;
  Operation operation;
};

using Behaviour = CMPIStatus (*)(const Request&);

// --- Helpers shared by the behaviours (Helpers.cpp) -------------------------

CMPIStatus ok();
/// A status with a message made by the broker.
CMPIStatus failure(const CMPIBroker* broker, CMPIrc rc, const std::string& message);
/// Returns `text` as a data element of type CMPI_chars.
void returnText(const CMPIResult* result, const std::string& text);
/// Returns "<label> <rc>" as a data element: how a probe reports a status.
void returnStatus(const CMPIResult* result, const std::string& label, CMPIrc rc);
/// The text of a CMPIString, or "" for a null one.
std::string textOf(const CMPIString* s);
/// The text of a string key of `path`, or "" when there is none.
std::string keyText(const CMPIObjectPath* path, const char* key);
/// The namespace of `path`.
std::string nameSpaceOf(const CMPIObjectPath* path);
/// The class name of `path`.
std::string classNameOf(const CMPIObjectPath* path);
/// "null" for a null object, "hollow" for one without a handle, "ok" otherwise.
std::string shapeOf(const void* object);
/// The calling thread, as a number a test can compare with its own.
CMPIUint64 currentThreadNumber();

// --- Answers (AnswerBehaviours.cpp) ------------------------------------------

/// Paths and instances carrying every CMPI type the broker copies.
CMPIStatus answerAllTypes(const Request& request);
/// Paths, instances, data and null elements in a fixed order.
CMPIStatus answerSequence(const Request& request);
/// A null instance, and no returnDone.
CMPIStatus answerNullInstance(const Request& request);
/// One path, then returnDone twice.
CMPIStatus answerDoneTwice(const Request& request);
/// CMPI_RC_ERR_NOT_FOUND with the message "no such widget".
CMPIStatus answerError(const Request& request);
/// Throws std::out_of_range (instances) or a non-standard exception (names).
CMPIStatus answerByThrowing(const Request& request);
/// An instance whose path has no keys, only key properties.
CMPIStatus answerKeyless(const Request& request);
/// An instance echoing the request's Id key, with a trace line naming it.
CMPIStatus answerEcho(const Request& request);
/// Broker trace and log calls, with and without their optional arguments.
CMPIStatus answerWithTraces(const Request& request);
/// Every entry of the request's context, then an entry added and read back.
CMPIStatus answerWithContext(const Request& request);

// --- Up-calls (UpCallBehaviours.cpp) -----------------------------------------

/// Makes the up-call named by the Call key to the class named by Target and
/// returns what it got, with the up-call's status.
CMPIStatus answerByUpCall(const Request& request);
/// Up-calls its own class again and again, until the broker refuses.
CMPIStatus answerByRecursiveUpCall(const Request& request);

// --- Broker services (ServiceBehaviours.cpp) ----------------------------------

/// Threads, thread keys, once, mutex and condition through xft.
CMPIStatus answerWithThreadServices(const Request& request);
/// malloc, calloc, realloc, strdup, free, mark and release through mft.
CMPIStatus answerWithMemoryServices(const Request& request);
/// Makes many megabytes of broker objects, and frees some of them early, as
/// the Action key asks; reports "made" and "released" as data in between.
CMPIStatus answerWithBulkObjects(const Request& request);
/// Makes one object of every kind and releases each with CMRelease.
CMPIStatus answerByReleasingObjects(const Request& request);
/// Makes objects on a thread of its own (outside any request), or releases
/// them again, as the Action key asks.
CMPIStatus answerWithHelperThreadObjects(const Request& request);
/// Forgets the objects of answerWithHelperThreadObjects (provider cleanup).
void forgetHelperThreadObjects();

// --- Probes (ProbeBehaviours.cpp) --------------------------------------------

/// Calls newObjectPath, newInstance and newArray three times each and
/// reports what each call gave.
CMPIStatus answerWithFactoryResults(const Request& request);
/// Calls broker functions with null arguments, foreign objects and objects
/// of the wrong kind; reports every status.
CMPIStatus answerWithNullArgumentProbes(const Request& request);
/// Expects the broker's next newObjectPath, newInstance and newArray to give
/// hollow objects, and calls every function on them; reports every status.
CMPIStatus answerWithHollowObjectProbes(const Request& request);

// --- Association providers (AssociationEcho.cpp) -----------------------------

/// The text arguments of an association call (null where the call had none).
struct AssociationCall {
  const char* provider; ///< "Echo" or "Other"
  const char* operation;
  const CMPIBroker* broker;
  const CMPIResult* result;
  const CMPIObjectPath* source;
  const char* assocClass;
  const char* resultClass;
  const char* role;
  const char* resultRole;
  const char** properties;
  bool hasAssocClassAndResultRole; ///< false for references and referenceNames
};

/// Echoes the call's arguments as one data element; fails instead when the
/// source's class is TVR_FailEverywhere or TVR_FailIn<provider>.
CMPIStatus answerAssociation(const AssociationCall& call);

} // namespace tvrtest
