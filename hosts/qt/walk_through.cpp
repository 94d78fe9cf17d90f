// SPDX-License-Identifier: MIT
// Ends come from within the engine or from within an event of the window's, neither of which would
// survive their objects' going at once: the rest is done when Qt's event loop is back.

#include "hosts/qt/walk_through.hpp"

#include <QEvent>

namespace hosts::qt {

class WalkThrough::Watch final : public QObject, public toolkit::SheetDelegate {
 public:
  Watch(WalkThrough& owner, QWidget& stage) : owner_(owner), stage_(&stage) {
    stage.installEventFilter(this);
    connect(&stage, &QObject::destroyed, this, [this] { endSoon(); });
  }

  void sheetDidEnd(const toolkit::Ref<toolkit::Window>& sheet, long, void*) override {
    sheet->orderOut();
    endSoon();
  }

  bool eventFilter(QObject*, QEvent* event) override {
    if (event->type() != QEvent::Close) return false;
    endSoon();
    if (!isOver()) return false;
    event->ignore();  // it is the walk-through that closes the window, not the user
    return true;
  }

 private:
  bool isOver() const { return owner_.engine_->terminating(); }

  // Of a window that its host has not let the user close the walk-through goes on.
  void endSoon() {
    const auto endIfOver = [this] {
      if (isOver() || !stage_ || !stage_->isVisible()) owner_.end();
    };
    QMetaObject::invokeMethod(this, endIfOver, Qt::QueuedConnection);
  }

  WalkThrough& owner_;
  QPointer<QWidget> stage_;
};

WalkThrough::WalkThrough(toolkit::qt::QtToolkit& toolkit) : toolkit_(toolkit) {}

WalkThrough::~WalkThrough() {
  over_ = nullptr;  // whoever would be told may be half gone
  end();
}

bool WalkThrough::play(std::string_view script, QWidget& window) {
  return begin(script, window, window);
}

bool WalkThrough::playInSheet(std::string_view script, QWidget& panel, QWidget& window) {
  return begin(script, panel, window);
}

bool WalkThrough::begin(std::string_view script, QWidget& stage, QWidget& window) {
  end();
  auto& application = toolkit_.application();
  const std::string name(script);
  const auto over = application.window(window);
  const auto engine = QZ_Plist_State_Parser::initWithWindow(toolkit_, over);
  engine->loadPlist(name, std::nullopt, nullptr, false);
  if (engine->plistDictionary()->count() == 0) {
    engine->terminateParser();  // else its flasher would keep it
    return false;
  }
  engine_ = engine;
  windows_ = {over, application.window(stage)};
  watch_ = std::make_shared<Watch>(*this, stage);
  engine->getGuiAssetsFromWindow(windows_[1]);
  toolkit_.calls().make([&] { engine->loadPlist(name, "", watch_, &stage != &window); });
  return true;
}

void WalkThrough::end() {
  if (!engine_) return;
  if (!engine_->terminating()) engine_->terminateParser();
  watch_.reset();
  engine_.reset();
  windows_.clear();
  if (const auto told = over_) told();
}

}  // namespace hosts::qt
