// SPDX-License-Identifier: MIT
// The driver's work with a real screen: who is in front of it, and pictures of the windows.

#include <QApplication>
#include <QPainter>
#include <QPixmap>

#include "drivers/qt/qt_driver.hpp"
#include "toolkit/qt/parts.hpp"
#include "toolkit/qt/strings.hpp"
#include "toolkit/qt/window.hpp"

namespace qz::drivers {

namespace {

/// Returns a picture of the window and, if it is a sheet, of its parent behind it.
QPixmap pictureOf(const QtWindow& window) {
  QPixmap own = window.widget()->grab();
  const auto parent = window.sheetParent();
  if (!parent || !parent->widget()) return own;

  const QPoint place =
      window.widget()->geometry().topLeft() - parent->widget()->geometry().topLeft();
  const QPixmap under = pictureOf(*parent);
  const QRect parentArea(QPoint(), under.deviceIndependentSize().toSize());
  const QRect area = parentArea.united(QRect(place, window.widget()->size()));
  QPixmap picture(area.size() * own.devicePixelRatio());
  picture.setDevicePixelRatio(own.devicePixelRatio());
  picture.fill(Qt::transparent);
  QPainter painter(&picture);
  painter.drawPixmap(-area.topLeft(), under);
  painter.drawPixmap(place - area.topLeft(), own);
  return picture;
}

}  // namespace

bool QtDriver::hasPerson() const {
  const QString platform = QGuiApplication::platformName();
  return platform != "offscreen" && platform != "minimal" && platform != "vnc";
}

bool QtDriver::savePicture(const Ref<Window>& window, const std::string& path) {
  settleWithoutFiring();
  const auto shown = QtWindow::of(window);
  if (!shown || !shown->widget() || !shown->widget()->isVisible()) return false;
  return pictureOf(*shown).save(qString(path), "PNG");
}

}  // namespace qz::drivers
