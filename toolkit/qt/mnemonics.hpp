// SPDX-License-Identifier: MIT
// Ampersands in Qt's texts: one before a letter makes it a mnemonic, two show as one.
#pragma once

#include <QString>

namespace qz::toolkit::qt {

/// Returns `text` escaped so that its ampersands show as they are.
inline QString withoutMeaning(QString text) { return text.replace('&', "&&"); }

/// Returns the text that a reader sees, without mnemonic markers.
inline QString withoutMnemonic(const QString& text) {
  QString shown;
  for (qsizetype i = 0; i < text.size(); ++i) {
    if (text[i] == '&' && i + 1 < text.size()) ++i;  // the next character stands for itself
    shown += text[i];
  }
  return shown;
}

}  // namespace qz::toolkit::qt
