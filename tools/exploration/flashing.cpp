// SPDX-License-Identifier: MIT
#include "tools/exploration/flashing.hpp"

namespace qz::tools::check {
namespace {

/// Whether no control behind this one has the same tag.
bool isBackmost(const Exploration& exploration, std::uint32_t place, std::size_t control) {
  const auto& format = exploration.format();
  const std::uint8_t* const bytes = exploration.place(place);
  const Tag tag = format.control(bytes, control).tag;
  for (std::size_t behind = 0; behind < control; ++behind) {
    if (format.control(bytes, behind).tag == tag) return false;
  }
  return true;
}

}  // namespace

Flashing::Flashing(const Exploration& exploration) : exploration_(exploration) {
  std::size_t part = exploration.firstFlashPart();
  for (const std::string& key : exploration.setting().flashKeys) {
    parts_.emplace(std::stoll(key), part++);
  }
}

std::optional<std::size_t> Flashing::partOf(std::uint32_t place, std::size_t control) const {
  const std::uint8_t* const bytes = exploration_.place(place);
  const auto part = parts_.find(exploration_.format().control(bytes, control).tag);
  return part == parts_.end() ? std::nullopt : std::optional(part->second);
}

bool Flashing::flashes(std::uint32_t place, std::size_t control, const Looks::Parts& parts) const {
  const auto part = partOf(place, control);
  return part && parts[*part] == flashingAllowed + notedYes &&
         drivers::isButton(exploration_.setting().kinds[control]) &&
         isBackmost(exploration_, place, control);  // only the backmost one flashes
}

}  // namespace qz::tools::check
