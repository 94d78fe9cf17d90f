// SPDX-License-Identifier: MIT
// What an application needs for a tour, and what the tour does to its connections.

#include <QTemporaryDir>
#include <fstream>

#include "tests/qt/guided_application.hpp"
#include "tests/qt/snapshots.hpp"
#include "tests/qt/support.hpp"

namespace qz {

namespace {

using Reactions = std::map<std::string, int>;

constexpr auto tenLinesTour = R"({
  1 = ((SET_TEXT_FOR_OBJECT_ID, "Now press Bold", 2), (SET_STATE_ON_FOR_OBJECT_ID, 3));
  3 = ((SET_TITLE_FOR_OBJECT_ID, "Press me", 4));
  4 = ((SET_TITLE_FOR_OBJECT_ID, "And me", 5));
  5 = (TERMINATE_PARSER);
})";

// Returns how many receivers each signal of each object has.
hosts::Snapshot receiversIn(QWidget& window) {
  hosts::Snapshot receivers;
  for (const auto& [name, value] : hosts::pictureOfAll(window)) {
    if (name.endsWith(')')) receivers[name] = value;
  }
  return receivers;
}

struct TenLines : testing::Test {
  QTemporaryDir directory;
  GuidedApplication application{directory.path().toStdString()};
  const std::vector<std::string> names = {"save", "saveAs", "bold", "apply", "open", "print"};

  TenLines() {
    std::ofstream(directory.filePath("tour.plist").toStdString()) << tenLinesTour;
    application.toolkit.log().setSink([](std::string_view) {});
    application.show();
    hosts::settle();
  }

  QAbstractButton& button(const std::string& name) {
    for (QAction* const action : application.bar->actions()) {
      if (action->objectName() == name.c_str()) {
        return static_cast<QAbstractButton&>(*application.bar->widgetForAction(action));
      }
    }
    return *application.findChild<QAbstractButton*>(name.c_str());
  }

  // Presses each button once, and returns what the lambdas have counted.
  Reactions pressAll() {
    application.reactions.clear();
    for (const std::string& name : names) button(name).click();
    return application.reactions;
  }
};

TEST_F(TenLines, AreAllThatAnApplicationNeeds) {
  std::ifstream file(QZ_SOURCE_DIR "/tests/qt/guided_application.hpp");
  int lines = 0;
  for (std::string line; std::getline(file, line);) {
    const bool isCode = !line.empty() && line[0] != '/' && !line.starts_with("#pragma");
    const bool isOfTour = isCode && line.find("plain_application") == std::string::npos;
    lines += isOfTour;
  }
  EXPECT_EQ(lines, 10);
}

TEST_F(TenLines, LeaveEveryConnectionAsItWasBeforeDuringAndAfterTheTour) {
  const Reactions heard = {{"save", 1},  {"saveAs", 1}, {"bold", 1},
                           {"apply", 1}, {"open", 1},   {"print", 1}};
  EXPECT_EQ(pressAll(), heard);
  const auto before = receiversIn(application);
  application.help->trigger();
  ASSERT_TRUE(application.tour.engine());
  EXPECT_EQ(application.findChild<QLineEdit*>("name")->text(), "Now press Bold");
  auto during = receiversIn(application);
  for (const auto& [name, count] : before) {
    if (!name.contains("clicked") && !name.contains("toggled")) continue;
    EXPECT_GE(during[name].toInt(), count.toInt()) << name.toStdString() << ": some may be added";
  }
  EXPECT_EQ(pressAll(), (Reactions{{"saveAs", 1}, {"print", 1}})) << "those without a tag";
  hosts::settle();
  ASSERT_FALSE(application.tour.engine());
  EXPECT_EQ(hosts::differences(before, receiversIn(application)), std::set<QString>());
  EXPECT_EQ(pressAll(), heard);
}

}  // namespace

}  // namespace qz
