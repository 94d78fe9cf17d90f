// SPDX-License-Identifier: MIT
#include "tools/check/finding.hpp"

#include <algorithm>
#include <iterator>
#include <stdexcept>

namespace qz::tools::check {
namespace {

constexpr std::string_view severityNames[] = {"note", "warning", "error"};

using enum Severity;

constexpr Code codeTable[] = {
    {"not-a-list", error, "the value under a key is not an array"},
    {"odd-key", warning, "a key that no press and no timer finds"},
    {"unknown-command", error, "no command has this name in this form"},
    {"malformed-command", error, "an element that cannot be a command"},
    {"missing-parameter", error, "a command has fewer parameters than it needs"},
    {"extra-parameter", warning, "a command has more parameters than it takes"},
    {"wrong-type", error, "a parameter of a type that the command cannot read"},
    {"not-a-number", warning, "a text where a number is needed"},
    {"unknown-color", error, "no colour has this name"},
    {"unknown-font", error, "no font has this name"},
    {"unknown-image", error, "no image has this name"},
    {"not-ascii", error, "an HTML text with a character beyond ASCII"},
    {"useless-delay", warning, "a delay that is never what is written"},
    {"endless-chain", error, "lists run each other without end"},
    {"raises", error, "a command or a move raises an exception"},
    {"dead-end", error, "no list can run any more, but the walk-through has not ended"},
    {"trap", error, "the end can no longer be reached"},
    {"no-end", warning, "nothing ends the walk-through"},
    {"never-runs", warning, "a list that nothing runs"},
    {"no-target", warning, "no control has the tag that a command names"},
    {"wrong-target", warning, "a command whose control is of the wrong kind"},
    {"no-list", warning, "a button that can be pressed but has no list"},
    {"timer-lost", warning, "a press of a button without a list cancels a timer"},
    {"never-fires", warning, "a timer that is started but never fires"},
    {"same-tag", warning, "two controls have one tag when it is used"},
    {"flash-decided", warning, "a FLASH_ID that is always refused"},
    {"looks-differ", warning, "one place looks different depending on the way to it"},
    {"too-brief", warning, "a timer replaces a text before it can be read"},
    {"tag-left", error, "a control does not get its own tag back at the end"},
    {"left-behind", note, "the end leaves a control different from before the start"},
    {"expectation", error, "an expectation does not hold"},
    {"unneeded-allowance", warning, "an allowance that no finding needs"},
};

}  // namespace

std::string_view nameOf(Severity severity) {
  return severityNames[static_cast<std::size_t>(severity)];
}

std::optional<Severity> severityNamed(std::string_view name) {
  const auto* const found = std::find(std::begin(severityNames), std::end(severityNames), name);
  if (found == std::end(severityNames)) return std::nullopt;
  return static_cast<Severity>(found - std::begin(severityNames));
}

std::span<const Code> codes() { return codeTable; }

const Code* codeNamed(std::string_view name) {
  const auto* const found = std::find_if(std::begin(codeTable), std::end(codeTable),
                                         [&](const Code& code) { return code.name == name; });
  return found == std::end(codeTable) ? nullptr : found;
}

Finding findingOf(std::string_view code, std::string message, std::string help) {
  const Code* const known = codeNamed(code);
  if (!known) throw std::logic_error("no code is called " + std::string(code));
  return {.code = std::string(code),
          .severity = known->severity,
          .message = std::move(message),
          .help = std::move(help)};
}

}  // namespace qz::tools::check
