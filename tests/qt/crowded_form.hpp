// SPDX-License-Identifier: MIT
// A form with a control in each kind of place, for tests of adoption.
#pragma once

#include <QAction>
#include <QCheckBox>
#include <QDockWidget>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QMainWindow>
#include <QMenuBar>
#include <QPushButton>
#include <QScrollArea>
#include <QSplitter>
#include <QStackedWidget>
#include <QTabWidget>
#include <QTextEdit>
#include <QToolBar>
#include <QToolBox>
#include <QVBoxLayout>

namespace qz::hosts {

/// The tags are 1 to 9 for the buttons, in the order of the widget tree as built, and 10 upwards
/// for other controls. The button of the tool bar has its tag from its action.
struct CrowdedForm : QMainWindow {
  QToolBar* bar = addToolBar("Bar");
  QAction* save = bar->addAction("Save");
  QTabWidget* tabs = new QTabWidget;
  QWidget* first = new QWidget;
  QWidget* second = new QWidget;
  QGroupBox* box = new QGroupBox("Box");
  QScrollArea* area = new QScrollArea;
  QWidget* sheet = new QWidget;  // scrolled by `area`
  QStackedWidget* stack = new QStackedWidget;
  QWidget* front = new QWidget;
  QWidget* back = new QWidget;
  QSplitter* splitter = new QSplitter;
  QToolBox* drawers = new QToolBox;
  QWidget* drawer = new QWidget;
  QDockWidget* dock = new QDockWidget("Dock");
  QPushButton& inBox = *new QPushButton("&Box");
  QPushButton& inArea = *new QPushButton("&Area");
  QPushButton& onFront = *new QPushButton("&Front");
  QPushButton& onBack = *new QPushButton("Bac&k");
  QPushButton& inPane = *new QPushButton("&Pane");
  QPushButton& inDrawer = *new QPushButton("D&rawer");
  QPushButton& inDock = *new QPushButton("&Dock");
  QPushButton& untagged = *new QPushButton("&Own");
  QCheckBox& check = *new QCheckBox("&Check");
  QLabel& label = *new QLabel("Label");
  QLineEdit& line = *new QLineEdit("line");
  QTextEdit& edit = *new QTextEdit("edit");

  CrowdedForm() {
    buildPages();
    buildSecondPage();
    dock->setWidget(&inDock);
    addDockWidget(Qt::RightDockWidgetArea, dock);
    setCentralWidget(tabs);
    resize(700, 500);
    const std::pair<QObject*, int> tags[] = {
        {save, 1},      {&inBox, 2},  {&inArea, 3}, {&onFront, 4}, {&onBack, 5}, {&inPane, 6},
        {&inDrawer, 7}, {&inDock, 8}, {&check, 9},  {&label, 10},  {&line, 11},  {&edit, 12}};
    for (const auto& [object, tag] : tags) object->setProperty("qzTag", tag);
  }

  QAbstractButton& saveButton() const {
    return *qobject_cast<QAbstractButton*>(bar->widgetForAction(save));
  }

 private:
  void buildPages() {
    auto* const column = new QVBoxLayout(first);
    auto* const inside = new QVBoxLayout(box);
    for (QWidget* const widget : {static_cast<QWidget*>(&inBox), static_cast<QWidget*>(&check),
                                  static_cast<QWidget*>(&label), static_cast<QWidget*>(&line)}) {
      inside->addWidget(widget);
    }
    column->addWidget(box);
    column->addWidget(&edit);
    column->addWidget(&untagged);
    tabs->addTab(first, "First");
  }

  void buildSecondPage() {
    auto* const column = new QVBoxLayout(second);
    sheet->setFixedSize(300, 2000);
    inArea.setParent(sheet);
    inArea.setGeometry(10, 1900, 120, 30);
    area->setWidget(sheet);
    (new QVBoxLayout(front))->addWidget(&onFront);
    (new QVBoxLayout(back))->addWidget(&onBack);
    stack->addWidget(front);
    stack->addWidget(back);
    splitter->addWidget(new QLabel("wide"));
    splitter->addWidget(&inPane);
    (new QVBoxLayout(drawer))->addWidget(&inDrawer);
    drawers->addItem(new QWidget, "One");
    drawers->addItem(drawer, "Two");
    for (QWidget* const widget :
         {static_cast<QWidget*>(area), static_cast<QWidget*>(stack),
          static_cast<QWidget*>(splitter), static_cast<QWidget*>(drawers)}) {
      column->addWidget(widget);
    }
    tabs->addTab(second, "Second");
  }
};

}  // namespace qz::hosts
