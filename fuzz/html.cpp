// SPDX-License-Identifier: MIT
// Checks that the runs of every text that the HTML reader returns cover it from end to end.
#include <cstdint>

#include "fuzz/require.hpp"
#include "toolkit/memory/fonts.hpp"
#include "toolkit/property_list/utf8.hpp"
#include "toolkit/styled_text/html_reader.hpp"

namespace {

using fuzz::require;

void checkRuns(const toolkit::AttributedString& text) {
  std::size_t end = 0;
  for (const toolkit::TextRun& run : text.runs()) {
    require(run.range.location == end && run.range.length > 0, "runs follow one another");
    end += run.range.length;
    require(end <= text.length(), "runs lie in the text");
    require(toolkit::validUtf8Length(text.string().substr(run.range.location, run.range.length)) ==
                run.range.length,
            "a run is whole characters");
  }
  require(end == text.length(), "runs reach to the end");
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const toolkit::memory::MemoryFonts fonts;
  const std::string_view bytes(reinterpret_cast<const char*>(data), size);
  const auto text = toolkit::attributedStringFromHTML(bytes, fonts);
  require(text.has_value() || size == 0, "only nothing is read as nothing");
  if (text) checkRuns(*text);
  return 0;
}
