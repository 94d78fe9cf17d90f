// SPDX-License-Identifier: MIT
// The words of the language, and what is read with them.
#pragma once

#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "tools/steps/yaml.hpp"

namespace qz::tools::steps {

namespace words {
inline constexpr std::string_view include = "include";
inline constexpr std::string_view use = "use";
inline constexpr std::string_view like = "like";
inline constexpr std::string_view after = "after ";  // and the seconds
inline constexpr std::string_view background = "background";
inline constexpr std::string_view passedOver = "back passes over";
inline constexpr std::string_view back = "back";
inline constexpr std::string_view end = "end";
inline constexpr std::string_view instead = "instead";
inline constexpr std::string_view nothing = "nothing";
}  // namespace words

/// Returns words such as "a list" or `the text “abc”`, for a message.
std::string foundWords(const Node& node);

/// Returns the entries of a table. Whatever else the node is, a key that is not a text, and a key
/// that occurs twice are mistakes; `expected` is the table's name in the message.
std::vector<std::pair<NodeRef, NodeRef>> entriesOf(const Node& node, std::string_view expected,
                                                   Mistakes& mistakes);

/// Returns the text; absent, and a mistake, if the node is not a text.
std::optional<std::string> textOf(const Node& node, std::string_view expected, Mistakes& mistakes);

/// Reads yes or no.
std::optional<bool> flagOf(const Node& node, Mistakes& mistakes);

/// Reads a whole number from `least` to `most`.
std::optional<int> numberOf(const Node& node, int least, int most, std::string_view expected,
                            Mistakes& mistakes);

/// Reads one of the choices; returns its position.
std::optional<std::size_t> choiceOf(const Node& node, std::span<const std::string_view> choices,
                                    Mistakes& mistakes);

}  // namespace qz::tools::steps
