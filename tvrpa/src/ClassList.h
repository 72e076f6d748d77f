// `tvrpa classes`: the classes the registration serves.
#pragma once

#include "tvr/broker/Registration.h"

#include <ostream>

namespace tvrpa {

/// One line per class, in registration order: class, provider, kinds,
/// namespaces, under a heading line.
void writeClassesText(std::ostream& out, const tvr::broker::RegistrationTable& registration);

/// [{"className", "provider", "location", "kinds": [...], "namespaces": [...]}].
void writeClassesJson(std::ostream& out, const tvr::broker::RegistrationTable& registration);

} // namespace tvrpa
