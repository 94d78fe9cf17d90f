// SPDX-License-Identifier: MIT
// Runs the widget tests in an application. Its windows are invisible, unless QT_QPA_PLATFORM names
// a platform that shows them.

#include <gtest/gtest.h>

#include <QApplication>
#include <clocale>

int main(int argc, char** argv) {
  if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM")) qputenv("QT_QPA_PLATFORM", "offscreen");
  const QApplication application(argc, argv);
  QApplication::setQuitOnLastWindowClosed(false);
  std::setlocale(LC_ALL, "C");  // Qt sets the user's locale
  testing::InitGoogleTest(&argc, argv);
  return RUN_ALL_TESTS();
}
