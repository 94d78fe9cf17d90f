// SPDX-License-Identifier: MIT
// Makes windows and controls. Windows handle their own sheets.

#include "qz/toolkit/memory/application.hpp"

#include "toolkit/memory/screen.hpp"
#include "toolkit/memory/views.hpp"
#include "toolkit/memory/window.hpp"

namespace qz::toolkit::memory {

MemoryApplication::MemoryApplication() : screen_(std::make_shared<Screen>()) {}

// This toolkit has no backing store and nothing to defer.
Ref<Window> MemoryApplication::makeWindow(const Rect& content, StyleMask style, BackingStore,
                                          bool) {
  return MemoryWindow::make(screen_, content, style, KeptBy::application);
}

Ref<Button> MemoryApplication::makeButton(const Rect& frame) {
  return std::make_shared<MemoryButton>(ButtonBehavior::push, frame, screen_);
}

Ref<ImageView> MemoryApplication::makeImageView(const Rect& frame) {
  return std::make_shared<MemoryImageView>(frame, screen_);
}

Ref<TextField> MemoryApplication::makeTextField(const Rect& frame) {
  return std::make_shared<MemoryTextField>(frame, screen_);
}

void MemoryApplication::beginSheet(const Ref<Window>& sheet, const Ref<Window>& parent,
                                   const std::shared_ptr<SheetDelegate>& delegate,
                                   void* contextInfo) {
  if (const auto window = MemoryWindow::of(sheet)) {
    window->beginAsSheet(MemoryWindow::of(parent), delegate, contextInfo);
  }
}

void MemoryApplication::endSheet(const Ref<Window>& sheet, long returnCode) {
  if (const auto window = MemoryWindow::of(sheet)) window->endAsSheet(returnCode);
}

}  // namespace qz::toolkit::memory
