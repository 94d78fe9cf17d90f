// SPDX-License-Identifier: MIT
// Ampersands in what Qt shows: before a letter they make it a mnemonic, two of them are one.
#pragma once

#include <QString>

namespace toolkit::qt {

/// `text` so that its ampersands are shown as they are.
inline QString withoutMeaning(QString text) { return text.replace('&', "&&"); }

/// What a reader sees of `text`.
inline QString withoutMnemonic(const QString& text) {
  QString shown;
  for (qsizetype i = 0; i < text.size(); ++i) {
    if (text[i] == '&' && i + 1 < text.size()) ++i;  // the next one stands for itself
    shown += text[i];
  }
  return shown;
}

}  // namespace toolkit::qt
