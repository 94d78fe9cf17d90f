// SPDX-License-Identifier: MIT
// Windows and sheets. The screen may be destroyed before a window that the host still keeps. The
// window is then never visible; everything else still works.

#include "toolkit/memory/window.hpp"

#include "toolkit/memory/views.hpp"

namespace qz::toolkit::memory {

MemoryWindow::MemoryWindow(const std::shared_ptr<Screen>& screen, const Rect& content,
                           StyleMask style, KeptBy keptBy)
    : screen_(screen), content_(content), style_(style), keptBy_(keptBy) {}

std::shared_ptr<MemoryWindow> MemoryWindow::make(const std::shared_ptr<Screen>& screen,
                                                 const Rect& content, StyleMask style,
                                                 KeptBy keptBy) {
  std::shared_ptr<MemoryWindow> window(new MemoryWindow(screen, content, style, keptBy));
  const auto view = std::make_shared<MemoryView<View>>(
      class_names::view, Rect{0, 0, content.width, content.height}, screen);
  view->becomeContentViewOf(window);
  window->contentView_ = view;
  return window;
}

MemoryWindow::~MemoryWindow() {
  if (const auto screen = screen_.lock()) screen->orderOut(*this);
}

std::shared_ptr<MemoryWindow> MemoryWindow::of(const Ref<Window>& window) {
  return std::dynamic_pointer_cast<MemoryWindow>(window.pointer());
}

void MemoryWindow::makeKeyAndOrderFront() {
  if (const auto screen = screen_.lock()) screen->orderFront(shared_from_this());
}

void MemoryWindow::orderOut() {
  const auto screen = screen_.lock();
  // The screen's reference may be the last one to this window.
  const auto kept = screen ? screen->orderOut(*this) : nullptr;
  sheetParent_.reset();
}

void MemoryWindow::close() {
  ++closes_;
  orderOut();
}

bool MemoryWindow::isVisible() const {
  const auto screen = screen_.lock();
  return screen && screen->shows(*this);
}

bool MemoryWindow::isKey() const {
  const auto screen = screen_.lock();
  return screen && screen->keyWindow() == this;
}

bool MemoryWindow::takesInput() const {
  const auto screen = screen_.lock();
  return screen && screen->shows(*this) && !screen->hasSheetOver(*this);
}

void MemoryWindow::beginAsSheet(const std::shared_ptr<MemoryWindow>& parent,
                                const std::shared_ptr<SheetDelegate>& delegate, void* contextInfo) {
  session_.begin(delegate, contextInfo);
  if (isAttachedTo(*this, parent)) {
    sheetParent_.reset();
  } else {
    sheetParent_ = parent;
  }
  makeKeyAndOrderFront();
}

void MemoryWindow::endAsSheet(long returnCode) { session_.end(shared_from_this(), returnCode); }

}  // namespace qz::toolkit::memory
