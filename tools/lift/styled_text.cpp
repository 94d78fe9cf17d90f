// SPDX-License-Identifier: MIT
#include "tools/lift/styled_text.hpp"

#include <algorithm>
#include <cmath>
#include <cstdio>

#include "tools/steps/markup.hpp"

namespace qz::tools::lift {
namespace {

using toolkit::AttributedString;
using toolkit::TextAttributes;

std::string partOf(const AttributedString& text, const toolkit::TextRun& run) {
  return text.string().substr(run.range.location, run.range.length);
}

bool isSpecial(char c) { return std::string_view("\\`*_[]<>&#!|~").find(c) != std::string::npos; }

/// Escapes what Markdown gives a meaning, also at the beginning of a line.
std::string escaped(const std::string& plain) {
  std::string markdown;
  for (std::size_t i = 0; i < plain.size(); ++i) {
    const bool beginsLine = i == 0 || plain[i - 1] == '\n';
    const bool isMarker = beginsLine && (plain[i] == '-' || plain[i] == '+' || plain[i] == '=');
    const bool endsNumber = (plain[i] == '.' || plain[i] == ')') && i > 0 &&
                            std::isdigit(static_cast<unsigned char>(plain[i - 1])) != 0;
    if (isSpecial(plain[i]) || isMarker || endsNumber) markdown += '\\';
    markdown += plain[i];
  }
  return markdown;
}

bool meansItself(const std::string& markdown, const std::string& plain) {
  const steps::Markup markup = steps::readMarkdown(markdown);
  return markup.isPlain && markup.text == plain;
}

std::string hex(const toolkit::Color& color) {
  const auto byte = [](double part) { return static_cast<unsigned>(std::lround(part * 255)); };
  char text[8];
  std::snprintf(text, sizeof text, "#%02x%02x%02x", byte(color.red) & 0xffU,
                byte(color.green) & 0xffU, byte(color.blue) & 0xffU);
  return text;
}

std::string number(double value) {
  char text[32];
  std::snprintf(text, sizeof text, "%g", value);
  return text;
}

steps::Font named(const toolkit::Font& font) {
  const std::string style = std::string(font.bold ? "Bold" : "") + (font.italic ? "Italic" : "");
  return {font.family + (style.empty() ? "" : "-" + style), static_cast<int>(font.size)};
}

/// Puts an element around HTML.
void wrapIn(std::string& html, const std::string& element, const std::string& attributes = {}) {
  html = "<" + element + attributes + ">" + html + "</" + element + ">";
}

void wrapInFont(std::string& html, const TextAttributes& attributes,
                const std::optional<steps::Font>& outer) {
  std::string style;
  const auto& font = attributes.font;
  const std::string family = outer ? outer->name.substr(0, outer->name.find('-')) : "";
  if (font && font->family != family) style += "font-family: " + font->family + "; ";
  if (font && (!outer || font->size != outer->size)) {
    style += "font-size: " + number(font->size) + "pt; ";
  }
  if (attributes.foregroundColor) style += "color: " + hex(*attributes.foregroundColor) + "; ";
  if (attributes.backgroundColor) {
    style += "background-color: " + hex(*attributes.backgroundColor) + "; ";
  }
  if (style.empty()) return;
  style.resize(style.size() - 2);
  wrapIn(html, "font", " style=\"" + style + "\"");
}

}  // namespace

std::optional<std::string> asMarkdown(const std::string& plain) {
  if (meansItself(plain, plain)) return plain;
  std::string markdown = escaped(plain);
  return meansItself(markdown, plain) ? std::optional(markdown) : std::nullopt;
}

std::optional<std::string> asMarkdown(const AttributedString& text) {
  std::string markdown;
  for (const auto& run : text.runs()) {
    const TextAttributes& attributes = run.attributes;
    if (attributes.underline || attributes.strikethrough || attributes.superscript != 0) {
      return std::nullopt;
    }
    std::string part = escaped(partOf(text, run));
    if (attributes.font && attributes.font->italic) part = "*" + part + "*";
    if (attributes.font && attributes.font->bold) part = "**" + part + "**";
    if (attributes.link) part = "[" + part + "](" + attributes.link->address() + ")";
    markdown += part;
  }
  return markdown;
}

std::string asHtml(const AttributedString& text, const std::optional<steps::Font>& font) {
  std::string html;
  for (const auto& run : text.runs()) {
    const TextAttributes& attributes = run.attributes;
    std::string part = steps::asHtml(partOf(text, run));
    if (attributes.superscript > 0) wrapIn(part, "sup");
    if (attributes.superscript < 0) wrapIn(part, "sub");
    if (attributes.underline) wrapIn(part, "u");
    if (attributes.strikethrough) wrapIn(part, "s");
    if (attributes.font && attributes.font->italic) wrapIn(part, "i");
    if (attributes.font && attributes.font->bold) wrapIn(part, "b");
    wrapInFont(part, attributes, font);
    if (attributes.link) wrapIn(part, "a", " href=\"" + attributes.link->address() + "\"");
    html += part;
  }
  return html;
}

std::vector<steps::Font> fontsOf(const AttributedString& text) {
  std::vector<steps::Font> fonts;
  const auto add = [&](const steps::Font& font) {
    const bool isKnown = std::any_of(fonts.begin(), fonts.end(), [&](const steps::Font& each) {
      return each.name == font.name && each.size == font.size;
    });
    if (!isKnown && font.size > 0) fonts.push_back(font);
  };
  for (const auto& run : text.runs()) {
    if (!run.attributes.font) continue;
    add(named(*run.attributes.font));
    add({run.attributes.font->family, static_cast<int>(run.attributes.font->size)});
  }
  return fonts;
}

}  // namespace qz::tools::lift
