// SPDX-License-Identifier: MIT
// Descriptions from which the engine builds a walk-through window.
#include "tools/walkthrough/gui_description.hpp"

#include <string>

#include "qz/property_list/scalars.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::walkthrough {
namespace {

bool answersFloatValue(const toolkit::ValueRef<>& value) {
  return toolkit::asNumber(value) || toolkit::asString(value);
}

void checkEntry(const InputFile& file, const std::string& name, const toolkit::ValueRef<>& value) {
  const auto entry = toolkit::asArray(value);
  if (entry->count() < 5) {
    file.fail(value, name + "expected an array of a class name and four numbers, found " +
                         foundWords(value));
  }
  const auto className = entry->objectAtIndex(0);
  if (!toolkit::asString(className)) {
    file.fail(className, name + "expected a class name first, found " + foundWords(className));
  }
  for (std::size_t i = 1; i < 5; ++i) {
    const auto length = entry->objectAtIndex(i);
    if (answersFloatValue(length)) continue;
    file.fail(length, name + "element " + std::to_string(i) + ": expected a number, found " +
                          foundWords(length));
  }
}

}  // namespace

void checkGuiDescription(const InputFile& file) {
  const auto description = file.dictionary();
  if (description->count() == 0) {
    file.fail(description, "expected at least one entry, found an empty dictionary");
  }
  for (const auto& [key, value] : description->entries()) {
    checkEntry(file, "entry " + quote(key->description()) + ": ", value);
  }
}

}  // namespace qz::tools::walkthrough
