// SPDX-License-Identifier: MIT
// The screen: the visible windows of an application, their order, and the one that has the
// keyboard.
//
// Invariants: a window is listed once, from when it is ordered front until it is ordered out or
// destroyed; the key window is on the screen; a sheet lies in front of the window to which it is
// attached.
#pragma once

#include <cstdint>
#include <memory>
#include <vector>

namespace qz::toolkit::memory {

class MemoryWindow;

class Screen {
 public:
  Screen() = default;
  Screen(const Screen&) = delete;
  Screen& operator=(const Screen&) = delete;

  /// Returns the windows on the screen, back to front.
  std::vector<MemoryWindow*> windows() const;
  bool shows(const MemoryWindow& window) const;
  /// Whether a sheet on the screen is attached to `window`.
  bool hasSheetOver(const MemoryWindow& window) const;
  /// Returns the window that has the keyboard; null only if no window is visible.
  const MemoryWindow* keyWindow() const { return key_; }

  /// Puts `window` in front of the others and makes it key. If it has sheets, they move in front of
  /// it, and the front-most becomes key instead.
  void orderFront(const std::shared_ptr<MemoryWindow>& window);
  /// Takes `window` off the screen, if it is there. If it was key, its parent becomes key, or the
  /// front-most window if there is no visible parent. Returns the reference that kept the window
  /// alive here, which may be the last one.
  std::shared_ptr<MemoryWindow> orderOut(const MemoryWindow& window);

  /// Redraws every view that needs it, also in windows that are not on the screen.
  void draw() { ++drawings_; }
  /// Returns the number of redraws so far. A view that changed after the last one has a redraw
  /// pending.
  std::uint64_t drawings() const { return drawings_; }

 private:
  struct Shown {
    MemoryWindow* window;                // removes itself before it is destroyed
    std::shared_ptr<MemoryWindow> kept;  // the window itself, if the application keeps it alive
  };

  const MemoryWindow* heirOf(const MemoryWindow& window) const;

  std::vector<Shown> shown_;
  const MemoryWindow* key_ = nullptr;  // one of `shown_`
  std::uint64_t drawings_ = 0;
};

}  // namespace qz::toolkit::memory
