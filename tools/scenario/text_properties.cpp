// SPDX-License-Identifier: MIT
// Shows the attributes of a text as JSON.

#include "tools/scenario/text_properties.hpp"

#include <algorithm>
#include <cmath>
#include <cstdio>

namespace qz::tools::scenario {
namespace {

using toolkit::TextAlignment;
using toolkit::TextAttributes;

std::optional<Json> showFixedPitch(const TextAttributes& attributes) {
  return attributes.font && attributes.font->fixedPitch;
}

std::optional<Json> showStrikethrough(const TextAttributes& attributes) {
  return attributes.strikethrough;
}

std::optional<Json> showBackground(const TextAttributes& attributes) {
  if (!attributes.backgroundColor) return std::nullopt;
  return showColor(*attributes.backgroundColor);
}

std::optional<Json> showSuperscript(const TextAttributes& attributes) {
  if (attributes.superscript == 0) return std::nullopt;
  return attributes.superscript;
}

/// Shows [first line, other lines] in points.
std::optional<Json> showIndent(const TextAttributes& attributes) {
  const auto style = attributes.paragraphStyle.value_or(toolkit::ParagraphStyle());
  if (style.firstLineHeadIndent == 0 && style.headIndent == 0) return std::nullopt;
  return Json{style.firstLineHeadIndent, style.headIndent};
}

struct RunAttribute {
  std::string_view name;
  ShowAttribute show;
};

constexpr RunAttribute runAttributes[] = {
    {"font", showFont},
    {"fixed", showFixedPitch},
    {"bold", showBold},
    {"italic", showItalic},
    {"color", showForeground},
    {"background", showBackground},
    {"alignment", showAlignment},
    {"indent", showIndent},
    {"link", showLink},
    {"underline", showUnderline},
    {"strikethrough", showStrikethrough},
    {"superscript", showSuperscript},
};

Json showAttributes(const TextAttributes& attributes) {
  auto shown = Json::object();
  for (const auto& attribute : runAttributes) {
    const auto value = attribute.show(attributes);
    if (value && *value != Json(false) && *value != Json("natural")) {
      shown[std::string(attribute.name)] = *value;
    }
  }
  return shown;
}

}  // namespace

std::optional<Json> showFont(const TextAttributes& attributes) {
  if (!attributes.font) return std::nullopt;
  const double size = attributes.font->size;
  const auto shown = size == std::floor(size) ? Json(std::llround(size)) : Json(size);
  return attributes.font->family + " " + shown.dump();
}

std::optional<Json> showAlignment(const TextAttributes& attributes) {
  const auto style = attributes.paragraphStyle.value_or(toolkit::ParagraphStyle());
  switch (style.alignment) {
    case TextAlignment::left:
      return "left";
    case TextAlignment::right:
      return "right";
    case TextAlignment::center:
      return "center";
    case TextAlignment::justified:
      return "justified";
    case TextAlignment::natural:
      break;
  }
  return "natural";
}

std::optional<Json> showForeground(const TextAttributes& attributes) {
  if (!attributes.foregroundColor) return std::nullopt;
  return showColor(*attributes.foregroundColor);
}

std::optional<Json> showLink(const TextAttributes& attributes) {
  if (!attributes.link) return std::nullopt;
  return attributes.link->address();
}

std::optional<Json> showBold(const TextAttributes& attributes) {
  return attributes.font && attributes.font->bold;
}

std::optional<Json> showItalic(const TextAttributes& attributes) {
  return attributes.font && attributes.font->italic;
}

std::optional<Json> showUnderline(const TextAttributes& attributes) { return attributes.underline; }

std::optional<Json> showThroughout(const toolkit::AttributedString& text, ShowAttribute attribute) {
  const auto& runs = text.runs();
  if (runs.empty()) return attribute({});
  const auto first = attribute(runs.front().attributes);
  const bool same = std::all_of(runs.begin(), runs.end(), [&](const toolkit::TextRun& run) {
    return attribute(run.attributes) == first;
  });
  return same ? first : "mixed";
}

Json showRuns(const toolkit::AttributedString& text) {
  auto runs = Json::array();
  for (const auto& [range, attributes] : text.runs()) {
    runs.push_back(
        {text.string().substr(range.location, range.length), showAttributes(attributes)});
  }
  return runs;
}

std::string showColor(const toolkit::Color& color) {
  const auto byte = [](double part) {
    return static_cast<unsigned>(std::lround(std::clamp(part, 0.0, 1.0) * 255));
  };
  char text[10];
  std::snprintf(text, sizeof text, "#%02x%02x%02x%02x", byte(color.red), byte(color.green),
                byte(color.blue), byte(color.alpha));
  return {text, std::size_t{color.alpha == 1 ? 7U : 9U}};
}

}  // namespace qz::tools::scenario
