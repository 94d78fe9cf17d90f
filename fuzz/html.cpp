// SPDX-License-Identifier: MIT
// Checks that the runs of every text that the HTML reader returns cover it from end to end.
#include <cstdint>

#include "fuzz/require.hpp"
#include "qz/styled_text/html_reader.hpp"
#include "text/utf8.hpp"
#include "toolkit/memory/fonts.hpp"

namespace qz {

namespace {

using fuzz::require;

void checkRuns(const toolkit::AttributedString& text) {
  std::size_t end = 0;
  for (const toolkit::TextRun& run : text.runs()) {
    require(run.range.location == end && run.range.length > 0, "runs follow one another");
    end += run.range.length;
    require(end <= text.length(), "runs lie in the text");
    require(text::validUtf8Length(text.string().substr(run.range.location, run.range.length)) ==
                run.range.length,
            "a run is whole characters");
  }
  require(end == text.length(), "runs reach to the end");
}

}  // namespace

}  // namespace qz

using namespace qz;

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const qz::toolkit::memory::MemoryFonts fonts;
  const std::string_view bytes(reinterpret_cast<const char*>(data), size);
  const auto text = qz::toolkit::attributedStringFromHTML(bytes, fonts);
  require(text.has_value() || size == 0, "only nothing is read as nothing");
  if (text) checkRuns(*text);
  return 0;
}
