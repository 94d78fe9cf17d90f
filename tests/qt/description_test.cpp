// SPDX-License-Identifier: MIT
// A running window, written as a file from which the tools make it again.

#include "hosts/qt/description.hpp"

#include <QCheckBox>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QMainWindow>
#include <QPushButton>
#include <QTabWidget>
#include <QTemporaryDir>
#include <QToolButton>
#include <QVBoxLayout>

#include "drivers/qt/qt_driver.hpp"
#include "qz/hosts/qt/walk_through.hpp"
#include "tests/qt/support.hpp"
#include "tools/walkthrough/host_window.hpp"

namespace qz {

namespace {

using drivers::ViewKind;
using hosts::qt::WalkThrough;
using tools::walkthrough::HostControl;
using tools::walkthrough::HostWindow;

/// A form with controls of every kind, in tabs and groups.
struct Descriptions : testing::Test {
  QTemporaryDir directory;
  QMainWindow form;
  WalkThrough walkThrough;

  Descriptions() {
    walkThrough.toolkit().log().setSink([](std::string_view) {});
    auto* const tabs = new QTabWidget;
    for (int page = 0; page < 2; ++page) tabs->addTab(new QWidget, "Page");
    for (int page = 0; page < 2; ++page) new QVBoxLayout(tabs->widget(page));
    auto* const group = add<QGroupBox>(*tabs->widget(0), 9);
    new QVBoxLayout(group);
    add<QPushButton>(*group, 1)->setText("Save && &Send");
    add<QCheckBox>(*group, 2)->setChecked(true);
    auto* const mixed = add<QCheckBox>(*group, 3);
    mixed->setTristate(true);
    mixed->setCheckState(Qt::PartiallyChecked);
    mixed->setToolTip("<b>Either</b> or");
    add<QLineEdit>(*tabs->widget(1), 4)->setText("Ada");
    add<QToolButton>(*tabs->widget(1), 5)->setEnabled(false);
    add<QLabel>(*tabs->widget(1), 6)->setProperty("qzImageView", true);
    add<QLabel>(*tabs->widget(1), 7)->hide();
    tabs->widget(1)->layout()->addWidget(new QLabel("without a tag"));
    form.setCentralWidget(tabs);
    form.setWindowTitle("Form");
    form.setGeometry(50, 60, 400, 300);
    form.show();
    tabs->setCurrentIndex(1);
    tabs->setCurrentIndex(0);
  }

  template <class W>
  W* add(QWidget& parent, int tag) {
    auto* const widget = new W(&parent);
    widget->setProperty("qzTag", tag);
    parent.layout()->addWidget(widget);
    return widget;
  }

  HostWindow read(const QByteArray& description) const {
    QFile file(directory.filePath("host.plist"));
    EXPECT_TRUE(file.open(QIODevice::WriteOnly));
    file.write(description);
    file.close();
    return tools::walkthrough::parseHostWindow(
        tools::InputFile(file.fileName().toStdString(), "a window"));
  }
};

const HostControl& withTag(const HostWindow& window, int tag) {
  const auto found = std::find_if(window.controls.begin(), window.controls.end(),
                                  [&](const HostControl& control) { return control.tag == tag; });
  EXPECT_NE(found, window.controls.end()) << tag;
  return *found;
}

TEST_F(Descriptions, HoldEveryControlOfTheWalkThrough) {
  const HostWindow window = read(walkThrough.describe(form));
  EXPECT_EQ(window.title, "Form");
  EXPECT_EQ(window.content.width, 400);
  EXPECT_EQ(window.content.height, 300);
  ASSERT_EQ(window.controls.size(), 8U);
  const struct {
    int tag;
    ViewKind kind;
    const char* caption;  // null: none
    toolkit::State state = toolkit::State::off;
  } cases[] = {
      {9, ViewKind::box, nullptr},
      {1, ViewKind::button, "Save & Send"},
      {2, ViewKind::toggle, "", toolkit::State::on},
      {3, ViewKind::mixed, "", toolkit::State::mixed},
      {4, ViewKind::textField, "Ada"},
      {5, ViewKind::popUpButton, ""},
      {6, ViewKind::imageView, nullptr},
      {7, ViewKind::textField, ""},
  };
  for (const auto& c : cases) {
    const HostControl& control = withTag(window, c.tag);
    EXPECT_EQ(control.kind, c.kind) << c.tag;
    EXPECT_EQ(control.caption, c.caption ? std::optional<std::string>(c.caption) : std::nullopt)
        << c.tag;
    EXPECT_EQ(control.state, c.state) << c.tag;
    EXPECT_EQ(control.enabled, c.tag != 5) << c.tag;
    EXPECT_EQ(control.hidden, c.tag == 7) << c.tag;
    EXPECT_EQ(control.toolTip, c.tag == 3 ? "Either or" : "") << c.tag;
    EXPECT_TRUE(c.tag == 7 || control.frame.width > 0) << c.tag;
  }
  const auto* const button = form.findChild<QPushButton*>();
  const QPoint corner = button->mapTo(form.centralWidget(), QPoint());
  const auto& frame = withTag(window, 1).frame;
  EXPECT_EQ(frame.x, corner.x());
  EXPECT_EQ(frame.y, 300 - corner.y() - button->height());
}

TEST_F(Descriptions, AreOfTheWindowThatIsMadeOfThemToo) {
  walkThrough.setResources(":/guided");
  ASSERT_TRUE(walkThrough.play(
      QByteArray("{ 0 = ((LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID, parcel, 6)); }"), form));
  const QByteArray description = walkThrough.describe(form);
  EXPECT_TRUE(walkThrough.isRunning()) << "a description changes nothing";
  EXPECT_TRUE(walkThrough.engine()->findObjectWithTag(4));
  const HostWindow window = read(description);
  EXPECT_EQ(withTag(window, 6).caption, "parcel");
  drivers::QtDriver driver;
  driver.setLogSink([](std::string_view) {});
  driver.setResourcePath(":/guided");
  const auto made = makeHostWindow(driver, window, "host.plist");
  EXPECT_EQ(hosts::qt::descriptionOf(made).toStdString(), description.toStdString());
}

TEST_F(Descriptions, TakeTagsFromTheAdoption) {
  form.findChild<QGroupBox*>()->setObjectName("group");
  form.findChild<QGroupBox*>()->setProperty("qzTag", QVariant());
  walkThrough.setAdoption({.tags = {{"group", 77}}});
  EXPECT_EQ(withTag(read(walkThrough.describe(form)), 77).kind, ViewKind::box);
}

}  // namespace

}  // namespace qz
