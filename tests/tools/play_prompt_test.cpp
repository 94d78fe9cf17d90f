// SPDX-License-Identifier: MIT
// The lines that the user of an interactive walk-through types.
#include <gtest/gtest.h>

#include "tools/play/prompt.hpp"

namespace qz::tools::play {
namespace {

std::string words(const Request& request) {
  if (const auto* press = std::get_if<Press>(&request)) {
    return "press " + std::to_string(press->tag);
  }
  if (const auto* advance = std::get_if<Advance>(&request)) {
    return "advance " + std::to_string(advance->seconds);
  }
  if (const auto* unclear = std::get_if<Unclear>(&request)) return unclear->hint;
  return std::holds_alternative<Help>(request) ? "help" : "quit";
}

TEST(PlayPrompt, UnderstandsALine) {
  const std::string unclear = "expected a tag, +seconds, ? or q, found ";
  const std::string badTime = "after + expected seconds from 0 to 86400, such as +2.5";
  const struct {
    std::string line;
    std::string request;
  } cases[] = {
      {"3", "press 3"},
      {"  -3 \r", "press -3"},
      {"9223372036854775807", "press 9223372036854775807"},
      {"-9223372036854775808", "press -9223372036854775808"},
      {"9223372036854775808", unclear + "“9223372036854775808”"},
      {"+2.5", "advance 2.500000"},
      {"+ 2", "advance 2.000000"},
      {"+0", "advance 0.000000"},
      {"+86400", "advance 86400.000000"},
      {"?", "help"},
      {"q", "quit"},
      {"", unclear + "an empty line"},
      {"next", unclear + "“next”"},
      {"3 4", unclear + "“3 4”"},
      {"3.5", unclear + "“3.5”"},
      {"99999999999999999999", unclear + "“99999999999999999999”"},
      {"+", badTime},
      {"+86401", badTime},
      {"+-1", badTime},
      {"+nan", badTime},
      {"+2s", badTime},
  };
  for (const auto& c : cases) EXPECT_EQ(words(parseRequest(c.line)), c.request) << c.line;
}

}  // namespace
}  // namespace qz::tools::play
