// SPDX-License-Identifier: MIT
// Plays a walk-through over one form, and looks for what it misses and what it leaves behind.
#pragma once

#include <QString>
#include <map>
#include <string>
#include <vector>

namespace qz::foreign_forms {

struct Findings {
  std::size_t widgets = 0;
  std::size_t buttons = 0;
  std::size_t objects = 0;
  std::size_t values = 0;       // of properties, and the numbers of receivers and children
  std::size_t connections = 0;  // of our own, to every signal of every object
  std::map<std::string, int> classes;
  std::vector<std::string> unreached;  // widgets, with the reason
  std::vector<std::string> mistakes;
};

/// Loads the form, tags each widget in it, and plays a script that drives all of them.
Findings tryForm(const QString& path);

}  // namespace qz::foreign_forms
