// SPDX-License-Identifier: MIT
// Converts text and colours between the toolkit interface and Qt.
#pragma once

#include <QColor>
#include <QString>
#include <string>
#include <string_view>

#include "qz/styled_text/color.hpp"

namespace qz::toolkit::qt {

inline QString qString(std::string_view utf8) {
  return QString::fromUtf8(utf8.data(), static_cast<qsizetype>(utf8.size()));
}

inline std::string utf8(const QString& text) { return text.toStdString(); }

inline QColor qColor(const Color& color) {
  return QColor::fromRgbF(static_cast<float>(color.red), static_cast<float>(color.green),
                          static_cast<float>(color.blue), static_cast<float>(color.alpha));
}

inline Color toolkitColor(const QColor& color) {
  const QColor rgb = color.toRgb();
  return {static_cast<double>(rgb.redF()), static_cast<double>(rgb.greenF()),
          static_cast<double>(rgb.blueF()), static_cast<double>(rgb.alphaF())};
}

}  // namespace qz::toolkit::qt
