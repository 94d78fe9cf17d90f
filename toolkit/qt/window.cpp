// SPDX-License-Identifier: MIT
// Windows and sheets. A sheet that is hidden by anything but this toolkit, such as Escape, the
// close button or a dialog's own buttons, ends with code 0.

#include "toolkit/qt/window.hpp"

#include <QEvent>
#include <QGuiApplication>
#include <QKeyEvent>
#include <QMainWindow>
#include <QScreen>
#include <utility>

#include "toolkit/qt/adopted_content.hpp"
#include "toolkit/qt/coordinates.hpp"
#include "toolkit/qt/sheet_place.hpp"
#include "toolkit/qt/views.hpp"
#include "toolkit/qt/window_look.hpp"

namespace qz::toolkit::qt {

namespace {

// The code of a sheet that the user cancels (`NSModalResponseCancel`).
constexpr long cancelled = 0;

Rect onScreen(const QWidget& widget, const Rect& rect) {
  return flipped(rect, widget.screen()->geometry().height());
}

QWidget* contentOf(QWidget& window) {
  const auto* const mainWindow = qobject_cast<const QMainWindow*>(&window);
  return mainWindow ? mainWindow->centralWidget() : &window;
}

Qt::WindowFlags flagsOf(StyleMask style) {
  const auto bits = static_cast<unsigned>(style);
  Qt::WindowFlags flags = Qt::Window | Qt::CustomizeWindowHint;
  if (bits & static_cast<unsigned>(StyleMask::titled)) flags |= Qt::WindowTitleHint;
  if (bits & static_cast<unsigned>(StyleMask::closable)) {
    flags |= Qt::WindowSystemMenuHint | Qt::WindowCloseButtonHint;
  }
  return flags;
}

}  // namespace

// Watches for changes of the widget that this toolkit does not make.
class QtWindow::Watch final : public QObject {
 public:
  explicit Watch(QtWindow& window) : window_(window) { window.widget_->installEventFilter(this); }

  bool eventFilter(QObject*, QEvent* event) override {
    switch (event->type()) {
      case QEvent::Close:
        ++window_.closes_;
        break;
      case QEvent::Hide:
        // Queued, because its effects may delete the window while Qt is still hiding it.
        if (!event->spontaneous()) {
          QMetaObject::invokeMethod(
              this, [this] { window_.wasHidden(); }, Qt::QueuedConnection);
        }
        break;
      // Before the first painting it is the desktop that moves the window.
      case QEvent::Move:
      case QEvent::Resize:
        if (!painted_) window_.settled_ = window_.widget_->geometry();
        break;
      case QEvent::Paint:
        painted_ = true;
        break;
      case QEvent::KeyPress:
        if (!window_.place_ || static_cast<QKeyEvent*>(event)->key() != Qt::Key_Escape) break;
        window_.widget_->close();
        return true;
      default:
        break;
    }
    return false;
  }

 private:
  QtWindow& window_;  // its owner
  bool painted_ = false;
};

QtWindow::QtWindow(QWidget& widget, std::shared_ptr<Desk> desk, KeptBy keptBy)
    : widget_(&widget), desk_(std::move(desk)), key_(&widget), keptBy_(keptBy) {
  watch_ = std::make_unique<Watch>(*this);
}

std::shared_ptr<QtWindow> QtWindow::make(QWidget& widget, const std::shared_ptr<Desk>& desk,
                                         KeptBy keptBy) {
  std::shared_ptr<QtWindow> window(new QtWindow(widget, desk, keptBy));
  desk->enter(widget, window);
  return window;
}

std::shared_ptr<QtWindow> QtWindow::make(const Rect& content, StyleMask style,
                                         const std::shared_ptr<Desk>& desk, KeptBy keptBy) {
  auto* const widget = new QWidget(nullptr, flagsOf(style));  // deleted in ~QtWindow
  auto window = make(*widget, desk, keptBy);
  widget->setGeometry(rounded(onScreen(*widget, content)));
  window->asked_ = content;
  return window;
}

// Deletes the widget later, because this may run during one of the widget's own events.
QtWindow::~QtWindow() {
  watch_.reset();
  detach();
  desk_->forgetWindow(key_);
  if (!widget_ || keptBy_ == KeptBy::host) return;
  widget_->hide();
  widget_->deleteLater();
}

std::shared_ptr<QtWindow> QtWindow::of(const Ref<Window>& window) {
  return std::dynamic_pointer_cast<QtWindow>(window.pointer());
}

Ref<View> QtWindow::contentView() const {
  QWidget* const content = contentWidget();
  if (!content || contentWidget_ != content) {
    content_ = content ? viewOf(*content) : nullptr;
    contentWidget_ = content;
  }
  return content_;
}

QWidget* QtWindow::contentWidget() const {
  if (!widget_) return nullptr;
  return form_ ? form_->content() : contentOf(*widget_);
}

Ref<View> QtWindow::viewOf(QWidget& content) const {
  if (!form_) return desk_->viewOf(content);
  return std::make_shared<AdoptedContent>(content, desk_, form_)->view();
}

void QtWindow::present(std::shared_ptr<AdoptedForm> form) {
  form_ = std::move(form);
  contentWidget_ = nullptr;
  content_ = nullptr;
}

void QtWindow::setBackgroundColor(const Color& color) {
  if (widget_) setWindowColor(*widget_, color);
}

void QtWindow::show() {
  if (widget_->isMinimized()) {
    widget_->showNormal();
  } else {
    widget_->show();
  }
  // Windows off the screen have no order, and Qt prints a warning about raise().
  if (QGuiApplication::platformName() != "offscreen") widget_->raise();
  widget_->activateWindow();
}

void QtWindow::makeKeyAndOrderFront() {
  if (!widget_) return;
  if (keptBy_ == KeptBy::application) desk_->keep(shared_from_this());
  show();
  for (const auto& other : desk_->windows()) {
    if (other->sheetParent().get() == this) other->makeKeyAndOrderFront();
  }
}

void QtWindow::orderOut() {
  const auto kept = shared_from_this();
  const auto parent = sheetParent();
  detach();
  if (widget_) widget_->hide();
  desk_->letGo(*this);
  if (parent && parent->widget_ && parent->widget_->isVisible()) parent->widget_->activateWindow();
}

// Closing counts once even if Qt sends no close event, as for a window that was never shown.
void QtWindow::close() {
  const auto kept = shared_from_this();
  const int before = closes_;
  if (widget_) widget_->close();
  if (closes_ == before) ++closes_;
  if (!widget_ || !widget_->isVisible()) orderOut();
}

Rect QtWindow::content() const {
  if (!widget_) return {};
  const QRect geometry = widget_->geometry();
  if (asked_ && geometry == settled_.value_or(rounded(onScreen(*widget_, *asked_)))) return *asked_;
  return onScreen(*widget_, exactly(geometry));
}

void QtWindow::detach() {
  sheetParent_.reset();
  if (widget_ && place_ && widget_->isVisible()) widget_->hide();
  place_.reset();
}

void QtWindow::wasHidden() {
  const auto kept = shared_from_this();
  if (widget_ && widget_->isVisible()) return;
  const bool wasSheet = place_ != nullptr;
  orderOut();
  if (wasSheet) endAsSheet(cancelled);
}

void QtWindow::beginAsSheet(const std::shared_ptr<QtWindow>& parent,
                            const std::shared_ptr<SheetDelegate>& delegate, void* contextInfo) {
  detach();
  session_.begin(delegate, contextInfo);
  if (parent && !isAttachedTo(*this, parent)) {
    sheetParent_ = parent;
    if (widget_ && parent->widget_) {
      widget_->hide();  // modality takes effect when a window is shown
      place_ = std::make_unique<SheetPlace>(*widget_, *parent->widget_);
    }
  }
  makeKeyAndOrderFront();
}

void QtWindow::endAsSheet(long returnCode) { session_.end(shared_from_this(), returnCode); }

}  // namespace qz::toolkit::qt
