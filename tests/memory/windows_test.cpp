// SPDX-License-Identifier: MIT
// Windows: on and off the screen, their order, the key window, and what keeps them alive.

#include <vector>

#include "tests/memory/support.hpp"
#include "toolkit/memory/window.hpp"

namespace qz::toolkit::memory::test {
namespace {

class WindowsTest : public MemoryTest {
 protected:
  Ref<Window> makeAppWindow() {
    return application.makeWindow({200, 300, 800, 600}, StyleMask::titledAndClosable,
                                  BackingStore::buffered, true);
  }
  /// Expects these windows on the screen, back to front, with only the last one key.
  void expectShown(const std::vector<Ref<Window>>& expected) {
    std::vector<Ref<Window>> shown;
    for (MemoryWindow* const each : toolkit.application().screen()->windows()) {
      shown.emplace_back(each->shared_from_this());
    }
    EXPECT_TRUE(shown == expected);
    for (const Ref<Window>& each : expected) {
      EXPECT_EQ(driver.look(each).key, each == expected.back());
    }
  }
};

TEST_F(WindowsTest, ANewWindowIsOffTheScreenAndEmpty) {
  const Ref<Window> made = makeAppWindow();
  const drivers::WindowPicture picture = driver.look(made);
  EXPECT_FALSE(picture.visible || picture.key || picture.layered);
  EXPECT_EQ(picture.closes, 0);
  EXPECT_EQ(picture.content, (Rect{200, 300, 800, 600}));
  EXPECT_EQ(picture.style, 3U);
  EXPECT_EQ(picture.background, windowBackground);
  EXPECT_EQ(picture.delegate, nullptr);
  EXPECT_FALSE(picture.sheetOf);
  EXPECT_TRUE(picture.sheetEnds.empty());
  EXPECT_EQ(made->contentView()->frame(), (Rect{0, 0, 800, 600}));
  EXPECT_TRUE(made->contentView()->subviews().empty());
}

TEST_F(WindowsTest, AHostsWindowIsOnTheScreen) {
  EXPECT_TRUE(driver.look(window).visible);
  EXPECT_TRUE(driver.look(window).key);
  EXPECT_EQ(driver.look(window).content, (Rect{100, 100, 640, 480}));
}

TEST_F(WindowsTest, OrderingFrontBringsToTheFrontAndMakesKey) {
  const Ref<Window> a = makeAppWindow();
  const Ref<Window> b = makeAppWindow();
  a->makeKeyAndOrderFront();
  b->makeKeyAndOrderFront();
  expectShown({window, a, b});
  window->makeKeyAndOrderFront();
  expectShown({a, b, window});
  window->makeKeyAndOrderFront();
  expectShown({a, b, window});
}

TEST_F(WindowsTest, TheNextInOrderBecomesKeyWhenTheKeyWindowGoes) {
  const Ref<Window> a = makeAppWindow();
  Ref<Window> b = driver.makeWindow({});
  a->makeKeyAndOrderFront();
  expectShown({window, b, a});
  a->orderOut();
  expectShown({window, b});
  b = nullptr;
  expectShown({window});
  window->orderOut();
  EXPECT_FALSE(driver.look(window).key);
  EXPECT_EQ(toolkit.application().screen()->keyWindow(), nullptr);
}

TEST_F(WindowsTest, TheKeyStaysWhenAnotherWindowGoes) {
  const Ref<Window> front = driver.makeWindow({});
  window->orderOut();
  expectShown({front});
  window->orderOut();
  expectShown({front});
}

TEST_F(WindowsTest, EveryCloseIsCounted) {
  window->close();
  EXPECT_EQ(driver.look(window).closes, 1);
  EXPECT_FALSE(driver.look(window).visible);
  window->close();
  EXPECT_EQ(driver.look(window).closes, 2);
  window->makeKeyAndOrderFront();
  EXPECT_TRUE(driver.look(window).visible);
  window->orderOut();
  EXPECT_EQ(driver.look(window).closes, 2);
}

TEST_F(WindowsTest, TheApplicationKeepsItsWindowsWhileTheyAreOnTheScreen) {
  const std::function<void(Window&)> ways[] = {[](Window& it) { it.close(); },
                                               [](Window& it) { it.orderOut(); }};
  for (const auto& goOff : ways) {
    std::weak_ptr<Window> watched;
    {
      const Ref<Window> made = makeAppWindow();
      watched = made.pointer();
      made->makeKeyAndOrderFront();
      made->makeKeyAndOrderFront();
    }
    ASSERT_FALSE(watched.expired());
    goOff(*watched.lock());
    EXPECT_TRUE(watched.expired());
  }
}

TEST_F(WindowsTest, AWindowMayEndInItsOwnClose) {
  Window* last = nullptr;
  {
    const Ref<Window> made = makeAppWindow();
    made->makeKeyAndOrderFront();
    last = made.pointer().get();
  }
  last->close();
  expectShown({window});
}

TEST_F(WindowsTest, AWindowOffTheScreenIsItsMakersAlone) {
  std::weak_ptr<Window> watched = makeAppWindow().pointer();
  EXPECT_TRUE(watched.expired());
}

TEST_F(WindowsTest, AHostsWindowEndsWithItsReference) {
  const std::weak_ptr<Window> watched = window.pointer();
  const std::weak_ptr<View> button = make(drivers::ViewKind::button).pointer();
  window = nullptr;
  EXPECT_TRUE(watched.expired());
  EXPECT_TRUE(button.expired());
  EXPECT_TRUE(toolkit.application().screen()->windows().empty());
}

TEST(WindowsOfAnEndedToolkit, CanStillBeUsed) {
  auto driver = std::make_unique<drivers::MemoryDriver>();
  const Ref<Window> hosts = driver->makeWindow({});
  const Ref<Window> made = driver->toolkit().application().makeWindow(
      {}, StyleMask::titled, BackingStore::buffered, false);
  made->makeKeyAndOrderFront();
  const Ref<View> button = driver->makeView(drivers::ViewKind::button, 1, {}, made->contentView());
  driver = nullptr;
  for (const Ref<Window>& window : {hosts, made}) {
    window->makeKeyAndOrderFront();
    EXPECT_FALSE(MemoryWindow::of(window)->isVisible());
    EXPECT_FALSE(MemoryWindow::of(window)->isKey());
    window->close();
    EXPECT_EQ(MemoryWindow::of(window)->closes(), 1);
  }
  button->setHidden(true);
  EXPECT_FALSE(button->needsDisplay());
}

TEST(WindowsOfAnEndedToolkit, AreReleased) {
  auto driver = std::make_unique<drivers::MemoryDriver>();
  std::weak_ptr<Window> watched;
  {
    const Ref<Window> made = driver->toolkit().application().makeWindow(
        {}, StyleMask::titled, BackingStore::buffered, false);
    made->makeKeyAndOrderFront();
    watched = made.pointer();
  }
  EXPECT_FALSE(watched.expired());
  driver = nullptr;
  EXPECT_TRUE(watched.expired());
}

}  // namespace
}  // namespace qz::toolkit::memory::test
