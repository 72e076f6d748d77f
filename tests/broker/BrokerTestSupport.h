// What the provider-driven broker suites share: an object manager over the
// test provider (tests/broker/provider), paths in its namespace, and readers
// for the answers the provider gives.
#pragma once

#include "Printers.h"
#include "tvr/broker/ObjectManager.h"

#include <gtest/gtest.h>

#include <map>
#include <string>
#include <utility>
#include <vector>

namespace tvr::broker::test {

/// The namespace the test provider's classes are registered in.
inline constexpr const char* kTestNamespace = "root/tvrtest";

/// The registration file of the test provider, and where the build put it.
std::string testRegistrationFile();
std::string testProviderDirectory();

/// Options for an object manager that serves the test provider's classes.
ObjectManagerOptions testProviderOptions();

/// A class path, or an instance path with string (CMPI_chars) keys.
ObjectPath classPath(const std::string& className, const std::string& nameSpace = kTestNamespace);
ObjectPath keyedPath(const std::string& className, const std::vector<std::pair<std::string, std::string>>& keys,
                     const std::string& nameSpace = kTestNamespace);

/// The texts of the response's data elements, in order.
std::vector<std::string> dataTexts(const Response& response);

/// The statuses the provider's probes reported ("<label> <rc>" data
/// elements), by label. Fails the test on a malformed element.
std::map<std::string, CMPIrc> probeStatuses(const Response& response);

/// The kinds of the response's elements, in order.
std::vector<ResultItem::Kind> kindsOf(const Response& response);

/// A fresh object manager over the test provider for each test.
class TestProviderTest : public ::testing::Test {
protected:
  ObjectManager om{testProviderOptions()};
};

} // namespace tvr::broker::test
