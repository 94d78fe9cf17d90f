// SPDX-License-Identifier: MIT
// The driver of the memory toolkit.
#pragma once

#include <memory>

#include "qz/drivers/driver.hpp"
#include "qz/drivers/memory/toolkit_row.hpp"
#include "qz/toolkit/memory/memory_toolkit.hpp"
#include "toolkit/memory/views.hpp"

namespace qz::drivers {

using namespace toolkit::memory;

class MemoryDriver final : public Driver {
 public:
  MemoryDriver() { setLogSink({}); }

  std::string_view name() const override { return "memory"; }
  MemoryToolkit& toolkit() override { return toolkit_; }

  Ref<Window> makeWindow(const Rect& content) override;
  /// With an absent `parent`, makes a view that is not yet in a window.
  Ref<View> makeView(ViewKind kind, Tag tag, const Rect& frame, const Ref<View>& parent) override;
  void removeFromSuperview(const Ref<View>& view) override;
  void setFrame(const Ref<View>& view, const Rect& frame) override;
  void setResourcePath(std::string_view path) override;
  std::string_view className(ViewKind kind) const override;

  /// Only buttons react to clicks in this toolkit.
  void click(const Ref<View>& view) override;
  void hold(const Ref<View>& view) override;
  void letGo() override;
  void advance(double seconds) override;

  ViewPicture look(const Ref<View>& view) override;
  WindowPicture look(const Ref<Window>& window) override;
  void setLogSink(std::function<void(std::string_view)> sink) override;

 private:
  MemoryToolkit toolkit_;
  std::weak_ptr<MemoryButton> held_;  // holds the mouse button while the user is busy
  bool isDown_ = false;               // the held button is pressed in, until a keyboard click
};

}  // namespace qz::drivers
