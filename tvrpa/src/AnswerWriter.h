// Prints the answer of one CIM operation while the provider returns it, so
// that a large answer never has to be held in memory.
#pragma once

#include "Commands.h"
#include "Request.h"

#include "tvr/broker/ObjectManager.h"

#include <memory>
#include <ostream>

namespace tvrpa {

/// Sees each element as it is returned (through RequestOptions::observer)
/// and writes it at once. begin() comes before the request is sent, end()
/// after it has ended.
class AnswerWriter : public tvr::broker::ResultObserver {
public:
  virtual void begin(const Request& request) = 0;
  virtual void end(const tvr::broker::Response& response) = 0;
  /// How many elements were written.
  std::size_t itemCount() const { return items_; }

  void onItem(const tvr::broker::ResultItem& item) final {
    ++items_;
    write(item);
  }

protected:
  virtual void write(const tvr::broker::ResultItem& item) = 0;

private:
  std::size_t items_ = 0;
};

/// text, mof or json, writing to `out`.
std::unique_ptr<AnswerWriter> makeAnswerWriter(Format format, std::ostream& out);

} // namespace tvrpa
