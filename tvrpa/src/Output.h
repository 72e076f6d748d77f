// Printing an answer: text for people, JSON for scripts.
#pragma once

#include "tvr/broker/Response.h"

#include <ostream>

namespace tvrpa {

/// Writes the elements of the answer in the order the provider returned them.
void writeText(std::ostream& out, const tvr::broker::Response& response);

/// Writes the whole answer as one JSON object: status, whether returnDone
/// came, and the paths or instances with every property's CIM type.
void writeJson(std::ostream& out, const tvr::broker::Response& response);

} // namespace tvrpa
