// The form with walk-throughs in its Help menu: one over the form itself, one in a sheet.
#pragma once

#include <QCloseEvent>
#include <QMenuBar>
#include <array>
#include <memory>
#include <string_view>

#include "QZ_Plist_State_Parser.hpp"
#include "order_form.hpp"
#include "tips_panel.hpp"
#include "toolkit/qt/qt_toolkit.hpp"

class GuidedForm final : public OrderForm,
                         public toolkit::SheetDelegate,
                         public std::enable_shared_from_this<GuidedForm> {
 public:
  /// Scripts and images are looked for in the directory.
  explicit GuidedForm(std::string_view resources) {
    toolkit_.files().setResourcePath(resources);
    QMenu* const help = menuBar()->addMenu("&Help");
    help->addAction("Show me &around", [this] { play("tour.plist", *this); });
    help->addAction("&Tips", [this] { play("tips.plist", tips); });
  }

  TipsPanel tips;

 private:
  void play(const char* script, QWidget& stage) {
    windows_ = {toolkit_.application().window(*this), toolkit_.application().window(stage)};
    tour_ = QZ_Plist_State_Parser::initWithWindow(toolkit_, windows_[0]);
    tour_->getGuiAssetsFromWindow(windows_[1]);
    tour_->loadPlist(script, "", shared_from_this(), &stage != this);
  }
  void end() { tour_->terminateParser(), tour_.reset(), windows_ = {}, connectButtons(); }
  void sheetDidEnd(const toolkit::Ref<toolkit::Window>& sheet, long, void*) override {
    sheet->orderOut(), end();
  }
  // A walk-through closes its window when it ends; the form stays open.
  void closeEvent(QCloseEvent* event) override {
    if (tour_ && tour_->terminating()) end(), event->ignore();
  }

  toolkit::qt::QtToolkit toolkit_;
  std::array<toolkit::Ref<toolkit::Window>, 2> windows_;  // held while a walk-through needs them
  std::shared_ptr<QZ_Plist_State_Parser> tour_;
};
