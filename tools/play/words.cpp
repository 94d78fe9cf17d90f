// SPDX-License-Identifier: MIT
// Puts into words what a control or a window shows, for the transcript.
#include "tools/play/words.hpp"

#include <array>
#include <cmath>
#include <cstdio>
#include <utility>

#include "tools/support/text_layout.hpp"

namespace qz::tools::play {
namespace {

std::string joined(const std::vector<std::string>& words, std::string_view separator) {
  std::string text;
  for (const std::string& word : words) {
    if (!text.empty()) text += separator;
    text += word;
  }
  return text;
}

std::string fontWords(const toolkit::Font& font) {
  std::string words = printable(font.family) + " " + numberWords(font.size);
  if (font.bold) words += " bold";
  if (font.italic) words += " italic";
  return words;
}

std::string_view alignmentWord(toolkit::TextAlignment alignment) {
  switch (alignment) {
    case toolkit::TextAlignment::left:
      return "left";
    case toolkit::TextAlignment::right:
      return "right";
    case toolkit::TextAlignment::center:
      return "centred";
    case toolkit::TextAlignment::justified:
      return "justified";
    case toolkit::TextAlignment::natural:
      break;
  }
  return "";
}

unsigned byteOf(double share) { return static_cast<unsigned>(std::lround(share * 255)); }

}  // namespace

std::string_view stateWord(toolkit::State state) {
  if (state == toolkit::State::mixed) return "mixed";
  return state == toolkit::State::on ? "on" : "off";
}

std::string colorWords(const toolkit::Color& color) {
  using namespace toolkit::colors;
  static constexpr std::array<std::pair<toolkit::Color, std::string_view>, 7> names = {
      {{black, "black"},
       {blue, "blue"},
       {gray, "gray"},
       {green, "green"},
       {orange, "orange"},
       {red, "red"},
       {white, "white"}}};
  for (const auto& [named, name] : names) {
    if (named == color) return std::string(name);
  }
  std::array<char, 24> text{};
  std::snprintf(text.data(), text.size(), "#%02x%02x%02x", byteOf(color.red), byteOf(color.green),
                byteOf(color.blue));
  std::string words = text.data();
  if (color.alpha < 1) words += " at " + numberWords(std::round(color.alpha * 100)) + "%";
  return words;
}

std::string styleWords(const toolkit::TextAttributes& attributes) {
  std::vector<std::string> words;
  if (attributes.font) words.push_back(fontWords(*attributes.font));
  if (attributes.foregroundColor) words.push_back(colorWords(*attributes.foregroundColor));
  if (attributes.backgroundColor) words.push_back("on " + colorWords(*attributes.backgroundColor));
  if (attributes.paragraphStyle) {
    const auto& [alignment, firstLine, others] = *attributes.paragraphStyle;
    if (const auto word = alignmentWord(alignment); !word.empty()) words.emplace_back(word);
    if (others > 0) words.push_back("indented " + numberWords(others));
  }
  if (attributes.underline) words.emplace_back("underlined");
  if (attributes.strikethrough) words.emplace_back("struck through");
  if (attributes.superscript != 0) {
    words.emplace_back(attributes.superscript > 0 ? "raised" : "lowered");
  }
  if (attributes.link) words.push_back("link to " + quote(attributes.link->address()));
  return words.empty() ? "plain" : joined(words, ", ");
}

std::string numberWords(double number) {
  std::array<char, 32> text{};
  std::snprintf(text.data(), text.size(), "%.6g", number);
  return text.data();
}

std::string whenWords(double seconds) {
  constexpr double year = 365.0 * 24 * 3600;
  return seconds < year ? "in " + numberWords(seconds) + " s" : "practically never";
}

const toolkit::AttributedString& captionOf(const ControlPicture& control) {
  const bool hasTitle = rowOf(control.view.kind).caption == drivers::Caption::title;
  return hasTitle ? control.view.title : control.view.text;
}

std::string contentOf(const ControlPicture& control) {
  if (rowOf(control.view.kind).caption == drivers::Caption::imageName) {
    return control.view.image ? printable(*control.view.image) : "(none)";
  }
  return printable(captionOf(control).string());
}

std::vector<std::string> remarksOn(const ControlPicture& control) {
  const drivers::ViewPicture& view = control.view;
  std::vector<std::string> remarks;
  if (view.hidden) remarks.emplace_back("hidden");
  if (!view.enabled) remarks.emplace_back("disabled");
  if (rowOf(view.kind).showsState || view.state != toolkit::State::off) {
    remarks.emplace_back(stateWord(view.state));
  }
  if (control.flashing) remarks.emplace_back("flashing");
  if (view.highlighted) remarks.emplace_back("highlighted");
  if (control.shadowed) remarks.emplace_back("same tag as one behind it");
  if (view.background) remarks.push_back("background " + colorWords(*view.background));
  const auto& runs = captionOf(control).runs();
  if (runs.size() == 1 && runs.front().attributes != toolkit::TextAttributes{}) {
    remarks.push_back(styleWords(runs.front().attributes));
  }
  if (!view.toolTip.empty()) remarks.push_back("tooltip " + quote(view.toolTip));
  return remarks;
}

std::vector<std::string> remarksOn(const drivers::WindowPicture& window) {
  std::vector<std::string> remarks = {numberWords(window.content.width) + " × " +
                                      numberWords(window.content.height)};
  const std::string_view gone = window.closes > 0 ? "closed" : "off the screen";
  remarks.emplace_back(window.visible ? "on the screen" : gone);
  if (window.sheetOf) remarks.emplace_back("a sheet of the host's window");
  remarks.push_back("background " + colorWords(window.background));
  if (window.layerImage) remarks.push_back("background image " + quote(*window.layerImage));
  return remarks;
}

}  // namespace qz::tools::play
