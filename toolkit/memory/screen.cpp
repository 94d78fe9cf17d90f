// SPDX-License-Identifier: MIT
// The order of windows. Sheets know their parents but parents do not know their sheets: the visible
// windows are searched for the sheets of a parent.

#include "toolkit/memory/screen.hpp"

#include <algorithm>
#include <utility>

#include "toolkit/memory/window.hpp"

namespace qz::toolkit::memory {

std::vector<MemoryWindow*> Screen::windows() const {
  std::vector<MemoryWindow*> windows;
  for (const Shown& shown : shown_) windows.push_back(shown.window);
  return windows;
}

bool Screen::shows(const MemoryWindow& window) const {
  return std::any_of(shown_.begin(), shown_.end(),
                     [&](const Shown& shown) { return shown.window == &window; });
}

bool Screen::hasSheetOver(const MemoryWindow& window) const {
  return std::any_of(shown_.begin(), shown_.end(), [&](const Shown& shown) {
    return shown.window->sheetParent().get() == &window;
  });
}

void Screen::orderFront(const std::shared_ptr<MemoryWindow>& window) {
  orderOut(*window);
  shown_.push_back({window.get(), window->isKeptOnScreen() ? window : nullptr});
  key_ = window.get();
  // A copy: bringing the sheets to the front changes the list.
  for (MemoryWindow* const other : windows()) {
    if (other->sheetParent() == window) orderFront(other->shared_from_this());
  }
}

std::shared_ptr<MemoryWindow> Screen::orderOut(const MemoryWindow& window) {
  const auto place = std::find_if(shown_.begin(), shown_.end(),
                                  [&](const Shown& shown) { return shown.window == &window; });
  if (place == shown_.end()) return nullptr;
  std::shared_ptr<MemoryWindow> kept = std::move(place->kept);
  shown_.erase(place);
  if (key_ == &window) key_ = heirOf(window);
  return kept;
}

const MemoryWindow* Screen::heirOf(const MemoryWindow& window) const {
  const auto parent = window.sheetParent();
  if (parent && shows(*parent)) return parent.get();
  return shown_.empty() ? nullptr : shown_.back().window;
}

}  // namespace qz::toolkit::memory
