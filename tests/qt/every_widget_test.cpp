// SPDX-License-Identifier: MIT
// An adopted window presents every tagged widget, and brings what a command changes into view.

#include <QDialog>
#include <QScrollBar>
#include <algorithm>
#include <vector>

#include "qz/toolkit/qt/adoption.hpp"
#include "tests/qt/crowded_form.hpp"
#include "tests/qt/support.hpp"

namespace qz {

namespace {

using toolkit::Tag;
using toolkit::qt::AdoptedWindow;
using Lines = std::vector<std::string>;

struct EveryWidget : testing::Test {
  toolkit::qt::QtToolkit toolkit;
  hosts::CrowdedForm form;
  Lines log;

  EveryWidget() {
    toolkit.log().setSink([this](std::string_view line) { log.emplace_back(line); });
    form.show();
    form.activateWindow();
    hosts::settle();
  }

  static std::vector<Tag> tagsIn(const AdoptedWindow& adopted) {
    std::vector<Tag> tags;
    for (const auto& view : adopted.window()->contentView()->subviews())
      tags.push_back(view->tag());
    return tags;
  }

  static toolkit::Ref<toolkit::View> find(const AdoptedWindow& adopted, Tag tag) {
    for (const auto& view : adopted.window()->contentView()->subviews()) {
      if (view->tag() == tag) return view;
    }
    ADD_FAILURE() << "no control has the tag " << tag;
    return {};
  }
};

TEST_F(EveryWidget, IsAControlAtAnyDepthIfItHasATag) {
  const AdoptedWindow adopted(toolkit, form);
  std::vector<Tag> tags = tagsIn(adopted);
  std::sort(tags.begin(), tags.end());
  EXPECT_EQ(tags, (std::vector<Tag>{1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12}));
  EXPECT_EQ(log, Lines{});
}

TEST_F(EveryWidget, ComesInTheOrderOfTheWidgetTree) {
  const AdoptedWindow adopted(toolkit, form);
  const std::vector<Tag> tags = tagsIn(adopted);
  const auto place = [&](Tag tag) { return std::find(tags.begin(), tags.end(), tag); };
  EXPECT_LT(place(2), place(9)) << "children of the box, as added";
  EXPECT_LT(place(9), place(10));
  EXPECT_LT(place(11), place(12)) << "the box before its sibling";
  EXPECT_LT(place(12), place(3)) << "the first page before the second";
  EXPECT_LT(place(4), place(5));
  form.tabs->setCurrentIndex(1);
  form.stack->setCurrentIndex(1);
  EXPECT_EQ(tagsIn(adopted), tags) << "whatever page is current";
}

TEST_F(EveryWidget, IsFoundAsSoonAsItExistsAndHasATag) {
  const AdoptedWindow adopted(toolkit, form);
  const std::size_t before = tagsIn(adopted).size();
  auto* const late = new QPushButton("Late", form.back);
  EXPECT_EQ(tagsIn(adopted).size(), before);
  late->setProperty("qzTag", 30);
  EXPECT_EQ(tagsIn(adopted).size(), before + 1);
  delete late;
  EXPECT_EQ(tagsIn(adopted).size(), before);
}

TEST_F(EveryWidget, InAFloatingDockIsAControlButInADialogIsNone) {
  QDialog dialog(&form);
  (new QPushButton("Dialog", &dialog))->setProperty("qzTag", 40);
  form.dock->setFloating(true);
  const AdoptedWindow adopted(toolkit, form);
  const std::vector<Tag> tags = tagsIn(adopted);
  EXPECT_EQ(std::count(tags.begin(), tags.end(), 8), 1);
  EXPECT_EQ(std::count(tags.begin(), tags.end(), 40), 0);
}

TEST_F(EveryWidget, MayHaveItsTagFromATableOfNames) {
  form.untagged.setObjectName("own");
  form.inBox.setObjectName("inBox");
  auto* const print = form.bar->addAction("Print");
  print->setObjectName("print");
  const AdoptedWindow adopted(toolkit, form, {.tags = {{"own", 50}, {"inBox", 51}, {"print", 52}}});
  const auto own = find(adopted, 50);
  EXPECT_EQ(own->asButton()->attributedTitle()->string(), "Own");
  EXPECT_EQ(find(adopted, 2)->asButton()->attributedTitle()->string(), "Box")
      << "the tag of its own counts more";
  EXPECT_TRUE(find(adopted, 52)->asButton());
  own->setTag(60);
  EXPECT_EQ(form.untagged.property("qzTag"), 60);
  own->setTag(50);
  EXPECT_FALSE(form.untagged.property("qzTag").isValid());
}

TEST_F(EveryWidget, IsAControlOnlyInTheContentItselfIfTheHostWantsThat) {
  const AdoptedWindow adopted(toolkit, form,
                              {.reading = toolkit::qt::Adoption::Reading::directSubviews});
  EXPECT_EQ(tagsIn(adopted), (std::vector<Tag>{0, 0})) << "the tabs' stack and bar";
  EXPECT_EQ(log.size(), 12U) << "every tag is out of reach";
}

TEST_F(EveryWidget, WithATagOutOfReachIsNamedOnceInTheLog) {
  auto* const open = form.menuBar()->addAction("Open");
  open->setObjectName("open");
  open->setProperty("qzTag", 70);
  const AdoptedWindow adopted(toolkit, form, {.tags = {{"missing", 71}}});
  tagsIn(adopted);
  tagsIn(adopted);
  EXPECT_EQ(log, (Lines{"No command can reach the tag 70 of the QAction \"open\": only widgets "
                        "inside the window, and actions in its menus and tool bars, are controls",
                        "No command can reach the tag 71: the window has no object with the name "
                        "\"missing\""}));
}

bool isInView(const QWidget& widget) { return !widget.visibleRegion().isEmpty(); }

TEST_F(EveryWidget, IsBroughtIntoViewByWhatIsShownInIt) {
  form.dock->close();
  form.splitter->setSizes({300, 0});
  const AdoptedWindow adopted(toolkit, form);
  for (const auto& [tag, widget] : {std::pair<Tag, QWidget*>{3, &form.inArea},
                                    {5, &form.onBack},
                                    {6, &form.inPane},
                                    {7, &form.inDrawer},
                                    {8, &form.inDock},
                                    {9, &form.check}}) {
    EXPECT_TRUE(tag == 9 || !isInView(*widget)) << tag;
    find(adopted, tag)->asButton()->setTitle("New");
    hosts::settle();
    EXPECT_TRUE(isInView(*widget)) << tag;
  }
}

TEST_F(EveryWidget, IsBroughtIntoViewWhenItIsShownOrFlashes) {
  const AdoptedWindow adopted(toolkit, form);
  const auto button = find(adopted, 5);
  button->setHidden(true);
  button->setEnabled(true);
  EXPECT_EQ(form.tabs->currentIndex(), 0);
  button->setHidden(false);
  EXPECT_EQ(form.tabs->currentIndex(), 1);
  EXPECT_EQ(form.stack->currentIndex(), 1);
  form.tabs->setCurrentIndex(0);
  button->highlight(true);
  EXPECT_EQ(form.tabs->currentIndex(), 1);
}

TEST_F(EveryWidget, DoesNotDragTheUserBackAtEachFlash) {
  const AdoptedWindow adopted(toolkit, form);
  const auto button = find(adopted, 5);
  button->highlight(true);
  form.tabs->setCurrentIndex(0);
  button->highlight(false);
  button->highlight(true);
  EXPECT_EQ(form.tabs->currentIndex(), 0);
}

TEST_F(EveryWidget, StaysWhereItIsIfTheHostWantsThat) {
  const AdoptedWindow adopted(toolkit, form, {.bringsIntoView = false});
  find(adopted, 5)->asButton()->setTitle("New");
  EXPECT_EQ(form.tabs->currentIndex(), 0);
}

TEST_F(EveryWidget, OfAWindowThatIsNoLongerAdoptedIsReadAsBefore) {
  toolkit::Ref<toolkit::Window> window;
  {
    const AdoptedWindow adopted(toolkit, form);
    window = adopted.window();
  }
  EXPECT_EQ(window->contentView()->subviews().size(), 2U) << "the tabs' stack and bar";
}

}  // namespace

}  // namespace qz
