// SPDX-License-Identifier: MIT
// Small readers of Markdown and HTML, which know what the generated sources have.
#include "tests/steps/reading.hpp"

#include <optional>
#include <utility>

namespace qz::meaning {

namespace {

/// Takes `start` off the front of the text, if it begins with it.
bool take(std::string_view& rest, std::string_view start) {
  if (!rest.starts_with(start)) return false;
  rest.remove_prefix(start.size());
  return true;
}

/// Takes the text up to `end`, and that too.
std::string takeUpTo(std::string_view& rest, std::string_view end) {
  std::string taken(rest.substr(0, rest.find(end)));
  rest.remove_prefix(taken.size() + end.size());
  return taken;
}

void takeCharacter(std::string_view& rest, Reading& reading, Span& style) {
  style.text = rest.front();
  rest.remove_prefix(1);
  append(reading, style);
}

std::optional<std::string_view> takeReference(std::string_view& rest) {
  constexpr std::pair<std::string_view, std::string_view> references[] = {
      {"&amp;", "&"}, {"&lt;", "<"}, {"&eacute;", "é"}};
  for (const auto& [written, read] : references) {
    if (take(rest, written)) return read;
  }
  return std::nullopt;
}

bool takeTag(std::string_view& rest, Span& style) {
  if (take(rest, "<b>")) return style.isBold = true;
  if (take(rest, "<i>")) return style.isItalic = true;
  if (take(rest, "</b>")) return !(style.isBold = false);
  if (take(rest, "</i>")) return !(style.isItalic = false);
  if (take(rest, "</a>")) return style.link = "", true;
  if (!take(rest, "<a href=\"")) return false;
  style.link = takeUpTo(rest, "\">");
  return true;
}

}  // namespace

void append(Reading& reading, const Span& span) {
  if (span.text.empty()) return;
  Span joined = span;
  if (!reading.empty()) joined.text = reading.back().text;
  if (!reading.empty() && joined == reading.back()) {
    reading.back().text += span.text;
  } else {
    reading.push_back(span);
  }
}

Reading readMarkdown(std::string_view rest) {
  Reading reading;
  Span style;
  while (!rest.empty()) {
    if (take(rest, "**")) {
      style.isBold = !style.isBold;
    } else if (take(rest, "*")) {
      style.isItalic = !style.isItalic;
    } else if (take(rest, "[")) {
      const std::string text = takeUpTo(rest, "](");
      append(reading, {text, style.isBold, style.isItalic, takeUpTo(rest, ")")});
    } else {
      take(rest, "\\");
      takeCharacter(rest, reading, style);
    }
  }
  return reading;
}

Reading readHtml(std::string_view rest) {
  Reading reading;
  Span style;
  while (!rest.empty()) {
    if (takeTag(rest, style)) continue;
    if (const auto character = takeReference(rest)) {
      style.text = *character;
      append(reading, style);
    } else {
      takeCharacter(rest, reading, style);
    }
  }
  return reading;
}

}  // namespace qz::meaning
