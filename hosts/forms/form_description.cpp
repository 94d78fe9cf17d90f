// SPDX-License-Identifier: MIT
// Qt lays a widget out when it is shown. So the window is shown, but not on the screen, and each of
// its pages once.

#include "hosts/forms/form_description.hpp"

#include <QBuffer>
#include <QCoreApplication>
#include <QDir>
#include <QStackedWidget>
#include <QTabWidget>
#include <QToolBox>
#include <QUiLoader>
#include <memory>
#include <stdexcept>

#include "qz/drivers/driver.hpp"
#include "qz/drivers/qt/toolkit_row.hpp"
#include "qz/hosts/qt/walk_through.hpp"

namespace qz::hosts::forms {

namespace {

template <class Pages>
void showEachPage(QWidget& window) {
  for (auto* const pages : window.findChildren<Pages*>()) {
    const int current = pages->currentIndex();
    for (int i = 0; i < pages->count(); ++i) {
      pages->setCurrentIndex(i);
      QCoreApplication::processEvents();
    }
    pages->setCurrentIndex(current);
  }
}

void layOut(QWidget& window) {
  window.setAttribute(Qt::WA_DontShowOnScreen);
  window.show();
  showEachPage<QTabWidget>(window);
  showEachPage<QStackedWidget>(window);
  showEachPage<QToolBox>(window);
  QCoreApplication::processEvents();
}

std::unique_ptr<QWidget> load(std::string_view form, const std::string& directory) {
  QUiLoader loader;
  loader.setWorkingDirectory(QDir(QString::fromStdString(directory)));
  QByteArray bytes(form.data(), static_cast<qsizetype>(form.size()));
  QBuffer file(&bytes);
  file.open(QIODevice::ReadOnly);
  std::unique_ptr<QWidget> window(loader.load(&file));
  if (!window) throw std::runtime_error(loader.errorString().toStdString());
  return window;
}

}  // namespace

std::string describeForm(std::string_view form, const std::string& directory) {
  const auto application = drivers::makeQtDriver();  // makes the application object
  const auto window = load(form, directory);
  layOut(*window);
  return qt::WalkThrough().describe(*window).toStdString();
}

}  // namespace qz::hosts::forms
