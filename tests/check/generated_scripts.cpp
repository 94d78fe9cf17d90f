// SPDX-License-Identifier: MIT
// Scripts and windows made at random.
#include "tests/check/generated_scripts.hpp"

#include <iterator>

#include "tests/check/draft.hpp"

namespace qz::naive {

namespace {

constexpr std::string_view readingCodes[] = {
    "not-a-list",      "odd-key",    "unknown-command", "malformed-command", "missing-parameter",
    "extra-parameter", "wrong-type", "not-a-number",    "unknown-color",     "unknown-font",
    "unknown-image",   "not-ascii",  "useless-delay"};
constexpr std::string_view exploringCodes[] = {
    "endless-chain", "raises",       "dead-end",  "trap",       "no-end",      "never-runs",
    "no-target",     "wrong-target", "no-list",   "timer-lost", "never-fires", "same-tag",
    "flash-decided", "looks-differ", "too-brief", "tag-left",   "left-behind"};

std::string_view codeFor(std::uint64_t turn) {
  const std::size_t count = std::size(readingCodes) + std::size(exploringCodes);
  const std::size_t index = turn % count;
  return index < std::size(readingCodes) ? readingCodes[index]
                                         : exploringCodes[index - std::size(readingCodes)];
}

}  // namespace

std::span<const std::string_view> codesFoundByReading() { return readingCodes; }
std::span<const std::string_view> codesFoundByExploring() { return exploringCodes; }

Generated generate(std::uint64_t seed) {
  Dice dice(seed);
  Draft draft;
  Generated generated;
  if (seed % 2 == 1) generated.planted = codeFor(seed / 2);
  Bounds bounds = generated.planted ? boundsFor(*generated.planted) : Bounds();
  bounds.isWild = !generated.planted && dice.oneIn(4);
  fillAtRandom(draft, bounds, dice);
  if (generated.planted) plant(*generated.planted, draft);
  generated.script = draft.script();
  generated.host = draft.host;
  return generated;
}

}  // namespace qz::naive
