// SPDX-License-Identifier: MIT
// Statements of scenarios, for what the tool writes in their language.
#pragma once

#include <filesystem>
#include <ostream>
#include <string>
#include <vector>

#include "tools/exploration/move.hpp"
#include "tools/exploration/world.hpp"

namespace qz::tools::check {

/// Returns the text as a quoted word.
std::string quotedWord(const std::string& text);
std::string yesNo(bool value);
std::string numberWord(double value);

/// What a written scenario plays.
struct WrittenPlay {
  const Setting& setting;
  std::filesystem::path script;
  std::filesystem::path directory;  ///< in which the scenario will be
};

/// Writes the statements that copy the script and its images, open the window, and make the engine.
/// `names` are those of the window's controls, back to front.
void writeSetUp(const WrittenPlay& play, const std::vector<std::string>& names, std::ostream& out);

/// Writes the statement for a move, without the end of its line. `pressed` names the control of a
/// press.
void writeMove(const WrittenPlay& play, const Step& step, const std::string& pressed,
               std::ostream& out);

}  // namespace qz::tools::check
