// SPDX-License-Identifier: MIT
// Tries what an author would write, the simplest first, until the control looks as it should.
#include "tools/lift/sayings.hpp"

#include <algorithm>
#include <iterator>

#include "tools/lift/styled_text.hpp"

namespace qz::tools::lift {
namespace {

using drivers::Caption;
using toolkit::AttributedString;

constexpr std::pair<const char*, toolkit::Color> titleColors[] = {
    {"red", toolkit::colors::red},     {"white", toolkit::colors::white},
    {"blue", toolkit::colors::blue},   {"green", toolkit::colors::green},
    {"black", toolkit::colors::black}, {"orange", toolkit::colors::orange},
    {"gray", toolkit::colors::gray}};

bool isCenteredText(const AttributedString& text) {
  const auto& runs = text.runs();
  return std::any_of(runs.begin(), runs.end(), [](const auto& run) {
    const auto& style = run.attributes.paragraphStyle;
    return style && style->alignment == toolkit::TextAlignment::center;
  });
}

const char* titleColorOf(const AttributedString& text) {
  for (const auto& run : text.runs()) {
    for (const auto& [name, color] : titleColors) {
      if (run.attributes.foregroundColor == color) return name;
    }
  }
  return nullptr;
}

}  // namespace

Sayings::Sayings(Stand& stand, const check::Script& script) : stand_(stand) {
  for (const auto& list : script.lists()) {
    for (const check::Element& element : list.elements) {
      if (!element.command) continue;
      const auto position = element.command->positionOf(ParameterType::html);
      const auto html = position ? element.parameter(*position) : nullptr;
      if (html) fragments_.push_back(html->description());
    }
  }
  std::sort(fragments_.begin(), fragments_.end());
  fragments_.erase(std::unique(fragments_.begin(), fragments_.end()), fragments_.end());
}

const std::optional<Properties>& Sayings::of(ControlIndex control, LookValue look) {
  const LookValue stateless = stand_.withoutState(look);
  const auto [known, isNew] = known_.try_emplace({control, stateless});
  if (isNew) known->second = find(control, stateless);
  return known->second;
}

std::optional<Properties> Sayings::find(ControlIndex control, LookValue look) {
  const check::SavedView& view = stand_.view(look);
  Properties common;
  steps::ControlWords words;
  if (view.toolTip != stand_.controls()[control].toolTip) {
    common.emplace_back("tooltip", view.toolTip);
    words.toolTip = view.toolTip;
  }
  if (view.background == toolkit::colors::red) {
    common.emplace_back("background", "red");
    words.isRed = true;
  }
  for (Candidate& candidate : contents(control, view)) {
    candidate.words.toolTip = words.toolTip;
    candidate.words.isRed = words.isRed;
    if (stand_.show(control, candidate.words) != look) continue;
    candidate.properties.insert(candidate.properties.end(), common.begin(), common.end());
    return candidate.properties;
  }
  return std::nullopt;
}

Sayings::Candidates Sayings::contents(ControlIndex control, const check::SavedView& view) const {
  Candidates candidates = {{}};
  switch (rowOf(stand_.controls()[control].kind).caption) {
    case Caption::title:
      addTexts("title", view.title, candidates);
      break;
    case Caption::text:
      addTexts("text", view.text, candidates);
      break;
    case Caption::imageName:
      if (view.image) {
        candidates.push_back({{{"picture", view.image->name()}}, {}});
        candidates.back().words.content = steps::Markup{true, view.image->name()};
      }
      break;
    case Caption::none:
      break;
  }
  return candidates;
}

void Sayings::addTexts(const std::string& property, const AttributedString& text,
                       Candidates& candidates) const {
  const bool isTitle = property == "title";
  const std::string& plain = text.string();
  const auto fonts = fontsOf(text);
  const char* const color = isTitle ? titleColorOf(text) : nullptr;
  const auto addAligned = [&](Candidate candidate) {
    candidates.push_back(candidate);
    if (color) {
      candidate.properties.emplace_back("color", color);
      candidate.words.color = color;
      candidates.push_back(std::move(candidate));
    }
  };
  const auto addInFont = [&](const Candidate& candidate) {
    addAligned(candidate);
    if (!isCenteredText(text)) return;
    Candidate centered = candidate;
    centered.properties.emplace_back("align", "center");
    centered.words.isCentered = true;
    addAligned(std::move(centered));
  };
  const auto add = [&](const std::string& name, const std::string& written, steps::Markup markup,
                       const std::optional<steps::Font>& font) {
    Candidate candidate{{{name, written}}, {}};
    candidate.words.content = std::move(markup);
    if (font) {
      candidate.properties.emplace_back("font", font->name + " " + std::to_string(font->size));
      candidate.words.font = font;
    }
    addInFont(candidate);
  };
  std::vector<std::optional<steps::Font>> allFonts = {std::nullopt};
  allFonts.insert(allFonts.end(), fonts.begin(), fonts.end());
  addInFont({});  // the caption of the host
  for (const auto& font : allFonts) {
    if (isTitle) {
      add("title", plain, {true, plain}, font);
      continue;
    }
    if (const auto markdown = asMarkdown(plain)) add("text", *markdown, {true, plain}, font);
  }
  for (const auto& font : allFonts) {
    const auto markdown = isTitle ? std::nullopt : asMarkdown(text);
    if (markdown) add("text", *markdown, steps::readMarkdown(*markdown), font);
  }
  for (const std::string& fragment : fragments_) {
    for (const auto& font : allFonts)
      add("html", fragment, {false, steps::inAscii(fragment)}, font);
  }
  for (const auto& font : allFonts) {
    const std::string html = asHtml(text, font ? *font : steps::Font{"Helvetica", 12});
    add("html", html, {false, html}, font);
  }
}

}  // namespace qz::tools::lift
