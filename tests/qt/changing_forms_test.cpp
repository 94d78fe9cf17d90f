// SPDX-License-Identifier: MIT
// An adopted window keeps the list of its controls between searches. Whatever changes, the list is
// that of a new walk through the form.

#include <QDialog>
#include <QMenu>
#include <QRandomGenerator>
#include <algorithm>
#include <functional>
#include <memory>
#include <vector>

#include "qz/toolkit/qt/adoption.hpp"
#include "tests/qt/crowded_form.hpp"
#include "tests/qt/support.hpp"
#include "toolkit/qt/action_view.hpp"
#include "toolkit/qt/adopted_form.hpp"
#include "toolkit/qt/widget_node.hpp"

namespace qz {

namespace {

using toolkit::qt::AdoptedForm;
using toolkit::qt::AdoptedWindow;
using toolkit::qt::Listing;
using Objects = std::vector<QObject*>;

struct ChangingForms : testing::Test {
  QRandomGenerator random{14};
  toolkit::qt::QtToolkit toolkit;
  std::unique_ptr<hosts::CrowdedForm> form = std::make_unique<hosts::CrowdedForm>();
  std::unique_ptr<AdoptedWindow> adopted;

  ChangingForms() {
    toolkit.log().setSink([](std::string_view) {});
    form->show();
    hosts::settle();
    adopted = std::make_unique<AdoptedWindow>(toolkit, *form);
  }

  Objects presented() const {
    Objects objects;
    for (const auto& view : adopted->window()->contentView()->subviews()) {
      const auto action = toolkit::qt::QtAction::of(view);
      objects.push_back(action ? static_cast<QObject*>(action->action())
                               : toolkit::qt::WidgetNode::of(view)->widget());
    }
    return objects;
  }

  Objects walked() const {
    Listing found;
    AdoptedForm(*form, {}).list(found);
    return found.controls;
  }

  bool presents(const QObject& object) const {
    const Objects objects = presented();
    return std::find(objects.begin(), objects.end(), &object) != objects.end();
  }

  void expectFresh(const std::string& what) const { EXPECT_EQ(presented(), walked()) << what; }

  int below(qsizetype end) { return static_cast<int>(random.bounded(end)); }

  template <class W>
  W* any() {
    const auto all = form->findChildren<W*>();
    return all.isEmpty() ? nullptr : all[below(all.size())];
  }
};

TEST_F(ChangingForms, ShowAChildThatIsNew) {
  ASSERT_FALSE(presented().empty());
  auto* const late = new QPushButton("Late", form->back);
  EXPECT_FALSE(presents(*late));
  late->setProperty("qzTag", 30);
  EXPECT_TRUE(presents(*late));
  auto* const box = new QGroupBox;
  (new QLabel(box))->setProperty("qzTag", 31);
  const std::size_t before = presented().size();
  box->setParent(form->first);
  EXPECT_EQ(presented().size(), before + 1);
}

TEST_F(ChangingForms, DropAChildThatIsDeleted) {
  ASSERT_TRUE(presents(form->inBox));
  const std::size_t before = presented().size();
  delete &form->inBox;
  EXPECT_EQ(presented().size(), before - 1);
  delete form->stack;
  EXPECT_EQ(presented().size(), before - 3);
}

TEST_F(ChangingForms, DropAChildThatGoesElsewhereUntilItIsBack) {
  QWidget elsewhere;
  form->inBox.setParent(&elsewhere);
  EXPECT_FALSE(presents(form->inBox));
  form->inBox.setParent(form->back);
  EXPECT_TRUE(presents(form->inBox));
}

TEST_F(ChangingForms, DropAChildThatLosesItsTag) {
  ASSERT_TRUE(presents(form->inBox));
  form->inBox.setProperty("qzTag", QVariant());
  EXPECT_FALSE(presents(form->inBox));
}

TEST_F(ChangingForms, DropAChildThatBecomesAWindow) {
  for (QWidget* const widget : {static_cast<QWidget*>(form->box), form->drawer}) {
    auto& control = widget == form->box ? form->inBox : form->inDrawer;
    widget->setWindowFlag(Qt::Window);
    EXPECT_FALSE(presents(control));
    widget->setWindowFlags(Qt::Widget);
    EXPECT_TRUE(presents(control));
  }
}

TEST_F(ChangingForms, ShowTheActionsThatMenusHave) {
  QMenu* const menu = form->menuBar()->addMenu("&File");
  QAction* const open = menu->addAction("Open");
  EXPECT_FALSE(presents(*open));
  open->setProperty("qzTag", 40);
  EXPECT_TRUE(presents(*open));
  QMenu below;
  open->setMenu(&below);
  EXPECT_FALSE(presents(*open));
  open->setMenu(nullptr);
  EXPECT_TRUE(presents(*open));
  menu->removeAction(open);
  EXPECT_FALSE(presents(*open));
}

TEST_F(ChangingForms, ShowAnActionAsTheButtonOfItsToolBar) {
  ASSERT_TRUE(presents(form->saveButton()));
  const std::size_t before = presented().size();
  form->bar->removeAction(form->save);
  EXPECT_EQ(presented().size(), before - 1);
  form->bar->addAction(form->save);
  EXPECT_TRUE(presents(form->saveButton()));
}

TEST_F(ChangingForms, ShowWhatAPanelHoldsWhileItIsOne) {
  QDialog palette(form.get());
  auto* const color = new QPushButton(&palette);
  color->setProperty("qzTag", 50);
  EXPECT_FALSE(presents(*color));
  palette.setProperty("qzPanel", true);
  EXPECT_TRUE(presents(*color));
  palette.setProperty("qzPanel", false);
  EXPECT_FALSE(presents(*color));
}

TEST_F(ChangingForms, KeepTheOrderOfPages) {
  expectFresh("at first");
  form->stack->removeWidget(form->front);
  expectFresh("a page is taken out");
  form->stack->addWidget(form->front);
  expectFresh("a page is put behind the others");
  form->tabs->tabBar()->moveTab(0, 1);
  expectFresh("a tab is moved");
  form->stack->setCurrentWidget(form->front);
  expectFresh("another page is current");
  form->box->raise();
  expectFresh("a widget is raised");
}

TEST_F(ChangingForms, FollowNamesIfTagsGoByNames) {
  adopted.reset();
  adopted = std::make_unique<AdoptedWindow>(toolkit, *form,
                                            toolkit::qt::Adoption{.tags = {{QString("own"), 60}}});
  EXPECT_FALSE(presents(form->untagged));
  form->untagged.setObjectName("own");
  EXPECT_TRUE(presents(form->untagged));
  form->untagged.setObjectName("other");
  EXPECT_FALSE(presents(form->untagged));
}

// A host may look for a control while Qt deletes what holds it.
TEST_F(ChangingForms, HoldWhileAWidgetIsDeleted) {
  std::size_t least = presented().size();
  for (QObject* const object :
       {static_cast<QObject*>(&form->inBox), static_cast<QObject*>(&form->line)}) {
    QObject::connect(object, &QObject::destroyed,
                     [&] { least = std::min(least, presented().size()); });
  }
  const std::size_t before = presented().size();
  delete form->box;
  EXPECT_LT(least, before);
  expectFresh("afterwards");
}

// What `random` does to a form.
struct RandomChange {
  const char* name;
  std::function<void(ChangingForms&)> make;
};

const RandomChange randomChanges[] = {
    {"tag", [](ChangingForms& test) { test.any<QWidget>()->setProperty("qzTag", 70); }},
    {"no tag", [](ChangingForms& test) { test.any<QWidget>()->setProperty("qzTag", QVariant()); }},
    {"new child",
     [](ChangingForms& test) { (new QLabel(test.any<QWidget>()))->setProperty("qzTag", 71); }},
    {"deleted", [](ChangingForms& test) { delete test.any<QLabel>(); }},
    {"moved into another",
     [](ChangingForms& test) {
       QWidget* const around = test.any<QGroupBox>();
       auto* const widget = test.any<QPushButton>();
       if (around && widget && !widget->isWindow()) widget->setParent(around);
     }},
    {"box moved into a page",
     [](ChangingForms& test) {
       auto* const box = test.any<QGroupBox>();
       if (box && !box->isWindow() && !box->isAncestorOf(test.form->second)) {
         box->setParent(test.below(2) ? test.form->first : test.form->second);
       }
     }},
    {"a window, or none",
     [](ChangingForms& test) {
       auto* const widget = test.any<QPushButton>();
       if (widget) widget->setWindowFlag(Qt::Window, !widget->isWindow());
     }},
    {"raised", [](ChangingForms& test) { test.any<QWidget>()->raise(); }},
    {"lowered", [](ChangingForms& test) { test.any<QWidget>()->lower(); }},
    {"page taken out",
     [](ChangingForms& test) {
       QStackedWidget* const stack = test.form->stack;
       if (stack->count() > 0) stack->removeWidget(stack->widget(0));
     }},
    {"page put in",
     [](ChangingForms& test) {
       QStackedWidget* const stack = test.form->stack;
       stack->insertWidget(test.below(3), new QPushButton("Page"));
     }},
    {"other page",
     [](ChangingForms& test) {
       QStackedWidget* const stack = test.form->stack;
       if (stack->count() > 0) stack->setCurrentIndex(test.below(3));
     }},
    {"other tab", [](ChangingForms& test) { test.form->tabs->setCurrentIndex(test.below(2)); }},
    {"action in a menu",
     [](ChangingForms& test) {
       QMenu* const menu = test.form->menuBar()->addMenu("Menu");
       menu->addAction("Action")->setProperty("qzTag", 72);
     }},
    {"action in the bar",
     [](ChangingForms& test) {
       auto* const menu = test.any<QMenu>();
       if (menu && !menu->isEmpty()) test.form->bar->addAction(menu->actions()[0]);
     }},
    {"action deleted",
     [](ChangingForms& test) {
       auto* const menu = test.any<QMenu>();
       if (menu && !menu->isEmpty()) delete menu->actions()[0];
     }},
    {"panel, or none",
     [](ChangingForms& test) {
       auto* const box = test.any<QGroupBox>();
       if (box) box->setProperty("qzPanel", !box->property("qzPanel").toBool());
     }},
    {"box, or a box in a window",
     [](ChangingForms& test) {
       auto* const box = new QGroupBox(test.any<QWidget>());
       box->setWindowFlag(Qt::Window, test.below(2) == 0);
       (new QLabel(box))->setProperty("qzTag", 73);
     }},
};

TEST_F(ChangingForms, AreReadAfterEachRandomChange) {
  for (int change = 0; change < 2000; ++change) {
    const auto& [name, make] = randomChanges[below(std::size(randomChanges))];
    make(*this);
    if (below(3)) expectFresh(std::to_string(change) + ": " + name);
    if (testing::Test::HasFailure()) return;
  }
}

}  // namespace

}  // namespace qz
