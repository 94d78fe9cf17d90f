// SPDX-License-Identifier: MIT
// A host with its own windows, and walk-throughs in its Help menu.
#include <QApplication>

#include "guided_form.hpp"

int main(int argc, char** argv) {
  const QApplication application(argc, argv);
  GuidedForm form(QApplication::applicationDirPath().toStdString());
  form.show();
  return QApplication::exec();
}
