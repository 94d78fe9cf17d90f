// SPDX-License-Identifier: MIT
// Sources of walk-throughs: each is refused with places in its text, or built the same way twice.
#include <cstddef>
#include <cstdint>
#include <string>

#include "fuzz/require.hpp"
#include "tools/steps/compiler.hpp"
#include "tools/steps/source.hpp"

namespace qz::tools::steps {
namespace {

using drivers::ViewKind;

/// A window with a control of each kind that sources treat differently.
std::vector<Control> controls(const walkthrough::StageOptions& /*stage*/) {
  return {{.tag = 1, .kind = ViewKind::textField, .caption = "Text"},
          {.tag = 2, .kind = ViewKind::imageView},
          {.tag = 3, .kind = ViewKind::toggle, .caption = "Box"},
          {.tag = 4, .kind = ViewKind::button, .caption = "Next"},
          {.tag = 5, .kind = ViewKind::button, .caption = "Back"},
          {.tag = 6, .kind = ViewKind::box}};
}

/// The source can include itself and one other file.
std::optional<std::string> included(const std::string& path) {
  if (path == "part.yaml") return "fragments: {f: {box: {state: on}}}";
  return std::nullopt;
}

std::string built(const Source& source) {
  Mistakes mistakes;
  const Built result = build(source.tour, {0}, mistakes);
  mistakes.throwIfAny(source.files);
  return result.script->description();
}

void read(const std::string& text) {
  try {
    const Source source = readSourceText("tour.yaml", text, {controls, included});
    fuzz::require(built(source) == built(source), "the same source gives the same script");
  } catch (const SourceRefused& refused) {
    for (const std::string& message : refused.messages()) {
      const bool hasPlace = message.starts_with("tour.yaml:") || message.starts_with("part.yaml:");
      fuzz::require(hasPlace, "a mistake has a place");
    }
  }
}

}  // namespace
}  // namespace qz::tools::steps

// libfyaml keeps a buffer of some texts that it refuses.
extern "C" const char* __lsan_default_suppressions() { return "leak:libfyaml.so"; }

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  qz::tools::steps::read(std::string(reinterpret_cast<const char*>(data), size));
  return 0;
}
