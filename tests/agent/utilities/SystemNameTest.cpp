//===- SystemNameTest.cpp - Name of the managed computer system -----------===//

#include "HX/HardwareSource.h"
#include "HX/SystemName.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>

#include <climits>
#include <netdb.h>
#include <sys/socket.h>
#include <unistd.h>

namespace {

/// This host's canonical name as the resolver reports it, falling back to
/// the plain host name: what a machine without a tree calls itself.
std::string resolverHostName() {
  char host[HOST_NAME_MAX + 1] = {};
  if (::gethostname(host, sizeof host - 1) != 0)
    return "localhost";
  addrinfo hints{};
  hints.ai_flags = AI_CANONNAME;
  addrinfo *found = nullptr;
  if (::getaddrinfo(host, nullptr, &hints, &found) != 0 || !found)
    return host;
  std::string name = found->ai_canonname ? found->ai_canonname : host;
  ::freeaddrinfo(found);
  return name.empty() ? std::string(host) : name;
}

class SystemNameTest : public ::testing::Test {
protected:
  void SetUp() override {
    char pattern[] = "/tmp/hx-system-name-XXXXXX";
    ASSERT_NE(::mkdtemp(pattern), nullptr);
    Directory = pattern;
  }
  void TearDown() override { std::filesystem::remove_all(Directory); }

  void useTree(const std::string &json) {
    const std::string path = Directory + "/tree.json";
    std::ofstream(path) << json;
    HX::useHardwareTree(path);
  }

  std::string Directory;
};

TEST_F(SystemNameTest, TreeSystemNameIsTheSystemName) {
  useTree(R"({"systemName": "lab-7.example.com", "nodes": []})");

  EXPECT_EQ(HX::getSystemName(), "lab-7.example.com");
}

TEST_F(SystemNameTest, TreeWithoutSystemNameGivesTheHostName) {
  useTree(R"({"nodes": []})");

  EXPECT_EQ(HX::getSystemName(), resolverHostName());
}

TEST_F(SystemNameTest, RefusedTreeGivesTheHostNameWithoutThrowing) {
  useTree(R"({"systemName": "lab-7.example.com", "nodes": 5})");

  EXPECT_EQ(HX::getSystemName(), resolverHostName());
}

TEST_F(SystemNameTest, LiveMachineGivesTheHostName) {
  HX::useLiveMachine();

  const std::string name = HX::getSystemName();
  EXPECT_FALSE(name.empty());
  EXPECT_EQ(name, resolverHostName());
}

TEST_F(SystemNameTest, SystemNameFollowsTheTreeInUse) {
  useTree(R"({"systemName": "first.example.com", "nodes": []})");
  EXPECT_EQ(HX::getSystemName(), "first.example.com");

  useTree(R"({"systemName": "second.example.com", "nodes": []})");
  EXPECT_EQ(HX::getSystemName(), "second.example.com");
}

} // namespace
