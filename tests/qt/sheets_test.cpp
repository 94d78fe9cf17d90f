// SPDX-License-Identifier: MIT
// Sheets: what they block, how users end them, and what they leave behind.

#include <QPushButton>
#include <QWindow>

#include "tests/qt/support.hpp"

namespace qz {

namespace {

struct Ends : toolkit::SheetDelegate {
  std::vector<long> codes;
  void sheetDidEnd(const toolkit::Ref<toolkit::Window>& sheet, long code, void*) override {
    codes.push_back(code);
    sheet->orderOut();
  }
};

struct Sheets : hosts::Host {
  QWidget sheetWidget;
  toolkit::Ref<toolkit::Window> sheet = toolkit.application().window(sheetWidget);
  std::shared_ptr<Ends> ends = std::make_shared<Ends>();

  void begin() {
    sheetWidget.setGeometry(0, 0, 200, 100);
    show();
    toolkit.application().beginSheet(sheet, window, ends, nullptr);
    ASSERT_TRUE(QTest::qWaitForWindowActive(&sheetWidget));
  }
};

// Clicks through the native window, where Qt decides whether input arrives.
void clickInWindow(QWidget& widget) {
  QTest::mouseClick(widget.window()->windowHandle(), Qt::LeftButton, {},
                    widget.mapTo(widget.window(), widget.rect().center()));
}

TEST_F(Sheets, BlockTheirParentUntilTheyAreOrderedOut) {
  auto& next = add<QPushButton>("Next");
  const auto button = adopt(next);
  begin();
  EXPECT_EQ(sheetWidget.windowModality(), Qt::WindowModal);
  EXPECT_EQ(sheetWidget.pos().y(), panel->mapToGlobal(QPoint()).y());
  clickInWindow(next);
  EXPECT_EQ(performer->actions.size(), 0U);
  toolkit.application().endSheet(sheet, 7);
  EXPECT_EQ(ends->codes, std::vector<long>{7});
  EXPECT_FALSE(sheetWidget.isVisible());
  hosts::settle();
  clickInWindow(next);
  EXPECT_EQ(performer->actions.size(), 1U);
}

TEST_F(Sheets, HangAtTheTopEdgeOfTheirParentWhereverItGoes) {
  begin();
  const auto expectHanging = [this] {
    hosts::settle();
    const QPoint top = panel->mapToGlobal(QPoint((panel->width() - sheetWidget.width()) / 2, 0));
    EXPECT_EQ(sheetWidget.pos(), top);
  };
  expectHanging();
  panel->move(30, 60);
  expectHanging();
  panel->resize(500, 200);
  expectHanging();
  sheetWidget.resize(120, 90);
  expectHanging();
}

TEST_F(Sheets, LeaveTheirWindowAsItWas) {
  sheetWidget.move(30, 40);
  begin();
  toolkit.application().endSheet(sheet, 0);
  EXPECT_EQ(sheetWidget.windowModality(), Qt::NonModal);
  EXPECT_EQ(sheetWidget.windowHandle()->transientParent(), nullptr);
  EXPECT_EQ(sheetWidget.size(), QSize(200, 100));
}

TEST_F(Sheets, EndOnceWithTheCodeOfCancellingWhenTheUserSendsThemAway) {
  struct Case {
    const char* what;
    std::function<void()> sendAway;
  };
  const Case cases[] = {
      {"Escape", [this] { QTest::keyClick(&sheetWidget, Qt::Key_Escape); }},
      {"close button", [this] { sheetWidget.windowHandle()->close(); }},
  };
  for (const Case& test : cases) {
    SCOPED_TRACE(test.what);
    ends->codes.clear();
    begin();
    test.sendAway();
    hosts::settle();
    EXPECT_EQ(ends->codes, std::vector<long>{0});
    EXPECT_FALSE(sheetWidget.isVisible());
    EXPECT_TRUE(panel->isVisible());
    toolkit.application().endSheet(sheet, 0);
    EXPECT_EQ(ends->codes.size(), 1U);
  }
}

}  // namespace

}  // namespace qz
