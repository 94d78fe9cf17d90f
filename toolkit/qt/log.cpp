// SPDX-License-Identifier: MIT
// Writes log lines as Qt messages.

#include "qz/toolkit/qt/log.hpp"

#include <QLoggingCategory>

#include "toolkit/qt/strings.hpp"

namespace qz::toolkit::qt {

void QtLog::write(std::string_view line) {
  static const QLoggingCategory category("qz.walkthrough");
  const Sink sink = sink_;  // a copy: the sink may replace itself
  if (sink) {
    sink(line);
  } else {
    qCInfo(category).noquote() << qString(line);
  }
}

}  // namespace qz::toolkit::qt
