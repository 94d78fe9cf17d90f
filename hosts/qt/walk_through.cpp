// SPDX-License-Identifier: MIT
// The end of a walk-through is noticed inside the engine or inside an event of the window.
// Destroying these objects there would be unsafe, so the clean-up runs later, from Qt's event loop.

#include "qz/hosts/qt/walk_through.hpp"

#include <QEvent>
#include <QMainWindow>
#include <QScopedValueRollback>

#include "qz/script_problem.hpp"

namespace qz::hosts::qt {

namespace {

// Returns the widget that holds the controls.
QWidget* contentOf(QWidget& window) {
  const auto* const mainWindow = qobject_cast<const QMainWindow*>(&window);
  return mainWindow ? mainWindow->centralWidget() : &window;
}

}  // namespace

class WalkThrough::Watch final : public QObject, public toolkit::SheetDelegate {
 public:
  Watch(WalkThrough& owner, QWidget& stage)
      : owner_(owner), stage_(&stage), content_(contentOf(stage)), hasContent_(content_) {
    watch(stage);
    if (content_ && content_ != &stage) watch(*content_);
  }

  void sheetDidEnd(const toolkit::Ref<toolkit::Window>& sheet, long, void*) override {
    sheet->orderOut();
    endSoon();
  }

  bool eventFilter(QObject* receiver, QEvent* event) override {
    const auto type = event->type();
    const bool isClosing = type == QEvent::Close && receiver == stage_;
    if (type == QEvent::Hide && receiver == stage_) noteHiding(*event);
    if (isClosing || type == QEvent::Hide || type == QEvent::ParentChange) endSoon();
    if (!isClosing || !isOver()) return false;
    event->ignore();  // the walk-through closes the window, not the user
    return true;
  }

 private:
  void watch(QWidget& widget) {
    widget.installEventFilter(this);
    connect(&widget, &QObject::destroyed, this, [this] { endSoon(); });
  }

  // Remembers a dismissal, even if the window is shown again at once. Ignores windows that the
  // desktop minimises, and a panel that the toolkit hides briefly to make it a sheet.
  void noteHiding(const QEvent& event) {
    isDismissed_ |= !event.spontaneous() && !owner_.isBeginning_;
  }

  bool isOver() const { return owner_.engine_->terminating(); }

  bool stageIsGone() const { return isDismissed_ || !stage_ || !stage_->isVisible(); }
  bool contentIsGone() const {
    return hasContent_ && (!content_ || contentOf(*stage_) != content_);
  }

  // If the host refuses the close, the walk-through continues.
  void endSoon() {
    const auto endIfOver = [this] {
      if (isOver() || stageIsGone() || contentIsGone()) owner_.end();
    };
    QMetaObject::invokeMethod(this, endIfOver, Qt::QueuedConnection);
  }

  WalkThrough& owner_;
  QPointer<QWidget> stage_;
  QPointer<QWidget> content_;
  bool hasContent_;  // whether it had content at the beginning
  bool isDismissed_ = false;
};

WalkThrough::WalkThrough(toolkit::qt::QtToolkit& toolkit) : toolkit_(toolkit) {}

WalkThrough::~WalkThrough() {
  over_ = nullptr;  // the callback's object may be half destroyed
  end();
}

bool WalkThrough::play(std::string_view script, QWidget& window) {
  return begin(script, window, window);
}

bool WalkThrough::playInSheet(std::string_view script, QWidget& panel, QWidget& window) {
  return begin(script, panel, window);
}

// Logs why the walk-through is not played.
void WalkThrough::refuse(const std::string& script, const std::string& reason) {
  toolkit_.log().write("The walk-through " + script + " is not played: " + reason);
}

// Returns an engine with the script; null if the script is refused.
std::shared_ptr<QZ_Plist_State_Parser> WalkThrough::load(
    const std::string& script, const toolkit::Ref<toolkit::Window>& window) {
  auto engine = QZ_Plist_State_Parser::initWithWindow(toolkit_, window);
  const bool isRead = engine->loadPlist(script, std::nullopt, nullptr, false);
  const auto lists = engine->plistDictionary();
  std::string problem;
  if (!isRead) {
    problem = "the file is not a property list with a dictionary";
  } else if (lists->count() == 0) {
    problem = "the file does not exist or contains no list";
  } else {
    problem = problemOf(lists);
  }
  if (problem.empty()) return engine;
  refuse(script, problem);
  engine->terminateParser();  // otherwise its flasher would keep it alive
  return nullptr;
}

bool WalkThrough::begin(std::string_view script, QWidget& stage, QWidget& window) {
  const std::string name(script);
  if (isBeginning_) {
    refuse(name, "another walk-through is beginning");
    return false;
  }
  const QScopedValueRollback<bool> beginning(isBeginning_, true);
  end();
  const auto over = toolkit_.application().window(window);
  const auto engine = load(name, over);
  if (!engine) return false;
  engine_ = engine;
  adopted_ = std::make_unique<toolkit::qt::AdoptedWindow>(toolkit_, stage, adoption_);
  parent_ = over;
  watch_ = std::make_shared<Watch>(*this, stage);
  engine->getGuiAssetsFromWindow(adopted_->window());
  toolkit_.calls().make([&] { engine->loadPlist(name, "", watch_, &stage != &window); });
  return true;
}

void WalkThrough::end() {
  if (!engine_) return;
  if (!engine_->terminating()) engine_->terminateParser();
  watch_.reset();
  engine_.reset();
  adopted_.reset();
  parent_ = {};
  if (const auto told = over_) told();
}

}  // namespace qz::hosts::qt
