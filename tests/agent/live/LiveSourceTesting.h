//===- LiveSourceTesting.h - Reading nodes and logs in live-source tests --===//

#ifndef HX_TESTS_LIVE_LIVESOURCETESTING_H
#define HX_TESTS_LIVE_LIVESOURCETESTING_H

#include "HX/HardwareSource.h"
#include "HX/Instrumentation.h"
#include "KVLog/KVLogConfig.h"

#include <gtest/gtest.h>

#include <map>
#include <mutex>
#include <optional>
#include <string>
#include <vector>

namespace hxlive {

using namespace HX::NodeLexicon;

/// Everything a cursor tells about one node.
struct SeenNode {
  std::string path;
  unsigned status = 0;
  std::string description;
  std::map<Properties, std::string> texts;
  std::map<Properties, unsigned> numbers;

  std::optional<std::string> text(Properties property) const {
    auto found = texts.find(property);
    if (found == texts.end())
      return std::nullopt;
    return found->second;
  }
  std::optional<unsigned> number(Properties property) const {
    auto found = numbers.find(property);
    if (found == numbers.end())
      return std::nullopt;
    return found->second;
  }
  std::optional<std::string> name() const { return text(PropNodeName); }
  bool has(Properties property) const {
    return texts.count(property) != 0 || numbers.count(property) != 0;
  }
};

/// What the cursor stands on, read through the public interface only.
inline SeenNode seen(const HX::Instrumentation &cursor) {
  SeenNode node;
  node.path = cursor.convertPathToString(cursor.getPathToNode());
  node.status = cursor.getNodeStatus();
  node.description = cursor.getNodeDescription();
  for (unsigned id = 0; id <= 1100; ++id) {
    const auto property = static_cast<Properties>(id);
    if (!nameOf(property))
      continue;
    std::string text;
    unsigned number = 0;
    if (cursor.getProperty(property, text))
      node.texts[property] = text;
    if (cursor.getProperty(property, number))
      node.numbers[property] = number;
  }
  return node;
}

/// Selects \p type and reads every node of it.
inline std::vector<SeenNode> nodesOf(NodeType type) {
  std::vector<SeenNode> nodes;
  HX::Instrumentation cursor;
  for (cursor.selectNode(type); cursor; ++cursor)
    nodes.push_back(seen(cursor));
  return nodes;
}

inline std::vector<std::string> pathsOf(NodeType type) {
  std::vector<std::string> paths;
  for (const SeenNode &node : nodesOf(type))
    paths.push_back(node.path);
  return paths;
}

inline std::vector<std::optional<std::string>> namesOf(NodeType type) {
  std::vector<std::optional<std::string>> names;
  for (const SeenNode &node : nodesOf(type))
    names.push_back(node.name());
  return names;
}

/// The one node of \p type whose name is \p name; fails the test otherwise.
inline SeenNode nodeNamed(NodeType type, const std::string &name) {
  std::vector<SeenNode> matches;
  for (SeenNode &node : nodesOf(type))
    if (node.name() == name)
      matches.push_back(std::move(node));
  EXPECT_EQ(matches.size(), 1u)
      << "nodes of type " << nameOf(type) << " named \"" << name << "\"";
  return matches.empty() ? SeenNode() : matches.front();
}

/// Records the messages of the instrumentation's log category while it
/// lives; the log's own destination is switched off meanwhile.
class LoggedProblems {
public:
  LoggedProblems() {
    Saved = KVLog::sinkSettings(KVLog::Channel::Log);
    KVLog::configureSink(KVLog::Channel::Log,
                         {KVLog::SinkSettings::Destination::Off, "", 0});
    Id = KVLog::addListener([this](const KVLog::Message &message) {
      if (message.channel != KVLog::Channel::Log ||
          message.category != "TVR.HX.Instrumentation")
        return;
      std::lock_guard<std::mutex> guard(Lock);
      Texts.push_back(message.text);
      Levels.push_back(message.level);
    });
  }
  LoggedProblems(const LoggedProblems &) = delete;
  LoggedProblems &operator=(const LoggedProblems &) = delete;
  ~LoggedProblems() {
    KVLog::removeListener(Id);
    KVLog::configureSink(KVLog::Channel::Log, Saved);
  }

  std::vector<std::string> texts() const {
    std::lock_guard<std::mutex> guard(Lock);
    return Texts;
  }
  std::vector<int> levels() const {
    std::lock_guard<std::mutex> guard(Lock);
    return Levels;
  }
  /// How many logged messages contain \p fragment.
  int mentioning(const std::string &fragment) const {
    int count = 0;
    for (const std::string &text : texts())
      count += text.find(fragment) != std::string::npos;
    return count;
  }

private:
  KVLog::SinkSettings Saved{};
  int Id = 0;
  mutable std::mutex Lock;
  std::vector<std::string> Texts;
  std::vector<int> Levels;
};

} // namespace hxlive

#endif // HX_TESTS_LIVE_LIVESOURCETESTING_H
