// Where a request's CMPIResult sends what the provider returns.
#pragma once

#include "tvr/broker/Value.h"

namespace tvr::broker::detail {

class ResultSink {
public:
  virtual ~ResultSink() = default;
  /// A returned object path; null when the provider returned a null or hollow one.
  virtual void onPath(const ObjectPath* path) = 0;
  /// A returned instance with its object path; both null when the provider
  /// returned a null or hollow instance.
  virtual void onInstance(const Instance* instance, const ObjectPath* path) = 0;
  virtual void onData(const Value& value) = 0;
  virtual void onDone() = 0;
};

} // namespace tvr::broker::detail
