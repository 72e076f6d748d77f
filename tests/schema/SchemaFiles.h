// The schema files the schema tests read: the project's class file, the
// companion classes when they exist, the DMTF CIM schema the classes derive
// from, and the qualifiers that schema declares. Each is read once per test
// program.
#pragma once

#include "tvr/broker/Mof.h"

#include <set>
#include <string>

namespace tvr::test {

/// The project's class file, TVRHX_PhysicalAsset.mof. Throws
/// std::runtime_error naming the file and line when it does not read.
const broker::MofSchema& projectSchema();
/// The path of the project's class file.
std::string projectSchemaFile();

/// The companion classes TVRHX_ComputerSystem and TVRHX_NetworkPort, or null
/// while their file does not exist.
const broker::MofSchema* companionSchema();

/// The DMTF CIM Schema 2.41.0 read whole, or null when it is not beside the
/// source tree.
const broker::MofSchema* dmtfSchema();

/// The DMTF schema, the companion classes (if any) and the project's
/// classes in one schema, so that superclass chains run from a TVRHX_ class
/// up to its DMTF root. Null when the DMTF schema is missing.
const broker::MofSchema* combinedSchema();

/// The names of the qualifiers the DMTF schema declares in qualifiers.mof,
/// in lower case. Empty when the DMTF schema is missing.
const std::set<std::string>& dmtfQualifierNames();

/// `name` in lower case, as CIM compares names.
std::string lowerCase(std::string name);

} // namespace tvr::test
