// SPDX-License-Identifier: MIT
// The memory toolkit's application: makes windows and controls, and keeps the screen.
#pragma once

#include <memory>

#include "qz/api.hpp"
#include "qz/toolkit/application.hpp"

namespace qz::toolkit::memory {

class Screen;

/// Makes windows and controls that exist only in memory.
class QZ_API MemoryApplication final : public Application {
 public:
  MemoryApplication();
  MemoryApplication(const MemoryApplication&) = delete;
  MemoryApplication& operator=(const MemoryApplication&) = delete;

  Ref<Window> makeWindow(const Rect& content, StyleMask style, BackingStore backing,
                         bool defer) override;
  Ref<Button> makeButton(const Rect& frame) override;
  /// Makes an image view. It has no superview yet.
  Ref<ImageView> makeImageView(const Rect& frame) override;
  /// Makes a text field. It has no superview yet.
  Ref<TextField> makeTextField(const Rect& frame) override;
  void beginSheet(const Ref<Window>& sheet, const Ref<Window>& parent,
                  const std::shared_ptr<SheetDelegate>& delegate, void* contextInfo) override;
  void endSheet(const Ref<Window>& sheet, long returnCode) override;

  /// Returns the screen of this application's windows, for code that makes windows and views
  /// itself.
  const std::shared_ptr<Screen>& screen() const { return screen_; }

 private:
  std::shared_ptr<Screen> screen_;  // views and windows hold only weak references to it
};

}  // namespace qz::toolkit::memory
