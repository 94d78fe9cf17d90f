// SPDX-License-Identifier: MIT
// Measures the texts of a source as a toolkit lays them out.
#include "tools/steps/room.hpp"

#include <set>

#include "qz/drivers/measuring.hpp"
#include "tools/steps/each_step.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::steps {
namespace {

/// Returns words such as "23 points of width and 4 points of height".
std::string wordsFor(const drivers::MissingRoom& missing) {
  const auto points = [](double count) {
    return std::to_string(static_cast<int>(count)) + (count == 1 ? " point of " : " points of ");
  };
  std::string words = missing.width > 0 ? points(missing.width) + "width" : "";
  if (missing.height <= 0) return words;
  return words + (words.empty() ? "" : " and ") + points(missing.height) + "height";
}

/// Notes each text in each control once: many steps may show it.
class RoomCheck {
 public:
  RoomCheck(const Source& source, drivers::Driver& driver, drivers::Measuring& measuring)
      : source_(source), driver_(driver), measuring_(measuring) {}

  void see(StepIndex step, walkthrough::Stage& stage) {
    const auto views = stage.engine().tutorialWindow()->contentView()->subviews();
    for (ControlIndex i = 0; i < source_.tour.controls.size(); ++i) {
      if (saysText(step, i)) measure(step, i, views[i]);
    }
  }
  std::vector<std::string> take() { return std::move(messages_); }

 private:
  const ControlWords& ownWords(StepIndex step, ControlIndex control) const {
    return source_.tour.steps[step].words.controls[control];
  }
  const ControlWords& commonWords(ControlIndex control) const {
    return source_.tour.everyStep.controls[control];
  }

  /// The host's own texts are not the source's.
  bool saysText(StepIndex step, ControlIndex control) const {
    return ownWords(step, control).content || commonWords(control).content;
  }

  void measure(StepIndex step, ControlIndex control, const toolkit::Ref<toolkit::View>& view) {
    const drivers::ViewPicture picture = driver_.look(view);
    const auto missing = measuring_.missingRoom(view);
    if (picture.hidden || missing == drivers::MissingRoom{}) return;
    const std::string text =
        picture.title.string().empty() ? picture.text.string() : picture.title.string();
    if (!said_.emplace(control, text).second) return;
    const ControlWords& own = ownWords(step, control);
    const Place place = own.content ? own.place : commonWords(control).place;
    messages_.push_back(source_.files.at(place).text() + ": warning: " + quoteStart(text) + " (" +
                        source_.tour.steps[step].name + ", " + source_.tour.controls[control].name +
                        ") does not fit: the control lacks " + wordsFor(missing));
  }

  const Source& source_;
  drivers::Driver& driver_;
  drivers::Measuring& measuring_;
  std::set<std::pair<ControlIndex, std::string>> said_;
  std::vector<std::string> messages_;
};

}  // namespace

std::optional<std::vector<std::string>> textsWithoutRoom(const Source& source) {
  const auto driver = findDriver(
      [](drivers::Driver& each) { return dynamic_cast<drivers::Measuring*>(&each) != nullptr; });
  if (!driver) return std::nullopt;
  auto* const measuring = dynamic_cast<drivers::Measuring*>(driver.get());
  measuring->workOffScreen();
  RoomCheck check(source, *driver, *measuring);
  showEachStep(source, *driver,
               [&](StepIndex step, walkthrough::Stage& stage) { check.see(step, stage); });
  return check.take();
}

}  // namespace qz::tools::steps
