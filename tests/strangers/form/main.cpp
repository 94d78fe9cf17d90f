// SPDX-License-Identifier: MIT
// Plays DIRECTORY/script.plist over a Designer form, presses its button twice, and prints what the
// form says.
#include <QApplication>
#include <iostream>

#include "qz/hosts/qt/walk_through.hpp"
#include "ui_form.h"

int main(int argc, char** argv) {
  const QApplication application(argc, argv);
  qz::toolkit::qt::QtToolkit toolkit;
  toolkit.files().setResourcePath(argv[1]);
  qz::hosts::qt::WalkThrough walkThrough(toolkit);

  QWidget window;
  Ui::Form form;
  form.setupUi(&window);
  window.show();
  if (!walkThrough.play("script.plist", window)) return 1;
  form.next->click();
  std::cout << form.text->text().toStdString() << '\n';
  std::cout << "last list: " << walkThrough.engine()->currentCommandState() << '\n';
  form.next->click();
  QApplication::processEvents();
  return walkThrough.engine() ? 1 : 0;  // the second press ends the walk-through
}
