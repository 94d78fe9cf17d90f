// SPDX-License-Identifier: MIT
// The driver: what a host and an observer can see through it.

#include <gtest/gtest.h>

#include "tests/memory/support.hpp"
#include "tests/view_kinds.hpp"

namespace qz::toolkit::memory::test {
namespace {

using DriverTest = MemoryTest;

TEST_F(DriverTest, MakesEveryKindOfView) {
  const struct {
    drivers::ViewKind kind;
    const char* className;
    bool button, textField, imageView;
  } cases[] = {
      {drivers::ViewKind::button, "NSButton", true, false, false},
      {drivers::ViewKind::toggle, "NSButton", true, false, false},
      {drivers::ViewKind::mixed, "NSButton", true, false, false},
      {drivers::ViewKind::popUpButton, "NSPopUpButton", true, false, false},
      {drivers::ViewKind::textField, "NSTextField", false, true, false},
      {drivers::ViewKind::imageView, "NSImageView", false, false, true},
      {drivers::ViewKind::box, "NSBox", false, false, false},
      {drivers::ViewKind::plain, "NSView", false, false, false},
  };
  for (const auto& c : cases) {
    const Ref<View> view = make(c.kind, 7);
    EXPECT_EQ(driver.look(view).kind, c.kind) << c.className;
    EXPECT_EQ(view->className(), c.className);
    EXPECT_EQ(driver.look(view).className, c.className);
    EXPECT_EQ(driver.className(c.kind), c.className);
    EXPECT_EQ(view->tag(), 7);
    EXPECT_EQ(view->frame(), (Rect{10, 20, 30, 40}));
    EXPECT_EQ(view->asButton() != nullptr, c.button);
    EXPECT_EQ(view->asTextField() != nullptr, c.textField);
    EXPECT_EQ(view->asImageView() != nullptr, c.imageView);
    EXPECT_EQ(window->contentView()->subviews().back(), view);
  }
}

TEST_F(DriverTest, AgreesWithTheTableOfKinds) { expectEveryKindOfView(driver); }

TEST_F(DriverTest, ACaptionIsWhatTheKindShows) {
  const Directory directory;
  directory.write("sky.png", "");
  driver.setResourcePath(directory.path());
  const struct {
    drivers::ViewKind kind;
    const char* title;
    const char* text;
    std::optional<std::string> image;
  } cases[] = {
      {drivers::ViewKind::button, "sky", "", std::nullopt},
      {drivers::ViewKind::popUpButton, "sky", "", std::nullopt},
      {drivers::ViewKind::textField, "", "sky", std::nullopt},
      {drivers::ViewKind::imageView, "", "", "sky"},
      {drivers::ViewKind::box, "", "", std::nullopt},
      {drivers::ViewKind::plain, "", "", std::nullopt},
  };
  for (const auto& c : cases) {
    const Ref<View> view = make(c.kind);
    driver.setCaption(view, "sky");
    const drivers::ViewPicture picture = driver.look(view);
    EXPECT_EQ(picture.title, AttributedString(c.title));
    EXPECT_EQ(picture.text, AttributedString(c.text));
    EXPECT_EQ(picture.image, c.image);
  }
}

TEST_F(DriverTest, AnUnknownImageClearsAnImageView) {
  const Directory directory;
  directory.write("sky.png", "");
  driver.setResourcePath(directory.path());
  const Ref<View> view = make(drivers::ViewKind::imageView);
  driver.setCaption(view, "sky");
  driver.setCaption(view, "nonesuch");
  EXPECT_EQ(driver.look(view).image, std::nullopt);
}

TEST_F(DriverTest, AbsentThingsLookLikeNothing) {
  const drivers::ViewPicture view = driver.look(Ref<View>());
  EXPECT_EQ(view.className, "");
  EXPECT_EQ(view.tag, 0);
  const drivers::WindowPicture picture = driver.look(Ref<Window>());
  EXPECT_FALSE(picture.visible);
  EXPECT_EQ(picture.closes, 0);
  driver.setCaption(nullptr, "text");
  driver.setFrame(nullptr, {});
  driver.removeFromSuperview(nullptr);
  EXPECT_TRUE(driver.makeView(drivers::ViewKind::button, 4, {}, nullptr));
}

TEST_F(DriverTest, TimePassesOnTheToolkitsClock) {
  int firings = 0;
  toolkit.runLoop().schedule(0.5, true, [&](const Ref<Timer>&) { ++firings; });
  driver.advance(0.25);
  EXPECT_EQ(firings, 0);
  driver.advance(3);
  EXPECT_EQ(firings, 6);
  EXPECT_EQ(toolkit.parts().runLoop.now(), 3.25);
}

TEST(MemoryDriverFactory, MakesADriverThatIsItsOwnWorld) {
  const std::unique_ptr<drivers::Driver> one = drivers::makeMemoryDriver();
  const std::unique_ptr<drivers::Driver> two = drivers::makeMemoryDriver();
  EXPECT_EQ(one->name(), "memory");
  const Ref<Window> window = one->makeWindow({});
  const Ref<Window> other = two->makeWindow({});
  EXPECT_TRUE(one->look(window).key);
  EXPECT_TRUE(two->look(other).key);
}

/// Stands for an engine: a timer's action keeps it, and its destructor still uses the toolkit.
struct Engine : Responder {
  explicit Engine(Toolkit& used) : toolkit(used) {}
  ~Engine() override {
    timer->invalidate();
    toolkit.log().write("ended");
    toolkit.images().imageNamed("sky");
    toolkit.application().endSheet(window, 0);
    window->close();
  }
  Toolkit& toolkit;
  Ref<Timer> timer;
  Ref<Window> window;
};

TEST(MemoryDriverEnd, EnginesThatTimersHoldEndBeforeTheToolkit) {
  std::string lines;
  auto driver = std::make_unique<drivers::MemoryDriver>();
  driver->setLogSink([&](std::string_view line) { lines += line; });
  {
    const auto engine = std::make_shared<Engine>(driver->toolkit());
    engine->window = driver->toolkit().application().makeWindow({}, StyleMask::titled,
                                                                BackingStore::buffered, false);
    engine->window->makeKeyAndOrderFront();
    engine->window->setDelegate(engine);
    engine->timer = driver->toolkit().runLoop().schedule(0.5, true, [engine](const Ref<Timer>&) {});
  }
  driver->advance(1);
  EXPECT_EQ(lines, "");
  driver = nullptr;
  EXPECT_EQ(lines, "ended");
}

}  // namespace
}  // namespace qz::toolkit::memory::test
