// SPDX-License-Identifier: MIT
// The screen: which windows of an application show, in which order, and which has the keyboard.
//
// Invariants: a window is listed once, from being ordered front to being ordered out or destroyed;
// the key window is on the screen; a sheet lies in front of the window it is attached to.
#pragma once

#include <cstdint>
#include <memory>
#include <vector>

namespace toolkit::memory {

class MemoryWindow;

class Screen {
 public:
  Screen() = default;
  Screen(const Screen&) = delete;
  Screen& operator=(const Screen&) = delete;

  /// The windows on the screen, back to front.
  std::vector<MemoryWindow*> windows() const;
  bool shows(const MemoryWindow& window) const;
  /// Whether a sheet on the screen is attached to `window`.
  bool hasSheetOver(const MemoryWindow& window) const;
  /// The window that has the keyboard, or null. There is none only where no window shows.
  const MemoryWindow* keyWindow() const { return key_; }

  /// Puts `window` in front of the others and makes it key. Its sheets come along, in front of it,
  /// and the front-most of them is key instead.
  void orderFront(const std::shared_ptr<MemoryWindow>& window);
  /// Takes `window` off, if it is on. The key goes to the window that it was a sheet over, or else
  /// to the front-most. Gives back what kept the window alive here, which may be the last that did.
  std::shared_ptr<MemoryWindow> orderOut(const MemoryWindow& window);

  /// Redraws whatever needs it, on the screen and off it: what is ordered front later is drawn
  /// then.
  void draw() { ++drawings_; }
  /// How often that happened: a change made since the last time is a redraw pending.
  std::uint64_t drawings() const { return drawings_; }

 private:
  struct Shown {
    MemoryWindow* window;                // takes itself off before it ends
    std::shared_ptr<MemoryWindow> kept;  // the window itself, where the application keeps it alive
  };

  const MemoryWindow* heirOf(const MemoryWindow& window) const;

  std::vector<Shown> shown_;
  const MemoryWindow* key_ = nullptr;  // one of `shown_`
  std::uint64_t drawings_ = 0;
};

}  // namespace toolkit::memory
