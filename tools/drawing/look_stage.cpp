// SPDX-License-Identifier: MIT
// Sets what differs from the window before the start.
#include "tools/drawing/look_stage.hpp"

#include <utility>

#include "qz/property_list/scalars.hpp"

namespace qz::tools::drawing {
namespace {

using check::LookValue;
using check::SavedView;
using toolkit::Ref;
using toolkit::View;

/// Makes a view look as saved. `before` is what it shows now.
class Restoring {
 public:
  Restoring(toolkit::Images& images, const SavedView& before, const SavedView& saved)
      : images_(images), before_(before), saved_(saved) {}

  void restore(const Ref<View>& view) const {
    if (differs(&SavedView::toolTip)) view->setToolTip(saved_.toolTip);
    if (differs(&SavedView::wantsLayer)) view->setWantsLayer(saved_.wantsLayer);
    if (differs(&SavedView::layerContents)) view->setLayerContents(own(saved_.layerContents));
    if (differs(&SavedView::text)) view->setAttributedStringValue(saved_.text);
    restoreButton(asButton(view));
    const auto imageView = asImageView(view);
    if (imageView && differs(&SavedView::image)) imageView->setImage(own(saved_.image));
  }

 private:
  template <class Value>
  bool differs(Value SavedView::*value) const {
    return !(before_.*value == saved_.*value);
  }

  void restoreButton(const Ref<toolkit::Button>& button) const {
    if (!button) return;
    if (differs(&SavedView::title)) button->setAttributedTitle(saved_.title);
    if (differs(&SavedView::state)) button->setState(saved_.state);
    if (differs(&SavedView::background) && saved_.background) {
      button->setBackgroundColor(*saved_.background);
    }
  }

  /// Returns the same image of this stage's toolkit.
  Ref<toolkit::Image> own(const Ref<toolkit::Image>& image) const {
    return image ? images_.imageNamed(image->name()) : Ref<toolkit::Image>();
  }

  toolkit::Images& images_;
  const SavedView& before_;
  const SavedView& saved_;
};

}  // namespace

LookStage::LookStage(drivers::Driver& driver, const check::Exploration& exploration,
                     std::uint32_t place, std::uint32_t look)
    : driver_(driver),
      exploration_(exploration),
      place_(place),
      stage_(driver, exploration.setting().plan) {
  stage_.start(exploration.setting().script.dictionary(), std::nullopt);
  const auto& parts = exploration.looks().parts(look);
  showControls(parts);
  showBackground(parts);
  showFlashing(parts);
}

void LookStage::showControls(const check::Looks::Parts& parts) {
  const auto& format = exploration_.format();
  const auto& looks = exploration_.looks();
  const auto& before = looks.parts(exploration_.firstLook());
  const auto controls = window()->contentView()->subviews();
  for (std::size_t i = 0; i < controls.size() && i < format.controls(); ++i) {
    const Ref<View>& view = controls[i];
    Restoring(driver_.toolkit().images(), looks.look(before[i]).view, looks.look(parts[i]).view)
        .restore(view);
    const auto state = format.control(exploration_.place(place_), i);
    view->setTag(state.tag);
    view->setHidden(state.hidden);
    if (drivers::rowOf(exploration_.setting().kinds[i]).isControl) view->setEnabled(state.enabled);
  }
}

void LookStage::showBackground(const check::Looks::Parts& parts) {
  const auto& looks = exploration_.looks();
  const std::size_t part = exploration_.format().controls();
  const auto& before = looks.look(looks.parts(exploration_.firstLook())[part]).view;
  Restoring(driver_.toolkit().images(), before, looks.look(parts[part]).view)
      .restore(window()->contentView());
}

void LookStage::showFlashing(const check::Looks::Parts& parts) {
  auto& engine = stage_.engine();
  std::size_t part = exploration_.firstFlashPart();
  engine.setFlashing(parts[part - 1] == check::notedYes);
  const auto flashing = engine.flashingTagIds();
  for (const std::string& key : exploration_.setting().flashKeys) {
    const LookValue note = parts[part++] % check::flashingAllowed;
    if (note == check::notedNothing) continue;
    flashing->setObject(toolkit::Number::withBool(note == check::notedYes), key);
  }
}

walkthrough::StepPicture LookStage::picture() {
  auto picture = walkthrough::takePicture(driver_, stage_.engine(), stage_.title());
  for (const auto& [key, seconds] : exploration_.timers(place_)) {
    picture.timers.push_back({.identity = {}, .key = key, .timeLeft = seconds});
  }
  picture.ended = exploration_.format().isOver(exploration_.place(place_));
  walkthrough::Naming(exploration_.setting().plan.names).apply(picture);
  return picture;
}

}  // namespace qz::tools::drawing
