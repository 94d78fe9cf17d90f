// SPDX-License-Identifier: MIT
// Reads the preferences each time, because they may change while the application runs.

#include "toolkit/qt/user_preferences.hpp"

#include <QApplication>
#include <QVariant>

namespace qz::toolkit::qt {

namespace {

bool isSet(const QByteArray& value) { return !value.isEmpty() && value != "0" && value != "false"; }

bool isWanted(const char* property, const char* variable) {
  return isSet(qApp->property(property).toByteArray()) || isSet(qgetenv(variable));
}

}  // namespace

bool prefersReducedMotion() { return isWanted(reducedMotionProperty, reducedMotionVariable); }

bool prefersHighContrast() { return isWanted(highContrastProperty, highContrastVariable); }

}  // namespace qz::toolkit::qt
