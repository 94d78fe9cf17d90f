// SPDX-License-Identifier: MIT
// Tries every form in a folder:  foreign-forms FOLDER [PART-OF-PATH]
//
// Prints what was tried and what was found wrong. The status is 0 if nothing was, and if the forms
// are as many and as different as they should be.

#include <QApplication>
#include <QDirIterator>
#include <clocale>
#include <cstdio>

#include "tests/foreign_forms/form_trial.hpp"

namespace qz::foreign_forms {

namespace {

QStringList formsIn(const QString& folder, const QString& part) {
  QStringList forms;
  QDirIterator files(folder, {"*.ui"}, QDir::Files, QDirIterator::Subdirectories);
  while (files.hasNext()) {
    const QString path = files.next();
    if (path.contains(part)) forms.push_back(path);
  }
  forms.sort();
  return forms;
}

struct Totals {
  std::size_t forms = 0;
  std::size_t failed = 0;
  Findings all;

  void add(const QString& path, const Findings& one);
  void print() const;
  bool isTooLittle() const;
};

void Totals::add(const QString& path, const Findings& one) {
  ++forms;
  all.widgets += one.widgets;
  all.buttons += one.buttons;
  all.objects += one.objects;
  all.values += one.values;
  all.connections += one.connections;
  for (const auto& [name, count] : one.classes) all.classes[name] += count;
  all.unreached.insert(all.unreached.end(), one.unreached.begin(), one.unreached.end());
  if (one.mistakes.empty()) return;
  ++failed;
  std::printf("%s\n", qPrintable(path));
  for (const std::string& mistake : one.mistakes) std::printf("  %s\n", mistake.c_str());
}

// The containers that Qt's form editor offers, apart from wizards and MDI areas, of which the forms
// have none.
constexpr const char* containers[] = {"QDockWidget", "QFrame",    "QGroupBox",  "QMenu",
                                      "QScrollArea", "QSplitter", "QTabWidget", "QStackedWidget",
                                      "QStatusBar",  "QToolBar"};

// Prints what is too little of a test, and returns whether anything is.
bool Totals::isTooLittle() const {
  bool tooLittle = false;
  const auto complain = [&](const std::string& what) {
    std::printf("%s\n", what.c_str());
    tooLittle = true;
  };
  if (forms < 100) complain("fewer than 100 forms");
  if (50 * all.unreached.size() > all.widgets) complain("more than 2% of the widgets not reached");
  for (const char* const name : containers) {
    if (!all.classes.contains(name)) complain("no " + std::string(name) + " in any form");
  }
  return tooLittle;
}

void Totals::print() const {
  for (const auto& [name, count] : all.classes) std::printf("%6d  %s\n", count, name.c_str());
  for (const std::string& reason : all.unreached) std::printf("%s\n", reason.c_str());
  std::printf(
      "%zu forms with %zu widgets, %zu buttons and %zu objects; %zu values compared, and %zu "
      "connections; %zu widgets not reached or pressed; %zu forms failed\n",
      forms, all.widgets, all.buttons, all.objects, all.values, all.connections,
      all.unreached.size(), failed);
}

}  // namespace

}  // namespace qz::foreign_forms

int main(int argc, char** argv) {
  using namespace qz::foreign_forms;
  if (argc < 2) {
    std::fprintf(stderr, "usage: foreign-forms FOLDER [PART-OF-PATH]\n");
    return 2;
  }
  if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM")) qputenv("QT_QPA_PLATFORM", "offscreen");
  const QApplication application(argc, argv);
  QApplication::setQuitOnLastWindowClosed(false);
  std::setlocale(LC_ALL, "C");  // Qt sets the user's locale
  Totals totals;
  for (const QString& path : formsIn(argv[1], argc > 2 ? argv[2] : "")) {
    totals.add(path, tryForm(path));
  }
  totals.print();
  const bool isPart = argc > 2;
  return totals.failed > 0 || (!isPart && totals.isTooLittle()) ? 1 : 0;
}
