// Fills an Inventory by enumerating, once each, every element class and
// then every association class the registration serves in a namespace.
#pragma once

#include "ExitStatus.h"
#include "Inventory.h"
#include "TraceEcho.h"

#include "tvr/broker/ObjectManager.h"

#include <ostream>

namespace tvrpa {

/// Sends EnumerateInstances for each class, in registration order, element
/// classes first, so that associations find the elements they name. A class
/// whose provider fails is reported on `err` and the others still are
/// enumerated. Returns the worst exit status of all requests.
ExitStatus collectInventory(tvr::broker::ObjectManager& om, Inventory& inventory, TraceEcho& echo, std::ostream& err);

} // namespace tvrpa
