// SPDX-License-Identifier: MIT
// Makes windows and controls, and passes sheet calls on to their windows.

#include "qz/toolkit/qt/application.hpp"

#include <QLabel>
#include <QPushButton>

#include "toolkit/qt/desk.hpp"
#include "toolkit/qt/text_look.hpp"
#include "toolkit/qt/views.hpp"
#include "toolkit/qt/window.hpp"

namespace qz::toolkit::qt {

namespace {

// The title that AppKit gives a new button.
constexpr auto newButtonTitle = "Button";

Ref<View> placed(QWidget& widget, const Rect& frame, const std::shared_ptr<Desk>& desk) {
  const auto node = makeView(widget, desk, KeptBy::holder);
  node->place(frame);
  return node->view();
}

}  // namespace

QtApplication::QtApplication(Log& log) : desk_(std::make_shared<Desk>(log)) {}
QtApplication::~QtApplication() { desk_->letAllGo(); }

// Ignores `defer` and `backing`: Qt creates the native window at the first showing and chooses its
// buffering.
Ref<Window> QtApplication::makeWindow(const Rect& content, StyleMask style, BackingStore, bool) {
  return QtWindow::make(content, style, desk_, KeptBy::application);
}

Ref<Button> QtApplication::makeButton(const Rect& frame) {
  return asButton(placed(*new QPushButton(newButtonTitle), frame, desk_));
}

Ref<ImageView> QtApplication::makeImageView(const Rect& frame) {
  auto* const label = new QLabel;
  label->setProperty(imageViewProperty, true);
  return asImageView(placed(*label, frame, desk_));
}

Ref<TextField> QtApplication::makeTextField(const Rect& frame) {
  auto* const label = new QLabel;
  layOutAsTextField(*label);
  return asTextField(placed(*label, frame, desk_));
}

void QtApplication::beginSheet(const Ref<Window>& sheet, const Ref<Window>& parent,
                               const std::shared_ptr<SheetDelegate>& delegate, void* contextInfo) {
  if (const auto window = QtWindow::of(sheet)) {
    window->beginAsSheet(QtWindow::of(parent), delegate, contextInfo);
  }
}

void QtApplication::endSheet(const Ref<Window>& sheet, long returnCode) {
  if (const auto window = QtWindow::of(sheet)) window->endAsSheet(returnCode);
}

Ref<Window> QtApplication::window(QWidget& widget) { return desk_->windowOf(*widget.window()); }

Ref<View> QtApplication::view(QWidget& widget) { return desk_->viewOf(widget); }

}  // namespace qz::toolkit::qt
