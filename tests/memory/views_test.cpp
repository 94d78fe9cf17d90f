// SPDX-License-Identifier: MIT
// Views: their place in the tree, and their properties.

#include "toolkit/memory/views.hpp"

#include <vector>

#include "qz/toolkit/exception.hpp"
#include "tests/memory/support.hpp"
#include "toolkit/memory/window.hpp"

namespace qz::toolkit::memory::test {
namespace {

class ViewsTest : public MemoryTest {
 protected:
  static std::vector<Tag> tagsIn(const Ref<View>& view) {
    std::vector<Tag> tags;
    for (const Ref<View>& subview : view->subviews()) tags.push_back(subview->tag());
    return tags;
  }
  /// Returns the reason why `parent` refuses `view`; empty when it accepts it.
  static std::string refusal(const Ref<View>& parent, const Ref<View>& view) {
    try {
      parent->addSubview(view);
    } catch (const InvalidArgumentException& exception) {
      return exception.reason();
    }
    return {};
  }

  Ref<View> content = window->contentView();
};

TEST_F(ViewsTest, SubviewsLieBackToFront) {
  for (const Tag tag : {3, 1, 2}) make(drivers::ViewKind::button, tag);
  EXPECT_EQ(tagsIn(content), (std::vector<Tag>{3, 1, 2}));
}

TEST_F(ViewsTest, AddingAViewAgainBringsItToTheFront) {
  for (const Tag tag : {1, 2, 3}) make(drivers::ViewKind::button, tag);
  content->addSubview(content->subviews().front());
  EXPECT_EQ(tagsIn(content), (std::vector<Tag>{2, 3, 1}));
}

TEST_F(ViewsTest, AddingAViewTakesItFromWhereItWas) {
  const Ref<View> box = make(drivers::ViewKind::box, 9);
  const Ref<View> button = make(drivers::ViewKind::button, 5);
  box->addSubview(button);
  EXPECT_EQ(tagsIn(content), std::vector<Tag>{9});
  EXPECT_EQ(tagsIn(box), std::vector<Tag>{5});
  content->addSubview(box->subviews().front());
  EXPECT_EQ(tagsIn(content), (std::vector<Tag>{9, 5}));
  EXPECT_TRUE(box->subviews().empty());
}

TEST_F(ViewsTest, AViewRefusesWhatCannotLieInIt) {
  const Ref<View> outer = make(drivers::ViewKind::box, 1);
  const Ref<View> inner = makeIn(outer, drivers::ViewKind::box, 2);
  // Stands for another toolkit's view: it is not a node of this one.
  const Ref<View> foreign = std::shared_ptr<View>(std::shared_ptr<void>(), &View::nothing());
  const Ref<Window> other = driver.makeWindow({});
  const struct {
    const Ref<View>& parent;
    Ref<View> view;
    std::string reason;
  } cases[] = {
      {outer, nullptr, "-[NSBox addSubview:]: the view is absent"},
      {outer, outer, "-[NSBox addSubview:]: the view is the superview itself, or contains it"},
      {inner, outer, "-[NSBox addSubview:]: the view is the superview itself, or contains it"},
      {inner, content, "-[NSBox addSubview:]: the view is the content view of a window"},
      {inner, other->contentView(),
       "-[NSBox addSubview:]: the view is the content view of a window"},
      {inner, foreign, "-[NSBox addSubview:]: the view, of class , belongs to another toolkit"},
  };
  for (const auto& c : cases) EXPECT_EQ(refusal(c.parent, c.view), c.reason);
  EXPECT_EQ(tagsIn(content), std::vector<Tag>{1});
  EXPECT_EQ(tagsIn(outer), std::vector<Tag>{2});
  EXPECT_TRUE(inner->subviews().empty());
}

TEST_F(ViewsTest, ASuperviewOwnsItsSubviews) {
  const std::weak_ptr<View> button = make(drivers::ViewKind::button).pointer();
  EXPECT_FALSE(button.expired());
  driver.removeFromSuperview(button.lock());
  EXPECT_TRUE(button.expired());
  EXPECT_TRUE(content->subviews().empty());
}

TEST_F(ViewsTest, AViewOutlivesItsSuperviewAndItsWindow) {
  const Ref<View> button = makeIn(make(drivers::ViewKind::box, 1), drivers::ViewKind::button, 2);
  window = nullptr;
  content = nullptr;
  EXPECT_EQ(ViewNode::of(button)->superview(), nullptr);
  EXPECT_EQ(ViewNode::of(button)->window(), nullptr);
  driver.removeFromSuperview(button);
  driver.click(button);
  EXPECT_EQ(button->tag(), 2);
}

TEST_F(ViewsTest, AViewInAWindowKnowsItHoweverDeepItLies) {
  const Ref<View> button = makeIn(makeIn(make(drivers::ViewKind::box), drivers::ViewKind::box, 2),
                                  drivers::ViewKind::button, 3);
  EXPECT_EQ(Ref<Window>(ViewNode::of(button)->window()), window);
  EXPECT_EQ(ViewNode::of(driver.makeView(drivers::ViewKind::plain, 1, {}, nullptr))->window(),
            nullptr);
}

TEST_F(ViewsTest, AViewKeepsWhatItIsGiven) {
  const Ref<View> box = make(drivers::ViewKind::box);
  box->setTag(-7);
  box->setHidden(true);
  box->setToolTip("Press me");
  driver.setFrame(box, {1, 2, 3, 4});
  drivers::ViewPicture picture = driver.look(box);
  EXPECT_EQ(picture.tag, -7);
  EXPECT_TRUE(picture.hidden);
  EXPECT_EQ(picture.toolTip, "Press me");
  EXPECT_EQ(picture.frame, (Rect{1, 2, 3, 4}));
  EXPECT_EQ(box->frame(), (Rect{1, 2, 3, 4}));
  box->setToolTip("");
  EXPECT_EQ(driver.look(box).toolTip, "");
}

TEST_F(ViewsTest, ARedrawIsPendingFromAChangeToTheNextDrawing) {
  const Ref<Button> button = asButton(make(drivers::ViewKind::button));
  EXPECT_TRUE(button->needsDisplay());
  const std::function<void()> changes[] = {
      [&] { button->setTitle("Next"); },       [&] { button->setEnabled(false); },
      [&] { button->setState(State::on); },    [&] { button->highlight(true); },
      [&] { button->setHidden(true); },        [&] { button->setBackgroundColor(colors::red); },
      [&] { button->setStringValue("text"); }, [&] { driver.setFrame(button, {}); },
  };
  for (const auto& change : changes) {
    driver.advance(0);
    EXPECT_FALSE(button->needsDisplay());
    change();
    EXPECT_TRUE(button->needsDisplay());
    EXPECT_TRUE(button->needsDisplay()) << "asking changed it";
  }
  driver.click(button);
  EXPECT_FALSE(button->needsDisplay());
}

TEST_F(ViewsTest, OnlyALayerHasContents) {
  const Directory directory;
  directory.write("sky.png", "");
  driver.setResourcePath(directory.path());
  const Ref<Image> sky = toolkit.images().imageNamed("sky");
  content->setLayerContents(sky);
  EXPECT_FALSE(driver.look(window).layered);
  EXPECT_EQ(driver.look(window).layerImage, std::nullopt);
  content->setWantsLayer(true);
  EXPECT_EQ(driver.look(window).layerImage, std::nullopt);
  content->setLayerContents(sky);
  EXPECT_TRUE(driver.look(window).layered);
  EXPECT_EQ(driver.look(window).layerImage, "sky");
  content->setLayerContents(nullptr);
  EXPECT_EQ(driver.look(window).layerImage, std::nullopt);
  content->setLayerContents(sky);
  content->setWantsLayer(false);
  EXPECT_EQ(driver.look(window).layerImage, std::nullopt);
}

}  // namespace
}  // namespace qz::toolkit::memory::test
