// SPDX-License-Identifier: MIT
// What a view saves, and how it is put back.

#include <tuple>
#include <vector>

#include "tests/enumerators.hpp"
#include "tests/memory/support.hpp"
#include "toolkit/memory/saved_view.hpp"
#include "toolkit/memory/views.hpp"
#include "toolkit/memory/window.hpp"

namespace qz::toolkit::memory::test {
namespace {

using drivers::ViewKind;

/// One change to a view.
struct ViewChange {
  const char* name;
  std::function<void(const Ref<View>&)> make;
};

/// What a driver's picture of a view does not show.
using Unseen = std::tuple<bool, Ref<Image>, BezelStyle, ImageFrameStyle, ImageScaling,
                          ImageAlignment, AttributedString>;

class SavedViewsTest : public MemoryTest {
 protected:
  static SavedView save(const Ref<View>& view) { return ViewNode::of(view)->save(); }
  static void restore(const Ref<View>& view, const SavedView& saved) {
    ViewNode::of(view)->restore(saved);
  }

  /// Returns every change that a script or a user can make to a view of the kind.
  std::vector<ViewChange> changesOf(ViewKind kind) const {
    std::vector<ViewChange> changes = changesOfEveryView();
    const auto add = [&](const std::vector<ViewChange>& more) {
      changes.insert(changes.end(), more.begin(), more.end());
    };
    if (rowOf(kind).isControl) add(changesOfControls());
    if (rowOf(kind).isButton) add(changesOfButtons());
    if (kind == ViewKind::imageView) add(changesOfImageViews());
    return changes;
  }

  std::vector<ViewChange> changesOfEveryView() const {
    return {
        {"tag", [](const Ref<View>& view) { view->setTag(-7); }},
        {"hidden", [](const Ref<View>& view) { view->setHidden(true); }},
        {"tooltip", [](const Ref<View>& view) { view->setToolTip("Press me"); }},
        {"layer", [](const Ref<View>& view) { view->setWantsLayer(true); }},
        {"layer contents",
         [this](const Ref<View>& view) {
           view->setWantsLayer(true);
           view->setLayerContents(sky());
         }},
    };
  }

  static std::vector<ViewChange> changesOfControls() {
    return {
        {"enabled", [](const Ref<View>& view) { view->setEnabled(false); }},
        {"plain text", [](const Ref<View>& view) { view->setStringValue("Hello"); }},
        {"styled text", [](const Ref<View>& view) { view->setAttributedStringValue(styled()); }},
    };
  }

  static std::vector<ViewChange> changesOfButtons() {
    const auto of = [](const Ref<View>& view) { return asButton(view); };
    return {
        {"title", [of](const Ref<View>& view) { of(view)->setTitle("Next"); }},
        {"styled title", [of](const Ref<View>& view) { of(view)->setAttributedTitle(styled()); }},
        {"state", [of](const Ref<View>& view) { of(view)->setState(State::mixed); }},
        {"pressed-in look", [of](const Ref<View>& view) { of(view)->highlight(true); }},
        {"background", [of](const Ref<View>& view) { of(view)->setBackgroundColor(colors::red); }},
        {"bezel",
         [of](const Ref<View>& view) { of(view)->setBezelStyle(BezelStyle::texturedSquare); }},
    };
  }

  std::vector<ViewChange> changesOfImageViews() const {
    const auto of = [](const Ref<View>& view) { return asImageView(view); };
    return {
        {"image", [this, of](const Ref<View>& view) { of(view)->setImage(sky()); }},
        {"frame style",
         [of](const Ref<View>& view) { of(view)->setImageFrameStyle(ImageFrameStyle{3}); }},
        {"scaling", [of](const Ref<View>& view) { of(view)->setImageScaling(ImageScaling{2}); }},
        {"alignment",
         [of](const Ref<View>& view) { of(view)->setImageAlignment(ImageAlignment{1}); }},
    };
  }

  void changeEverything(const Ref<View>& view, ViewKind kind) const {
    for (const ViewChange& change : changesOf(kind)) change.make(view);
  }

  /// Returns what `saved` must hold after every change to a view of the kind.
  SavedView everythingChanged(ViewKind kind) const {
    const drivers::ViewKindRow& row = rowOf(kind);
    SavedView saved{.tag = -7, .hidden = true, .toolTip = "Press me", .wantsLayer = true};
    saved.layerContents = sky();
    saved.enabled = !row.isControl;
    if (row.isControl) saved.text = styled();
    if (row.isButton) {
      saved.title = styled();
      saved.state = row.hasMixedState ? State::mixed : State::on;
      saved.highlighted = true;
      saved.background = colors::red;
      saved.bezel = BezelStyle::texturedSquare;
    }
    if (kind == ViewKind::imageView) {
      saved.image = sky();
      saved.frameStyle = ImageFrameStyle{3};
      saved.scaling = ImageScaling{2};
      saved.imageAlignment = ImageAlignment{1};
    }
    return saved;
  }

  static Unseen unseen(const Ref<View>& view) {
    Unseen unseen;
    const auto node = ViewNode::of(view);
    std::get<0>(unseen) = node->wantsLayer();
    std::get<1>(unseen) = node->layerContents();
    if (const auto* button = dynamic_cast<const MemoryButton*>(node.get())) {
      std::get<2>(unseen) = button->bezelStyle();
    }
    if (const auto* images = dynamic_cast<const MemoryImageView*>(node.get())) {
      std::get<3>(unseen) = images->imageFrameStyle();
      std::get<4>(unseen) = images->imageScaling();
      std::get<5>(unseen) = images->imageAlignment();
    }
    if (const auto* control = dynamic_cast<const ControlNode*>(node.get())) {
      std::get<6>(unseen) = control->attributedStringValue();
    }
    return unseen;
  }

  Ref<Image> sky() const { return sky_; }
  static AttributedString styled() {
    TextAttributes red;
    red.foregroundColor = colors::red;
    return AttributedString("Stop", red);
  }

 private:
  Ref<Image> findSky() {
    directory_.write("sky.png", "");
    driver.setResourcePath(directory_.path());
    return toolkit.images().imageNamed("sky");
  }

  const Directory directory_;
  const Ref<Image> sky_ = findSky();
};

TEST_F(SavedViewsTest, EveryChangeIsSavedAndTakenBack) {
  for (const ViewKind kind : enumerators<ViewKind>()) {
    for (const ViewChange& change : changesOf(kind)) {
      const auto what = std::string(rowOf(kind).name) + ", " + change.name;
      const Ref<View> view = make(kind);
      const SavedView before = save(view);
      const auto picture = driver.look(view);
      const Unseen rest = unseen(view);
      change.make(view);
      EXPECT_NE(save(view), before) << what;
      EXPECT_TRUE(driver.look(view) != picture || unseen(view) != rest) << what;
      restore(view, before);
      EXPECT_EQ(save(view), before) << what;
      EXPECT_EQ(driver.look(view), picture) << what;
      EXPECT_EQ(unseen(view), rest) << what;
    }
  }
}

TEST_F(SavedViewsTest, ASavedViewHoldsEverythingThatWasChanged) {
  for (const ViewKind kind : enumerators<ViewKind>()) {
    const Ref<View> view = make(kind);
    changeEverything(view, kind);
    EXPECT_EQ(save(view), everythingChanged(kind)) << rowOf(kind).name;
  }
}

TEST_F(SavedViewsTest, AnotherViewOfTheKindShowsTheSame) {
  for (const ViewKind kind : enumerators<ViewKind>()) {
    const Ref<View> view = make(kind);
    changeEverything(view, kind);
    const Ref<View> other = make(kind, 2);
    restore(other, save(view));
    EXPECT_EQ(driver.look(other), driver.look(view)) << rowOf(kind).name;
    EXPECT_EQ(unseen(other), unseen(view)) << rowOf(kind).name;
  }
}

TEST_F(SavedViewsTest, ASavedViewDoesNotFollowTheView) {
  for (const ViewKind kind : enumerators<ViewKind>()) {
    const Ref<View> view = make(kind);
    changeEverything(view, kind);
    const SavedView saved = save(view);
    restore(view, save(make(kind)));
    EXPECT_EQ(saved, everythingChanged(kind)) << rowOf(kind).name;
  }
}

TEST_F(SavedViewsTest, ARestoredViewIsDrawnAgain) {
  for (const ViewKind kind : enumerators<ViewKind>()) {
    const Ref<View> view = make(kind);
    const SavedView saved = save(view);
    driver.advance(0);
    EXPECT_FALSE(view->needsDisplay()) << rowOf(kind).name;
    restore(view, saved);
    EXPECT_TRUE(view->needsDisplay()) << rowOf(kind).name;
    driver.advance(0);
    EXPECT_FALSE(view->needsDisplay()) << rowOf(kind).name;
  }
}

TEST_F(SavedViewsTest, RestoringCallsNobody) {
  const auto target = std::make_shared<Recorder>();
  const auto delegate = std::make_shared<Recorder>();
  std::vector<std::string> log;
  driver.setLogSink([&](std::string_view line) { log.emplace_back(line); });
  for (const ViewKind kind : enumerators<ViewKind>()) {
    const Ref<View> view = make(kind);
    if (const auto control = std::dynamic_pointer_cast<Control>(view.pointer())) {
      control->setTarget(target);
      control->setAction("pressed:");
    }
    asTextField(view)->setDelegate(delegate);
    const SavedView before = save(view);
    changeEverything(view, kind);
    restore(view, before);
    driver.advance(10);
  }
  EXPECT_EQ(target->asked, std::vector<std::string>());
  EXPECT_EQ(delegate->asked, std::vector<std::string>());
  EXPECT_EQ(log, std::vector<std::string>());
}

TEST_F(SavedViewsTest, ARestoredButtonTakesClicksAsBefore) {
  const auto target = std::make_shared<Recorder>();
  const Ref<Button> button = makeButton(target, ViewKind::toggle);
  const SavedView enabled = save(button);
  button->setEnabled(false);
  const SavedView disabled = save(button);
  restore(button, enabled);
  driver.click(button);
  EXPECT_EQ(button->state(), State::on);
  restore(button, disabled);
  driver.click(button);
  EXPECT_EQ(button->state(), State::off);
  EXPECT_EQ(target->performed, std::vector<std::string>{"pressed:"});
}

TEST_F(SavedViewsTest, WhatIsNotSavedStays) {
  const auto target = std::make_shared<Recorder>();
  const auto delegate = std::make_shared<Recorder>();
  for (const ViewKind kind : enumerators<ViewKind>()) {
    const SavedView saved = save(make(kind));
    const Ref<View> view = make(kind);
    const Ref<View> subview = makeIn(view, ViewKind::plain, 8);
    driver.setFrame(view, {1, 2, 3, 4});
    if (const auto control = std::dynamic_pointer_cast<Control>(view.pointer())) {
      control->setTarget(target);
      control->setAction("pressed:");
    }
    asTextField(view)->setDelegate(delegate);
    restore(view, saved);

    EXPECT_EQ(view->frame(), (Rect{1, 2, 3, 4})) << rowOf(kind).name;
    EXPECT_EQ(view->subviews(), Subviews{subview}) << rowOf(kind).name;
    EXPECT_EQ(ViewNode::of(subview)->superview(), ViewNode::of(view)) << rowOf(kind).name;
    EXPECT_EQ(Ref<View>(ViewNode::of(view)->superview()->view()), window->contentView());
    EXPECT_EQ(Ref<Window>(ViewNode::of(view)->window()), window) << rowOf(kind).name;
    if (const auto* control = dynamic_cast<const ControlNode*>(ViewNode::of(view).get())) {
      EXPECT_EQ(control->target(), target) << rowOf(kind).name;
      EXPECT_EQ(control->action(), "pressed:") << rowOf(kind).name;
    }
    if (kind == ViewKind::textField) {
      const auto field = std::dynamic_pointer_cast<MemoryTextField>(view.pointer());
      EXPECT_EQ(field->delegate(), delegate);
    }
  }
}

TEST_F(SavedViewsTest, AViewTakesOnlyWhatItsRolesHave) {
  const SavedView everything = everythingChanged(ViewKind::mixed);
  const Ref<View> plain = make(ViewKind::plain);
  restore(plain, everything);
  EXPECT_EQ(save(plain), everythingChanged(ViewKind::plain));
  const Ref<View> field = make(ViewKind::textField);
  restore(field, everything);
  EXPECT_EQ(save(field), everythingChanged(ViewKind::textField));
}

TEST_F(SavedViewsTest, TheBackgroundOfAWindowIsRestored) {
  const Ref<View> content = window->contentView();
  const SavedView before = save(content);
  content->setWantsLayer(true);
  content->setLayerContents(sky());
  const SavedView layered = save(content);
  restore(content, before);
  EXPECT_FALSE(driver.look(window).layered);
  EXPECT_EQ(driver.look(window).layerImage, std::nullopt);
  restore(content, layered);
  EXPECT_TRUE(driver.look(window).layered);
  EXPECT_EQ(driver.look(window).layerImage, "sky");
}

}  // namespace
}  // namespace qz::toolkit::memory::test
