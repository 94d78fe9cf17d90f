// SPDX-License-Identifier: MIT
// Expectations: what the author of a script says must hold when it is played.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "tools/check/finding.hpp"
#include "tools/exploration/script.hpp"
#include "tools/walkthrough/names.hpp"

namespace qz::tools::check {

/// Something that a move brings about, or that is so at a place.
struct Condition {
  enum class Kind : std::uint8_t {
    end,      ///< the walk-through has ended
    listRan,  ///< the move ran a list under one of `keys`
    hidden,   ///< of the control with the tag, as the rest; false if no control has the tag
    shown,
    enabled,
    disabled,
    on,  ///< the script has set it, and no press since
    off,
    text,   ///< it shows the text `word`
    title,  ///< the same for a button
    image,  ///< it shows the image with the name `word`
    toolTip,
    timer  ///< a timer for the list under the key `word` is pending
  };

  Kind kind = Kind::end;
  bool isNegated = false;
  Tag tag = 0;
  std::string name{};  ///< of the control, in place of the tag; empty: it has none
  std::vector<std::string> keys{};
  std::string word{};
  std::size_t column = 0;  ///< where in its line the tag or the key is, from 1; 0 for `end`
};

struct Expectation {
  enum class Rule : std::uint8_t {
    canReach,        ///< some path leads to the condition
    alwaysCanReach,  ///< a path leads there from every place before the end
    always,          ///< the condition holds after every move
    never,           ///< it holds after no move
    whenever,        ///< whenever it holds, the consequence does too
    within           ///< some path of at most so many moves leads there
  };

  Rule rule = Rule::canReach;
  std::size_t moves = 0;
  Condition condition{};
  std::optional<Condition> consequence{};
  std::string words{};  ///< as the file has them
  FileLine place{};
};

/// Reads a file of expectations, one on a line, with comments that begin with `#`. Throws a Failure
/// for a line that is not one, or that names a list that the script has not. `names` are those of
/// the script's source.
std::vector<Expectation> readExpectations(const std::string& path, const Script& script,
                                          const walkthrough::Names& names);

/// Whether the condition names a control by its tag.
bool isAboutControl(const Condition& condition);

/// Whether some expectation compares what two controls show.
bool compareLooks(const std::vector<Expectation>& expectations);

}  // namespace qz::tools::check
