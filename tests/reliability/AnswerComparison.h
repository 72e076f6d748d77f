// Whether two answers of the object manager are the same answer: what a
// client would receive and what the provider told the object manager on the
// way (its broker trace calls), not the logger lines, which may mix when
// requests run at once.
#pragma once

#include "tvr/broker/Response.h"

#include <string>

namespace tvr::reliability {

/// Empty when \p actual is the answer \p expected is: the same status and
/// message, the same elements in the same order, completed as often, the same
/// broker trace calls, the same escaped exception, from the same providers.
/// Otherwise the first difference, in words.
std::string answerDifference(const broker::Response& expected, const broker::Response& actual);

} // namespace tvr::reliability
