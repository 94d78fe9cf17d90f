// SPDX-License-Identifier: MIT
#include "tools/storyboard/storyboard.hpp"

#include <filesystem>
#include <limits>
#include <map>
#include <optional>

#include "qz/drivers/drawing.hpp"
#include "tools/check/report.hpp"
#include "tools/drawing/look_stage.hpp"
#include "tools/storyboard/board.hpp"
#include "tools/storyboard/page.hpp"
#include "tools/storyboard/picture_store.hpp"
#include "tools/storyboard/selection.hpp"
#include "tools/storyboard/shipped_fonts.hpp"
#include "tools/storyboard/source_excerpt.hpp"
#include "tools/storyboard/step_names.hpp"
#include "tools/support/drivers.hpp"

namespace qz::tools::storyboard {
namespace {

using walkthrough::StepPicture;

constexpr auto nothingSeen = std::numeric_limits<check::LookValue>::max();

/// Makes the page of a board.
class PageMaker {
 public:
  PageMaker(const InputFile& file, const StoryboardOptions& options, const Board& board,
            const check::Verdict& verdict)
      : file_(file),
        options_(options),
        board_(board),
        report_{verdict, file, options.stageArguments, check::Severity::note},
        excerpts_(file, board.exploration().setting().script) {}

  Page make() {
    lookAtSteps();
    page_.title = "Storyboard of " + std::filesystem::path(file_.path()).filename().string();
    for (const StepIndex step : shown_) addStep(step);
    draw();
    addFindings();
    addRemarks();
    return std::move(page_);
  }

  std::size_t pictures() const { return drawn_; }
  std::size_t leftOut() const { return board_.steps().size() - shown_.size(); }

 private:
  /// All steps get their names, so that those do not depend on the limit.
  void lookAtSteps() {
    const auto& exploration = board_.exploration();
    const auto driver = requireDriver(testToolkit());
    driver->setResourcePath(exploration.setting().resources);
    for (const BoardStep& step : board_.steps()) {
      pictures_.push_back(
          drawing::LookStage(*driver, exploration, step.place, step.look).picture());
    }
    names_ = stepNames(board_.steps(), pictures_, !exploration.setting().plan.names.isEmpty());
    shown_ = selectSteps(board_, options_.limit);
    for (std::size_t i = 0; i < shown_.size(); ++i) numbers_[shown_[i]] = i;
  }

  void addStep(StepIndex index) {
    const BoardStep& step = board_.steps()[index];
    PageStep shown{.name = names_[index],
                   .group = step.group,
                   .picture = pictures_[index],
                   .command = check::playCommand(report_, board_.exploration().path(step.visit)),
                   .source = excerpts_.of(step.ranLists)};
    for (const BoardMove& each : step.moves) {
      PageMove move{.argument = argumentOf(step, each.move), .to = targetOf(each.to)};
      if (each.move != check::waitMove) move.control = each.move;
      shown.moves.push_back(std::move(move));
    }
    page_.steps.push_back(std::move(shown));
  }

  /// Draws each look once, if the toolkit can draw.
  void draw() {
    const auto driver = requireDriver(options_.toolkit);
    auto* const artist = dynamic_cast<drivers::Drawing*>(driver.get());
    if (!artist) return;
    artist->drawAlike(shippedFonts());
    driver->setResourcePath(board_.exploration().setting().resources);
    PictureStore store(*artist, page_);
    std::map<check::Looks::Parts, std::vector<std::size_t>> drawn;  // their patches
    for (std::size_t i = 0; i < shown_.size(); ++i) {
      options_.drawing(i, shown_.size());
      const BoardStep& step = board_.steps()[shown_[i]];
      if (step.isOver) continue;
      const auto [known, isNew] = drawn.try_emplace(seenAt(step));
      if (isNew) {
        drawing::LookStage stage(*driver, board_.exploration(), step.place, step.look);
        known->second = store.add(stage.window(), page_.steps[i].picture);
      }
      page_.steps[i].patches = known->second;
      page_.steps[i].isDrawn = !page_.ground.empty();
    }
    drawn_ = drawn.size();
  }

  /// Returns the parts of the look that are seen.
  check::Looks::Parts seenAt(const BoardStep& step) const {
    const auto& exploration = board_.exploration();
    const auto& format = exploration.format();
    auto seen = exploration.looks().parts(step.look);
    seen.resize(format.controls() + 1);  // the last is the background
    for (std::size_t i = 0; i < format.controls(); ++i) {
      const auto state = format.control(exploration.place(step.place), i);
      const check::LookValue shown = 2 * seen[i] + (state.enabled ? 1 : 0);
      seen[i] = state.hidden ? nothingSeen : shown;
    }
    return seen;
  }

  std::string argumentOf(const BoardStep& step, check::Move move) const {
    const auto& names = board_.exploration().setting().plan.names;
    return check::playArguments({board_.exploration().stepFrom(step.place, move)}, names);
  }

  PageTarget targetOf(const std::optional<StepIndex>& step) const {
    if (!step) return {};
    const auto number = numbers_.find(*step);
    PageTarget target{.title = names_[*step].title};
    if (number != numbers_.end()) target.step = number->second;
    return target;
  }

  void addFindings() {
    for (const check::Finding& finding : report_.verdict.findings) {
      PageFinding shown{.severity = std::string(nameOf(finding.severity)),
                        .code = finding.code,
                        .message = finding.message,
                        .place = check::placeOf(finding, file_),
                        .help = finding.help};
      const auto steps = board_.stepsOf(finding.path);
      for (std::size_t i = 0; i < steps.size(); ++i) {
        const std::string words =
            i < finding.played.size() ? finding.played[i].words : names_[steps[i]].title;
        shown.path.emplace_back(words, targetOf(steps[i]));
      }
      page_.findings.push_back(std::move(shown));
    }
  }

  void addRemarks() {
    const std::size_t all = board_.steps().size();
    std::string count = std::to_string(all) + (all == 1 ? " step" : " steps");
    if (leftOut() > 0) {
      count = std::to_string(shown_.size()) + " of " + count +
              ": those that show every list, every move and every look of each list, as far as " +
              "there is room, and the nearest others. --limit sets how many";
    }
    page_.remarks.push_back(count + ".");
    if (!board_.exploration().isComplete()) {
      page_.remarks.emplace_back("Not everything was explored, so there may be more steps.");
    }
    if (report_.verdict.isStandIn) {
      page_.remarks.emplace_back(
          "The window was made from the script; name the real one with --window or --assets.");
    }
  }

  const InputFile& file_;
  const StoryboardOptions& options_;
  const Board& board_;
  const check::Report report_;
  SourceExcerpts excerpts_;
  std::vector<StepPicture> pictures_;  // of all steps of the board
  std::vector<StepName> names_;        // the same
  std::vector<StepIndex> shown_;
  std::map<StepIndex, std::size_t> numbers_;  // of the shown steps, on the page
  std::size_t drawn_ = 0;                     // pictures
  Page page_;
};

}  // namespace

Storyboard makeStoryboard(const InputFile& file, const StoryboardOptions& options,
                          const check::ExplorationHooks& hooks) {
  const auto& own = options.check;
  const auto verdict = checkScript(file, own, hooks);
  const check::Script script(file.dictionary());
  const auto plan = walkthrough::planStage(own.stage, script.dictionary(), file.path());
  check::Setting setting = check::settingOf(script, plan, check::resourcesFor(file, own));
  setting.wholeLooks = true;
  setting.exactStates = true;
  setting.watchedLists.assign(script.lists().size(), true);
  check::Exploration exploration(setting, check::startKeysOf(file, script, own));
  exploration.run(own.limits, own.threads, hooks);
  const Board board(exploration, own.threads);
  PageMaker maker(file, options, board, verdict);
  const Page page = maker.make();
  return {.html = htmlOf(page),
          .steps = page.steps.size(),
          .leftOut = maker.leftOut(),
          .pictures = maker.pictures(),
          .findings = page.findings.size(),
          .isComplete = exploration.isComplete()};
}

}  // namespace qz::tools::storyboard
