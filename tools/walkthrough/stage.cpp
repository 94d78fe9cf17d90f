// SPDX-License-Identifier: MIT
// What a walk-through is played on.
#include "tools/walkthrough/stage.hpp"

#include "tools/support/input_file.hpp"
#include "tools/walkthrough/gui_description.hpp"
#include "tools/walkthrough/stand_in.hpp"

namespace qz::tools::walkthrough {
namespace {

constexpr toolkit::Rect parentContent{80, 80, 800, 600};

/// Removes the sheet when it has ended, which is its delegate's task.
class SheetRemover final : public toolkit::SheetDelegate {
 public:
  void sheetDidEnd(const toolkit::Ref<toolkit::Window>& sheet, long, void*) override {
    sheet->orderOut();
  }
};

}  // namespace

StagePlan planStage(const StageOptions& options, const QZ_Plist_State_Parser::Dictionary& script,
                    const std::string& path) {
  StagePlan plan;
  plan.hostFile = path;
  plan.sheet = options.sheet;
  plan.names = options.names;
  if (options.assets) {
    const InputFile file(*options.assets, "a description of a window");
    checkGuiDescription(file);
    plan.description = file.dictionary();
  } else if (options.window) {
    plan.host = options.host ? *options.host : readHostWindow(*options.window);
    plan.hostFile = *options.window;
  } else {
    plan.host = standInWindow(script);
  }
  return plan;
}

Stage::Stage(drivers::Driver& driver, const StagePlan& plan)
    : driver_(driver), sheet_(plan.sheet), delegate_(std::make_shared<SheetRemover>()) {
  if (sheet_) parent_ = driver_.makeWindow(parentContent);
  if (plan.description) {
    buildFrom(plan.description);
  } else {
    adopt(plan.host, plan.hostFile);
  }
}

Stage::~Stage() {
  if (engine_->terminating()) return;
  driver_.setLogSink({});  // tidying up is not part of the walk-through
  engine_->terminateParser();
}

void Stage::buildFrom(const QZ_Plist_State_Parser::Dictionary& description) {
  engine_ = QZ_Plist_State_Parser::initWithWindow(driver_.toolkit(), parent_);
  engine_->loadGuiAssets(description, nullptr);
}

void Stage::adopt(const HostWindow& host, const std::string& file) {
  title_ = host.title;
  adopted_ = makeHostWindow(driver_, host, file);
  if (sheet_) adopted_->orderOut();  // a sheet is not visible before it is attached
  engine_ = QZ_Plist_State_Parser::initWithWindow(driver_.toolkit(), sheet_ ? parent_ : adopted_);
  engine_->getGuiAssetsFromWindow(adopted_);
}

bool Stage::load(const std::string& script, const std::optional<std::string>& startKey) {
  return engine_->loadPlist(script, startKey, delegate_, sheet_);
}

bool Stage::start(const QZ_Plist_State_Parser::Dictionary& script,
                  const std::optional<std::string>& startKey) {
  engine_->setPlistDictionary(script->copy(toolkit::Mutability::changeable));
  return load(noFile, startKey);
}

}  // namespace qz::tools::walkthrough
