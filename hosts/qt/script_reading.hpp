// SPDX-License-Identifier: MIT
// Reads the script that a host wants to play, in the user's language.
#pragma once

#include <QLocale>
#include <string>

#include "qz/hosts/qt/script_source.hpp"
#include "qz/property_list/collections.hpp"
#include "qz/toolkit/files.hpp"

namespace qz::hosts::qt {

struct ReadScript {
  std::string bytes;
  toolkit::ValueRef<toolkit::Dictionary> lists;
  std::string problem;  ///< why the script cannot be played; empty if it can be
};

/// Reads a script. Beside the file "tour.plist" a file "tour_de_AT.plist" or "tour_de.plist" counts
/// more if its name has the language of `locale`.
ReadScript readScript(const ScriptSource& source, const toolkit::Files& files,
                      const QLocale& locale);

}  // namespace qz::hosts::qt
