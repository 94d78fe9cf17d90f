// SPDX-License-Identifier: MIT
// Tests of widgets need an application. Nobody sees its windows, unless QT_QPA_PLATFORM says where
// to.

#include <gtest/gtest.h>

#include <QApplication>
#include <clocale>

int main(int argc, char** argv) {
  if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM")) qputenv("QT_QPA_PLATFORM", "offscreen");
  const QApplication application(argc, argv);
  QApplication::setQuitOnLastWindowClosed(false);
  std::setlocale(LC_ALL, "C");  // Qt sets the user's
  testing::InitGoogleTest(&argc, argv);
  return RUN_ALL_TESTS();
}
