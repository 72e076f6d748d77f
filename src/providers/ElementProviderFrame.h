// The three read handlers every element provider runs: enumerate names,
// enumerate instances, get one instance. A provider differs from another
// only in the values of its ElementFrame.
#pragma once

#include "Trace.h"

#include <cmpift.h>

#include <string>
#include <vector>

namespace HX::PhysicalAssetProvider {

struct ElementFrame {
  /// The class the handlers serve, compared without regard to case.
  const char* className;
  /// The component of the provider's broker traces.
  const char* component;
  /// The provider's log category.
  const std::string& category;
  unsigned short (*allPaths)(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*,
                             std::vector<CMPIObjectPath*>&, CMPIStatus*);
  unsigned short (*allInstances)(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const char**,
                                 std::vector<CMPIInstance*>&, CMPIStatus*);
  unsigned short (*oneInstance)(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const char**,
                                CMPIInstance*&, CMPIStatus*);
};

/// Answers with the path of every element when `ref` names the frame's
/// class (in any case of letters); with nothing, and OK, for any other class.
CMPIStatus enumElementNames(const ElementFrame& frame, const CMPIBroker* broker, const TraceOrigin& at,
                            CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* result,
                            const CMPIObjectPath* ref);

/// Answers with every element's instance, as enumElementNames does with
/// paths. With `compareClass` false the class is read but not compared, so
/// the list function answers whatever class the request names.
CMPIStatus enumElementInstances(const ElementFrame& frame, const CMPIBroker* broker, const TraceOrigin& at,
                                CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* result,
                                const CMPIObjectPath* ref, const char** properties, bool compareClass = true);

/// Answers with the instance `cop` names; an element that does not exist is
/// no error: the answer is then empty and OK.
CMPIStatus getElementInstance(const ElementFrame& frame, const CMPIBroker* broker, const TraceOrigin& at,
                              CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* result,
                              const CMPIObjectPath* cop, const char** properties);

} // namespace HX::PhysicalAssetProvider
