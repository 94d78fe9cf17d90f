// SPDX-License-Identifier: MIT
// Sheets: attached to a parent, blocking it, and ended with a message to their delegate.

#include <vector>

#include "tests/memory/support.hpp"
#include "toolkit/memory/window.hpp"

namespace qz::toolkit::memory::test {
namespace {

class SheetsTest : public MemoryTest {
 protected:
  Ref<Window> makeAppWindow() {
    return application.makeWindow({0, 0, 300, 200}, StyleMask::titled, BackingStore::buffered,
                                  true);
  }
  void begin() { application.beginSheet(sheet, window, delegate, &context); }
  /// True if a click on a button in `of` reaches its target.
  bool takesClicks(const Ref<Window>& of) {
    const auto target = std::make_shared<Recorder>();
    const Ref<Button> button = makeButton(target);
    of->contentView()->addSubview(button);
    driver.click(button);
    driver.removeFromSuperview(button);
    return !target->senders.empty();
  }

  int context = 0;
  Ref<Window> sheet = makeAppWindow();
  std::shared_ptr<SheetRecorder> delegate = std::make_shared<SheetRecorder>();
};

TEST_F(SheetsTest, ASheetIsShownInFrontOfItsParentAndIsKey) {
  begin();
  EXPECT_TRUE(driver.look(sheet).visible);
  EXPECT_TRUE(driver.look(sheet).key);
  EXPECT_EQ(driver.look(sheet).sheetOf, window);
  EXPECT_FALSE(driver.look(window).key);
  EXPECT_TRUE(driver.look(window).visible);
}

TEST_F(SheetsTest, ItBlocksItsParentUntilItIsOrderedOut) {
  EXPECT_TRUE(takesClicks(window));
  begin();
  EXPECT_FALSE(takesClicks(window));
  EXPECT_TRUE(takesClicks(sheet));
  application.endSheet(sheet, 0);
  EXPECT_FALSE(takesClicks(window));
  sheet->orderOut();
  EXPECT_TRUE(takesClicks(window));
  EXPECT_FALSE(driver.look(sheet).sheetOf);
  EXPECT_TRUE(driver.look(window).key);
}

TEST_F(SheetsTest, ItsParentBecomesKeyAfterItWhateverElseIsInFront) {
  begin();
  const Ref<Window> other = driver.makeWindow({});
  sheet->makeKeyAndOrderFront();
  sheet->close();
  EXPECT_TRUE(driver.look(window).key);
  EXPECT_FALSE(driver.look(other).key);
}

TEST_F(SheetsTest, ItsParentBringsItAlongToTheFront) {
  const Ref<Window> onSheet = makeAppWindow();
  begin();
  application.beginSheet(onSheet, sheet, nullptr, nullptr);
  const Ref<Window> other = driver.makeWindow({});
  window->makeKeyAndOrderFront();
  std::vector<Ref<Window>> shown;
  for (MemoryWindow* const each : toolkit.application().screen()->windows()) {
    shown.emplace_back(each->shared_from_this());
  }
  EXPECT_TRUE((shown == std::vector<Ref<Window>>{other, window, sheet, onSheet}));
  EXPECT_TRUE(driver.look(onSheet).key);
  EXPECT_FALSE(takesClicks(sheet));
}

TEST_F(SheetsTest, TwoSheetsBlockUntilBothAreGone) {
  const Ref<Window> second = makeAppWindow();
  begin();
  application.beginSheet(second, window, nullptr, nullptr);
  second->orderOut();
  EXPECT_FALSE(takesClicks(window));
  sheet->orderOut();
  EXPECT_TRUE(takesClicks(window));
}

TEST_F(SheetsTest, TheDelegateIsToldOnceABeginning) {
  begin();
  application.endSheet(sheet, 5);
  application.endSheet(sheet, 6);
  EXPECT_EQ(delegate->codes, std::vector<long>{5});
  EXPECT_EQ(delegate->sheets.front(), sheet);
  EXPECT_EQ(delegate->context, &context);
  EXPECT_TRUE(driver.look(sheet).visible);
  begin();
  application.endSheet(sheet, 7);
  EXPECT_EQ(delegate->codes, (std::vector<long>{5, 7}));
  EXPECT_EQ(driver.look(sheet).sheetEnds, (std::vector<long>{5, 6, 7}));
}

TEST_F(SheetsTest, AnEndIsRecordedOfAnyWindow) {
  application.endSheet(window, 3);
  application.endSheet(sheet, 4);
  EXPECT_EQ(driver.look(window).sheetEnds, std::vector<long>{3});
  EXPECT_EQ(driver.look(sheet).sheetEnds, std::vector<long>{4});
  EXPECT_TRUE(delegate->codes.empty());
}

TEST_F(SheetsTest, ASheetThatWasOrderedOutBeforeItsEndIsStillEnded) {
  begin();
  sheet->orderOut();
  EXPECT_TRUE(delegate->codes.empty());
  application.endSheet(sheet, 1);
  EXPECT_EQ(delegate->codes, std::vector<long>{1});
}

TEST_F(SheetsTest, BegunTwiceOnlyTheLatestDelegateIsTold) {
  const auto second = std::make_shared<SheetRecorder>();
  begin();
  application.beginSheet(sheet, window, second, nullptr);
  application.endSheet(sheet, 2);
  application.endSheet(sheet, 3);
  EXPECT_TRUE(delegate->codes.empty());
  EXPECT_EQ(second->codes, std::vector<long>{2});
}

TEST_F(SheetsTest, ADelegateIsNotKept) {
  begin();
  const std::weak_ptr<SheetRecorder> watched = delegate;
  delegate = nullptr;
  EXPECT_TRUE(watched.expired());
  application.endSheet(sheet, 1);
  EXPECT_EQ(driver.look(sheet).sheetEnds, std::vector<long>{1});
  EXPECT_TRUE(driver.look(sheet).visible);
}

TEST_F(SheetsTest, TheApplicationKeepsASheetWhileItIsOnTheScreen) {
  delegate->orderOut = true;
  begin();
  const std::weak_ptr<Window> watched = sheet.pointer();
  sheet = nullptr;
  ASSERT_FALSE(watched.expired());
  application.endSheet(watched.lock(), 1);
  EXPECT_EQ(delegate->codes, std::vector<long>{1});
  delegate->sheets.clear();
  EXPECT_TRUE(watched.expired());
}

TEST_F(SheetsTest, WithoutAParentItStandsOnItsOwn) {
  application.beginSheet(sheet, nullptr, delegate, nullptr);
  EXPECT_TRUE(driver.look(sheet).visible);
  EXPECT_FALSE(driver.look(sheet).sheetOf);
  EXPECT_TRUE(takesClicks(sheet));
  application.endSheet(sheet, 9);
  EXPECT_EQ(delegate->codes, std::vector<long>{9});
}

TEST_F(SheetsTest, NoWindowIsASheetOfItself) {
  begin();
  const struct { Ref<Window> sheet, parent; } cases[] = {{window, window}, {window, sheet}};
  for (const auto& c : cases) {
    application.beginSheet(c.sheet, c.parent, delegate, nullptr);
    EXPECT_FALSE(driver.look(c.sheet).sheetOf);
    EXPECT_TRUE(driver.look(c.sheet).visible);
  }
  sheet->orderOut();
  EXPECT_TRUE(takesClicks(window));
}

TEST_F(SheetsTest, AParentThatIsGoneIsNoParent) {
  begin();
  window = nullptr;
  EXPECT_FALSE(driver.look(sheet).sheetOf);
  EXPECT_TRUE(driver.look(sheet).key);
  application.endSheet(sheet, 1);
  sheet->orderOut();
  EXPECT_EQ(delegate->codes, std::vector<long>{1});
}

TEST_F(SheetsTest, AnAbsentSheetIsNothing) {
  application.beginSheet(nullptr, window, delegate, nullptr);
  application.endSheet(nullptr, 1);
  EXPECT_TRUE(delegate->codes.empty());
  EXPECT_TRUE(driver.look(window).key);
  EXPECT_TRUE(takesClicks(window));
}

}  // namespace
}  // namespace qz::toolkit::memory::test
