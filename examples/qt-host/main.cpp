// SPDX-License-Identifier: MIT
// An application with walk-throughs in its Help menu, in the language of the user.
#include <QApplication>
#include <QTranslator>

#include "guided_form.hpp"

int main(int argc, char** argv) {
  const QApplication application(argc, argv);
  QTranslator words;
  if (words.load(QLocale(), "parcels", "_", ":/i18n")) QCoreApplication::installTranslator(&words);
  GuidedForm form;
  form.show();
  return QApplication::exec();
}
