// SPDX-License-Identifier: MIT
// Commands change the panel's controls one by one. Each change reaches the panel's layout, which
// posts one request for all of them. It arrives after the list has run; then the step is shown.

#include "qz/hosts/qt/guide.hpp"

#include <QEvent>
#include <QGuiApplication>
#include <QPointer>
#include <QScreen>
#include <utility>

#include "hosts/qt/guide_accessibility.hpp"
#include "hosts/qt/guide_announcement.hpp"
#include "hosts/qt/guide_panel.hpp"
#include "hosts/qt/guide_placement.hpp"
#include "hosts/qt/guide_spotlight.hpp"
#include "hosts/qt/guide_tab_order.hpp"
#include "hosts/qt/guide_target.hpp"
#include "toolkit/qt/focus.hpp"

namespace qz::hosts::qt {

namespace {

// Keeps a widget from noticing that it gets a child: a splitter would make a pane of it.
class UnnoticedChild final : public QObject {
 public:
  explicit UnnoticedChild(QWidget& parent) { parent.installEventFilter(this); }
  bool eventFilter(QObject*, QEvent* event) override { return event->type() == QEvent::ChildAdded; }
};

template <class W, class... Arguments>
W* addUnnoticed(QWidget& parent, const Arguments&... arguments) {
  const UnnoticedChild unnoticed(parent);
  return new W(parent, arguments...);
}

GuidePanel* addPanel(QWidget& form, const GuideOptions& options) {
  simplifyAccessiblePanels();
  return addUnnoticed<GuidePanel>(form, options);
}

}  // namespace

class Guide::Stage final : public QObject {
 public:
  Stage(toolkit::qt::QtToolkit& toolkit, QWidget& form, const GuideOptions& options);
  ~Stage() override;

  GuidePanel* panel() const { return panel_; }
  QWidget* target() const { return target_; }
  bool eventFilter(QObject* receiver, QEvent* event) override;

 private:
  bool hasStep() const;
  void pointAt(const QString& text);
  void update();
  void moved();
  void beginStep(const GuideMessage& message);
  bool appear();
  void leadFocus(bool isInPanel);
  void returnFocus();
  void disappear();
  void arrange(bool glides);
  void place(const QRect& target);
  Spotlight& spotlightOn(QWidget& window);

  toolkit::qt::QtToolkit& toolkit_;
  const GuideOptions options_;
  const QPointer<QWidget> form_;
  const QPointer<GuidePanel> panel_;  // the form's child
  QPointer<Spotlight> spotlight_;     // a child of the target's window; null while there is no step
  QPointer<QWidget> target_;
  std::unique_ptr<GuideTabOrder> tabOrder_;  // null if the host does not want it
  Follower formFollower_{[this] { moved(); }};
  Follower targetFollower_{[this] { moved(); }};
  GuideMessage told_;            // empty while there is no step
  QPointer<QWidget> toldOf_;     // the target at that time
  QPointer<QWidget> formFocus_;  // the widget that had the form's focus before the guide appeared
  QPointer<QWidget> lentTo_;     // the control that last got the focus from the panel
  bool hasLentFocus_ = false;    // in the present step
};

Guide::Stage::Stage(toolkit::qt::QtToolkit& toolkit, QWidget& form, const GuideOptions& options)
    : toolkit_(toolkit),
      options_(options),
      form_(&form),
      panel_(addPanel(form, options)),
      tabOrder_(options.tab ? std::make_unique<GuideTabOrder>(form, *panel_) : nullptr) {
  panel_->installEventFilter(this);
  formFollower_.follow(&form);
  connect(&panel_->target, &QLineEdit::textChanged, this, &Stage::pointAt);
}

// Later, because this may run in a press of one of the panel's buttons.
Guide::Stage::~Stage() {
  if (spotlight_) spotlight_->deleteLater();
  if (!panel_) return;
  panel_->retire();
  panel_->deleteLater();
}

bool Guide::Stage::eventFilter(QObject*, QEvent* event) {
  if (event->type() != QEvent::LayoutRequest) return false;
  panel_->layout()->activate();  // otherwise a hidden panel posts no further request
  update();
  return false;
}

// A command has set the tag, so it means the control that has it now.
void Guide::Stage::pointAt(const QString& text) {
  if (!form_) return;
  const Pointing pointing = controlMeantBy(text, toolkit_, *form_, *panel_);
  if (!pointing.complaint.empty()) toolkit_.log().write(pointing.complaint);
  target_ = pointing.control;
  targetFollower_.follow(target_);
  if (tabOrder_) tabOrder_->setTarget(target_);
  QCoreApplication::postEvent(panel_, new QEvent(QEvent::LayoutRequest));
}

bool Guide::Stage::hasStep() const {
  return form_ && form_->isVisible() && !form_->isMinimized() && panel_ && panel_->speaks();
}

void Guide::Stage::update() {
  if (!hasStep()) return disappear();
  const GuideMessage message = messageOf(*panel_, target_);
  if (panel_->isVisible() && message == told_ && toldOf_ == target_) return arrange(false);
  beginStep(message);
}

void Guide::Stage::moved() {
  if (hasStep() && panel_->isVisible()) return arrange(false);
  update();
}

void Guide::Stage::beginStep(const GuideMessage& message) {
  told_ = message;
  toldOf_ = target_;
  panel_->scrollToBeginning();
  if (target_) bringControlIntoView(toolkit_, *target_);
  arrange(true);
  leadFocus(appear());
  announceStep(*panel_, message);
}

// Gives YES if the panel is about to have the focus. Some desktops activate every new window.
bool Guide::Stage::appear() {
  spotlight_->show();
  spotlight_->raise();
  if (panel_->isVisible()) return panel_->hasFocusInside();
  const bool wasActive = form_->isActiveWindow();
  const bool takesFocus = options_.takesFocus && wasActive;
  formFocus_ = form_->focusWidget();
  panel_->setAttribute(Qt::WA_ShowWithoutActivating, !takesFocus);
  panel_->show();
  if (!panel_->isWindow()) panel_->raise();
  if (takesFocus) panel_->focus(false);
  if (wasActive && !takesFocus) form_->activateWindow();
  return takesFocus;
}

// A step without Next asks the user to act on its control. The next step takes the focus back.
void Guide::Stage::leadFocus(bool isInPanel) {
  const bool asksForControl = !panel_->canGoOn() && target_ && toolkit::qt::takesFocus(*target_);
  if (std::exchange(hasLentFocus_, false) && !asksForControl) return panel_->focus(false);
  hasLentFocus_ = asksForControl && isInPanel;
  if (!hasLentFocus_) return;
  target_->window()->activateWindow();
  target_->setFocus(Qt::OtherFocusReason);
  lentTo_ = target_;
}

// The user's own choice of a control with the focus stays.
void Guide::Stage::returnFocus() {
  const QWidget* const now = form_ ? form_->focusWidget() : nullptr;
  const bool isOurs = now && (now == lentTo_ || panel_->isAncestorOf(now));
  if (isOurs && formFocus_) formFocus_->setFocus(Qt::OtherFocusReason);
  toolkit::qt::giveFocusAway(*panel_);  // if the form has no other
  lentTo_ = nullptr;
  hasLentFocus_ = false;
}

void Guide::Stage::disappear() {
  told_ = {};
  if (spotlight_) spotlight_->deleteLater();
  spotlight_ = nullptr;
  if (!panel_ || panel_->isHidden()) return;
  const bool wasActive = panel_->isWindow() && panel_->isActiveWindow();
  returnFocus();
  panel_->hide();
  describe(*panel_, {});
  if (wasActive && form_ && form_->isVisible()) form_->activateWindow();
}

Spotlight& Guide::Stage::spotlightOn(QWidget& window) {
  if (!spotlight_ || spotlight_->parentWidget() != &window) {
    delete spotlight_;
    spotlight_ = addUnnoticed<Spotlight>(window, options_.frame, options_.dimming);
    spotlight_->setVisible(panel_->isVisible());
  }
  return *spotlight_;
}

// A target in a floating dock has another window than the form.
void Guide::Stage::arrange(bool glides) {
  QWidget& window = target_ ? *target_->window() : *form_;
  const QRect visible = target_ ? visiblePartOf(*target_) : QRect();
  const QRect lit = Spotlight::around(visible, window.rect());
  spotlightOn(window).light(lit, glides);
  place(lit.translated(window.mapToGlobal(QPoint())));
}

void Guide::Stage::place(const QRect& target) {
  const QRect window(form_->mapToGlobal(QPoint()), form_->size());
  const QScreen* const shown =
      QGuiApplication::screenAt((target.isEmpty() ? window : target).center());
  const QScreen& screen = shown ? *shown : *form_->screen();
  const QRect area = panel_->isWindow() ? screen.availableGeometry() : window;
  panel_->setLayoutDirection(form_->layoutDirection());
  panel_->fit(area.size());
  const QPoint at =
      placeBeside({area, window, target, form_->layoutDirection()}, panel_->size()).topLeft();
  panel_->move(panel_->isWindow() ? at : form_->mapFromGlobal(at));
}

Guide::Guide(toolkit::qt::QtToolkit& toolkit, QWidget& form, const GuideOptions& options)
    : stage_(std::make_unique<Stage>(toolkit, *form.window(), options)) {}

Guide::~Guide() = default;

void Guide::clear() {
  if (GuidePanel* const panel = stage_->panel()) panel->clear();
}

QWidget* Guide::panel() const { return stage_->panel(); }

QWidget* Guide::target() const { return stage_->target(); }

}  // namespace qz::hosts::qt
