// SPDX-License-Identifier: MIT
// A walk-through that outlives its application. A program of its own, because the application of
// the other tests lasts. Exits with 0 if the form was as before when the application ended.
#include <QApplication>
#include <QMainWindow>
#include <QPushButton>
#include <memory>
#include <vector>

#include "qz/hosts/qt/walk_through.hpp"

namespace {

using qz::hosts::qt::WalkThrough;

const QByteArray tour = "{ 0 = ((SET_TITLE_FOR_OBJECT_ID, Begun, 1), (SET_TIMER_FOR_ID, 1, 1)); }";

int failures = 0;
// Never destroyed, and never forgotten: Qt cannot destroy forms without an application.
auto& forms = *new std::vector<QMainWindow*>;

void expect(bool holds, const char* what) {
  if (!holds) qWarning("expected %s", what);
  failures += !holds;
}

// Twice, because a program may have one application after another.
void play() {
  int argc = 1;
  char name[] = "outliving";
  char* argv[] = {name, nullptr};
  auto application = std::make_unique<QApplication>(argc, argv);
  auto walkThrough = std::make_unique<WalkThrough>();
  auto idle = std::make_unique<WalkThrough>();
  walkThrough->toolkit().log().setSink([](std::string_view) {});
  QMainWindow* const form = forms.emplace_back(new QMainWindow);
  auto* const button = new QPushButton("Host");
  button->setProperty("qzTag", 1);
  form->setCentralWidget(button);
  form->show();
  auto reason = WalkThrough::Reason::replaced;
  QObject::connect(walkThrough.get(), &WalkThrough::finished, [&](auto told) {
    reason = told;
    expect(button->text() == "Host", "the title of the host");
  });
  expect(walkThrough->play(tour, *form), "a walk-through");
  expect(button->text() == "Begun", "the title of the script");
  application.reset();
  expect(reason == WalkThrough::Reason::hostGone, "the end with the application");
  expect(!walkThrough->isRunning(), "no walk-through");
}

}  // namespace

int main() {
  if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM")) qputenv("QT_QPA_PLATFORM", "offscreen");
  play();
  play();
  return failures;
}
