// SPDX-License-Identifier: MIT
// What a check has found.
#pragma once

#include <compare>
#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "qz/property_list/value.hpp"
#include "tools/exploration/move.hpp"

namespace qz::tools::check {

/// `error`: surely not meant. `warning`: mostly not meant. `note`: worth knowing.
enum class Severity : std::uint8_t { note, warning, error };

/// Returns "note", "warning" or "error".
std::string_view nameOf(Severity severity);
/// Returns the severity with that name; absent for any other name.
std::optional<Severity> severityNamed(std::string_view name);

/// A kind of finding.
struct Code {
  std::string_view name;     ///< such as "dead-end"
  Severity severity;         ///< the usual one; a finding may be less or more severe
  std::string_view summary;  ///< one line of plain English
};

/// Returns all codes, in the order of the documentation.
std::span<const Code> codes();
/// Returns the code with that name; null for any other name.
const Code* codeNamed(std::string_view name);

/// A line of a file beside a script.
struct FileLine {
  std::string path;
  std::size_t line = 0;  ///< from 1

  /// Returns "PATH:LINE".
  std::string text() const { return path + ":" + std::to_string(line); }
  /// Returns "PATH:LINE:COLUMN".
  std::string text(std::size_t column) const { return text() + ":" + std::to_string(column); }
};

struct Finding {
  std::string code;
  Severity severity = Severity::error;
  std::string message;  ///< one sentence without a full stop: what is wrong, and its effect
  std::string help;     ///< how to mend it; may be empty
  std::optional<std::string> list{};     ///< key of the list in which the cause is
  std::optional<std::size_t> element{};  ///< of the list, from 0
  toolkit::ValueRef<> where{};           ///< the value in the script, for its place; may be absent
  std::optional<FileLine> elsewhere{};   ///< the place of a finding that is not in the script
  std::optional<toolkit::Tag> tag{};
  std::string expectation{};  ///< as its file has it; empty for another code
  Path path{};                ///< the shortest way to see it; empty for what is read off the script
  std::vector<PlayedMove> played{};  ///< the moves of `path`, and what each changed
  Path otherPath{};                  ///< of `looks-differ`: the way to the other look
  std::size_t places = 0;            ///< how many places show it
};

/// Returns a finding of the code with its usual severity. The code must exist.
Finding findingOf(std::string_view code, std::string message, std::string help = {});

}  // namespace qz::tools::check
