// SPDX-License-Identifier: MIT
// Shared by the tests of styled text: a small catalogue of fonts, and texts written out with their
// attributes, so that a case is one line.
#pragma once

#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <cstdio>
#include <initializer_list>
#include <optional>
#include <string>
#include <string_view>

#include "qz/styled_text/html_reader.hpp"

namespace qz::styled_text_tests {

inline std::string joined(std::initializer_list<std::string_view> parts) {
  std::string text;
  for (const std::string_view part : parts) text += part;
  return text;
}

inline std::string lowercase(std::string text) {
  for (char& c : text) c = c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
  return text;
}

/// Knows a few families, by their names in any case, and one bold font by its own name.
class Catalogue final : public toolkit::Fonts {
 public:
  std::optional<toolkit::Font> fontWithName(std::string_view name, double size) const override {
    ++lookUps;
    const std::string key = lowercase(std::string(name));
    if (key == "arial-bold") return toolkit::Font{"Arial", size, true};
    for (const char* family : {"Times", "Helvetica", "Courier", "Arial", "Comic Sans MS"}) {
      if (key == lowercase(family)) {
        return toolkit::Font{family, size, false, false, key == "courier"};
      }
    }
    return std::nullopt;
  }

  mutable std::size_t lookUps = 0;  ///< how often `fontWithName` was called
};

inline toolkit::AttributedString read(std::string_view html) {
  const auto text = toolkit::attributedStringFromHTML(html, Catalogue());
  EXPECT_TRUE(text.has_value()) << html;
  return text.value_or(toolkit::AttributedString());
}

inline std::string number(double value) {
  std::array<char, 32> text{};
  std::snprintf(text.data(), text.size(), "%g", value);
  return text.data();
}

/// Returns "#rrggbb", followed by the alpha where it is not 1.
inline std::string colorText(const toolkit::Color& color) {
  const auto part = [](double value) { return static_cast<unsigned>(std::lround(value * 255)); };
  std::array<char, 16> text{};
  std::snprintf(text.data(), text.size(), "#%02x%02x%02x", part(color.red), part(color.green),
                part(color.blue));
  return text.data() + (color.alpha == 1 ? "" : "/" + number(color.alpha));
}

inline std::string fontText(const toolkit::Font& font) {
  std::string text;
  if (font.family != "Times") text += font.family + ' ';
  if (font.size != 12) text += number(font.size) + ' ';
  if (font.bold) text += "bold ";
  if (font.italic) text += "italic ";
  if (font.fixedPitch) text += "fixed ";
  return text;
}

inline std::string paragraphText(const toolkit::ParagraphStyle& style) {
  constexpr std::array<const char*, 5> alignments = {"left ", "right ", "center ", "justified ",
                                                     ""};
  std::string text = alignments.at(static_cast<std::size_t>(style.alignment));
  if (style.firstLineHeadIndent != 0 || style.headIndent != 0) {
    text += "indent " + number(style.firstLineHeadIndent) + '/' + number(style.headIndent) + ' ';
  }
  return text;
}

/// Returns the attributes in words. The default, Times 12, is left out.
inline std::string attributesText(const toolkit::TextAttributes& attributes) {
  std::string text = attributes.font ? fontText(*attributes.font) : "no font ";
  if (attributes.foregroundColor) text += colorText(*attributes.foregroundColor) + ' ';
  if (attributes.backgroundColor) text += "on " + colorText(*attributes.backgroundColor) + ' ';
  if (attributes.link) text += "link=" + attributes.link->address() + ' ';
  if (attributes.underline) text += "underline ";
  if (attributes.strikethrough) text += "strike ";
  if (attributes.superscript != 0) text += "super " + number(attributes.superscript) + ' ';
  if (attributes.paragraphStyle) text += paragraphText(*attributes.paragraphStyle);
  if (!text.empty()) text.pop_back();
  return text;
}

/// Returns the runs, separated by "|", each followed by its attributes in braces: "a|b{bold}|\n".
inline std::string runsText(const toolkit::AttributedString& styled) {
  std::string text;
  for (const toolkit::TextRun& run : styled.runs()) {
    if (!text.empty()) text += '|';
    text += styled.string().substr(run.range.location, run.range.length);
    const std::string attributes = attributesText(run.attributes);
    if (!attributes.empty()) text += '{' + attributes + '}';
  }
  return text;
}

/// Expects the runs to cover the text in order, none empty, and neighbours to differ.
inline void expectSoundRuns(const toolkit::AttributedString& styled) {
  std::size_t at = 0;
  const toolkit::TextAttributes* before = nullptr;
  for (const toolkit::TextRun& run : styled.runs()) {
    EXPECT_EQ(run.range.location, at);
    EXPECT_GT(run.range.length, 0U);
    EXPECT_FALSE(before != nullptr && *before == run.attributes) << "equal neighbours at " << at;
    before = &run.attributes;
    at += run.range.length;
  }
  EXPECT_EQ(at, styled.length());
}

struct Case {
  const char* html;
  const char* runs;  ///< in the form of `runsText`
};

template <std::size_t N>
void expectRuns(const std::array<Case, N>& cases) {
  for (const auto& [html, runs] : cases) EXPECT_EQ(runsText(read(html)), runs) << html;
}

}  // namespace qz::styled_text_tests
