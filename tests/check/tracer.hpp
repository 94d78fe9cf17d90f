// SPDX-License-Identifier: MIT
// Follows an engine and writes down what it does.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "qz/engine.hpp"
#include "tests/check/script_reading.hpp"
#include "tests/check/trace.hpp"

namespace qz::naive {

/// Whether a timer of so many seconds fires in no user's lifetime: a negative number of seconds, or
/// the delay of re-tagging. No script can write a longer time than 2147483647 seconds, which is
/// rounded up.
inline bool lastsForEver(double seconds) { return seconds > 2147483648.0; }

/// Fills a trace and a history. Leaves a list that runs inside itself by throwing
/// `EndlessChain`, which no engine catches; the engine is then only good for being destroyed.
class Tracer final : public Observer {
 public:
  struct EndlessChain {};

  /// `engine` must outlive this.
  Tracer(const QZ_Plist_State_Parser& engine, Script script);

  void listWillRun(const Value& list, const ObjectId& id) override;
  void listDidRun(const Value& list, const ObjectId& id) override;
  void commandWillRun(const Value& list, std::size_t index) override;
  void commandDidRun(const Value& list, std::size_t index, bool result) override;
  void commandRaised(const Value& list, std::size_t index,
                     const toolkit::Exception& exception) override;
  void controlSought(toolkit::Tag tag, const toolkit::Ref<toolkit::View>& control) override;
  void timerSet(std::string_view key, double seconds) override;
  void timerFired(std::string_view key) override;
  void timerCancelled(std::string_view key) override;

  /// Notes that the button with the tag is about to be pressed.
  void pressed(toolkit::Tag tag);

  Trace trace;
  History history;

 private:
  struct Running {
    Value list;
    std::string key;
    toolkit::Tag id = 0;
    std::optional<std::size_t> command{};  // the index in `trace.commands` of the one that runs
  };

  const toolkit::Subviews& views() const;
  CommandRun& current() { return trace.commands[*running_.back().command]; }
  std::string keyOf(const Value& list, const ObjectId& id) const;
  bool isShared(toolkit::Tag tag) const;
  void endCommand();
  void noteTags(const CommandRun& run);

  const QZ_Plist_State_Parser& engine_;
  Script script_;
  std::vector<Running> running_;    // the innermost last
  std::vector<toolkit::Tag> tags_;  // of the controls, as last seen
  std::size_t timersStarted_ = 0;
};

}  // namespace qz::naive
