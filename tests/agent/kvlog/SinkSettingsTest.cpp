// KVLog::parseSinkSettings, configureSink and sinkSettings.

#include "LoggerFixture.h"

#include <gmock/gmock.h>

namespace {

using ::testing::HasSubstr;
using kvlogtest::Destination;
using kvlogtest::LoggerTest;
using KVLog::Channel;
using KVLog::parseSinkSettings;
using KVLog::SinkSettings;

TEST(ParseSinkSettings, AcceptsSyslog) {
  const auto settings = parseSinkSettings("syslog", "6000", nullptr);
  ASSERT_TRUE(settings);
  EXPECT_EQ(settings->destination, Destination::Syslog);
  EXPECT_EQ(settings->path, "");
  EXPECT_EQ(settings->minimumLevel, 6000);
}

TEST(ParseSinkSettings, AcceptsStderr) {
  const auto settings = parseSinkSettings("stderr", "0", nullptr);
  ASSERT_TRUE(settings);
  EXPECT_EQ(settings->destination, Destination::Stderr);
}

TEST(ParseSinkSettings, AcceptsOff) {
  const auto settings = parseSinkSettings("off", "0", nullptr);
  ASSERT_TRUE(settings);
  EXPECT_EQ(settings->destination, Destination::Off);
}

TEST(ParseSinkSettings, AcceptsAbsolutePath) {
  const auto settings = parseSinkSettings("/var/log/tvr/trace.log", "3000", nullptr);
  ASSERT_TRUE(settings);
  EXPECT_EQ(settings->destination, Destination::File);
  EXPECT_EQ(settings->path, "/var/log/tvr/trace.log");
  EXPECT_EQ(settings->minimumLevel, 3000);
}

TEST(ParseSinkSettings, IgnoresBlanksAroundValues) {
  const auto settings = parseSinkSettings("  /x.log\t", " 4000 ", nullptr);
  ASSERT_TRUE(settings);
  EXPECT_EQ(settings->path, "/x.log");
  EXPECT_EQ(settings->minimumLevel, 4000);
}

TEST(ParseSinkSettings, AcceptsNegativeLevel) {
  const auto settings = parseSinkSettings("stderr", "-5", nullptr);
  ASSERT_TRUE(settings);
  EXPECT_EQ(settings->minimumLevel, -5);
}

TEST(ParseSinkSettings, RejectsRelativePath) {
  std::string error;
  EXPECT_FALSE(parseSinkSettings("logs/tvr.log", "0", &error));
  EXPECT_THAT(error, HasSubstr("logs/tvr.log"));
}

TEST(ParseSinkSettings, RejectsUnknownDestination) {
  std::string error;
  EXPECT_FALSE(parseSinkSettings("Syslog", "0", &error));
  EXPECT_THAT(error, HasSubstr("Syslog"));
}

TEST(ParseSinkSettings, RejectsEmptyDestination) {
  EXPECT_FALSE(parseSinkSettings("", "0", nullptr));
}

TEST(ParseSinkSettings, RejectsNonNumericLevel) {
  std::string error;
  EXPECT_FALSE(parseSinkSettings("stderr", "high", &error));
  EXPECT_THAT(error, HasSubstr("high"));
}

TEST(ParseSinkSettings, RejectsLevelWithTrailingText) {
  EXPECT_FALSE(parseSinkSettings("stderr", "4000x", nullptr));
}

TEST(ParseSinkSettings, RejectsEmptyLevel) {
  EXPECT_FALSE(parseSinkSettings("stderr", "", nullptr));
}

TEST(ParseSinkSettings, RejectsLevelOutOfIntRange) {
  EXPECT_FALSE(parseSinkSettings("stderr", "99999999999", nullptr));
}

using ConfigureSink = LoggerTest;

TEST_F(ConfigureSink, SinkSettingsReturnsWhatWasConfigured) {
  KVLog::configureSink(Channel::Trace, {Destination::File, "/tmp/x.log", 3000});
  const SinkSettings current = KVLog::sinkSettings(Channel::Trace);
  EXPECT_EQ(current.destination, Destination::File);
  EXPECT_EQ(current.path, "/tmp/x.log");
  EXPECT_EQ(current.minimumLevel, 3000);
}

TEST_F(ConfigureSink, ChannelsAreConfiguredSeparately) {
  KVLog::configureSink(Channel::Log, {Destination::Stderr, {}, 4000});
  KVLog::configureSink(Channel::Trace, {Destination::Syslog, {}, 0});
  EXPECT_EQ(KVLog::sinkSettings(Channel::Log).destination, Destination::Stderr);
  EXPECT_EQ(KVLog::sinkSettings(Channel::Log).minimumLevel, 4000);
  EXPECT_EQ(KVLog::sinkSettings(Channel::Trace).destination, Destination::Syslog);
}

TEST_F(ConfigureSink, PathIsDroppedForDestinationsOtherThanFile) {
  KVLog::configureSink(Channel::Log, {Destination::Stderr, "/ignored.log", 0});
  EXPECT_EQ(KVLog::sinkSettings(Channel::Log).path, "");
}

} // namespace
