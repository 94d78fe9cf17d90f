// SPDX-License-Identifier: MIT
// An application as people have them: tabs, group boxes, a tool bar, a menu, and a lambda on each
// button and action.
#pragma once

#include <QCheckBox>
#include <QGroupBox>
#include <QLineEdit>
#include <QMainWindow>
#include <QMenuBar>
#include <QPushButton>
#include <QTabWidget>
#include <QToolBar>
#include <QVBoxLayout>
#include <map>
#include <string>

struct PlainApplication : QMainWindow {
  std::map<std::string, int> reactions;  // of the lambdas, by the names of buttons and actions
  QAction* help = menuBar()->addMenu("&Help")->addAction("&Show me around");
  QToolBar* bar = addToolBar("File");
  QTabWidget* tabs = new QTabWidget;

  PlainApplication() {
    addAction("open");
    addAction("print");
    auto* const texts = addPage("Text");
    auto* const name = new QLineEdit(texts);
    name->setObjectName("name");
    texts->layout()->addWidget(name);
    addButton(texts, new QPushButton("&Save"), "save");
    addButton(texts, new QPushButton("Save &as"), "saveAs");
    auto* const looks = addPage("Look");
    addButton(looks, new QCheckBox("&Bold"), "bold");
    addButton(looks, new QPushButton("&Apply"), "apply");
    setCentralWidget(tabs);
  }

 private:
  void addAction(const char* name) {
    QAction* const action = bar->addAction(name);
    action->setObjectName(name);
    connect(action, &QAction::triggered, this, [this, name] { ++reactions[name]; });
  }

  QWidget* addPage(const char* title) {
    auto* const page = new QWidget;
    auto* const box = new QGroupBox(title, page);
    (new QVBoxLayout(page))->addWidget(box);
    new QVBoxLayout(box);
    tabs->addTab(page, title);
    return box;
  }

  void addButton(QWidget* box, QAbstractButton* button, const char* name) {
    button->setObjectName(name);
    box->layout()->addWidget(button);
    connect(button, &QAbstractButton::clicked, this, [this, name] { ++reactions[name]; });
  }
};
