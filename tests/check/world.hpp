// SPDX-License-Identifier: MIT
// One living walk-through: a window and an engine in a memory toolkit of their own.
#pragma once

#include <array>
#include <cstddef>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "drivers/memory/memory_driver.hpp"
#include "qz/engine.hpp"
#include "tests/check/move.hpp"
#include "tests/check/reading_times.hpp"
#include "tests/check/tracer.hpp"
#include "tools/walkthrough/host_window.hpp"

namespace qz::naive {

using tools::walkthrough::HostWindow;

/// What a control shows besides what belongs to the place: its caption, image, tooltip, background
/// and state. A state that the user changed last is `userState`, whatever it is. Empty: nothing.
using ControlLook = std::array<std::string, 5>;
inline constexpr const char* userState = "user";

/// Numbers different texts, so that they can be compared by their numbers.
class TextNumbers {
 public:
  std::string numberOf(const toolkit::AttributedString& text);

 private:
  std::vector<toolkit::AttributedString> texts_;
};

struct PendingTimer {
  std::string key;
  double timeLeft = 0;  ///< seconds; infinite for a timer that never fires
};

class World {
 public:
  /// `resources` is the directory of the images; if it is empty, the toolkit's own.
  World(Script script, const HostWindow& host, const std::string& resources = "");
  ~World();
  World(const World&) = delete;
  World& operator=(const World&) = delete;

  /// Makes the move, which must be possible. After an endless chain, the world must be left alone.
  const Trace& perform(const Move& move);

  /// Returns the moves that are possible now: presses back to front, then the wait.
  std::vector<Move> moves() const;
  /// Returns the place as one line.
  std::string place() const;
  bool hasEnded() const { return engine_->terminating(); }
  /// Whether the user sees the window.
  bool isOnScreen() const;
  /// Returns the name of the image behind the controls; empty if there is none.
  std::string windowImage() const;
  /// Returns the timers that are pending, in the order of their firing.
  std::vector<PendingTimer> timers() const;

  /// Returns what the user sees of each control, back to front.
  std::vector<drivers::ViewPicture> pictures() const;
  ControlLook lookOf(const drivers::ViewPicture& picture, std::size_t index,
                     TextNumbers& numbers) const;
  /// Whether flashing is allowed, and by tag key what was decided by FLASH_ID.
  bool flashingAllowed() const { return engine_->flashing(); }
  std::map<std::string, bool> flashMarks() const;

  const History& history() const { return tracer_->history; }
  /// Returns the tags that the controls had before the start, back to front.
  const std::vector<toolkit::Tag>& ownTags() const { return ownTags_; }

 private:
  void start(const std::string& key);
  void press(std::size_t index);
  void run(const Move& move);
  toolkit::Subviews views() const { return window_->contentView()->subviews(); }

  Script script_;
  mutable drivers::MemoryDriver driver_;  // pictures are taken through it
  toolkit::Ref<toolkit::Window> window_;
  std::shared_ptr<QZ_Plist_State_Parser> engine_;
  std::shared_ptr<Tracer> tracer_;
  std::vector<toolkit::Tag> ownTags_;
};

}  // namespace qz::naive
