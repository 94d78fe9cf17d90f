// SPDX-License-Identifier: MIT
// What is said of a walk-through in steps. Scripts that are built of steps have no
// other findings whose help speaks of lists or commands.
#include "tools/check/source_words.hpp"

#include <string_view>
#include <utility>

namespace qz::tools::check {
namespace {

constexpr std::pair<std::string_view, std::string_view> helpOfCodes[] = {
    {"dead-end",
     "show or enable a button whose “press” leads on, or let the step wait: “after 5 s”"},
    {"trap", "let a press or a wait lead to a step from which the end can be reached"},
    {"no-end", "let a press or a wait lead to the “end”"},
    {"no-list", "give the button a name under “controls”, and say where a “press” leads"},
    {"looks-differ", "say at the step what the control shows"},
    {"left-behind",
     "at the last step, say what the host's window has, if the host goes on using the control"},
};

}  // namespace

void speakOfSteps(std::vector<Finding>& findings) {
  std::erase_if(findings, [](const Finding& finding) { return finding.code == "never-runs"; });
  for (Finding& finding : findings) {
    for (const auto& [code, help] : helpOfCodes) {
      if (finding.code == code) finding.help = help;
    }
  }
}

}  // namespace qz::tools::check
