// Descriptions of which the engine builds a walk-through window.
#include "tools/play/gui_description.hpp"

#include <string>

#include "toolkit/property_list/scalars.hpp"
#include "tools/failure.hpp"
#include "tools/play/input_file.hpp"
#include "tools/play/text_layout.hpp"

namespace tools::play {
namespace {

bool answersFloatValue(const toolkit::ValueRef<>& value) {
  return toolkit::asNumber(value) || toolkit::asString(value);
}

[[noreturn]] void fail(std::string_view file, const std::string& message) {
  throw Failure(ExitStatus::badInput, std::string(file) + ": " + message);
}

void checkEntry(const toolkit::ValueRef<>& value, const std::string& where, std::string_view file) {
  const auto entry = toolkit::asArray(value);
  if (entry->count() < 5) {
    const std::string found =
        entry ? "an array of " + std::to_string(entry->count()) : foundWords(value);
    fail(file, where + "expected an array of a class name and four numbers, found " + found);
  }
  if (!toolkit::asString(entry->objectAtIndex(0))) {
    fail(file, where + "expected a class name first, found " + foundWords(entry->objectAtIndex(0)));
  }
  for (std::size_t i = 1; i < 5; ++i) {
    if (answersFloatValue(entry->objectAtIndex(i))) continue;
    fail(file, where + "element " + std::to_string(i) + ": expected a number, found " +
                   foundWords(entry->objectAtIndex(i)));
  }
}

}  // namespace

void checkGuiDescription(const toolkit::ValueRef<toolkit::Dictionary>& description,
                         std::string_view file) {
  if (description->count() == 0) {
    fail(file, "expected a description of at least one control, found an empty dictionary");
  }
  for (const auto& [key, value] : description->entries()) {
    checkEntry(value, "entry " + quote(key->description()) + ": ", file);
  }
}

}  // namespace tools::play
