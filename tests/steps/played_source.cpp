// SPDX-License-Identifier: MIT
// Plays built sources, and looks at them.
#include "tests/steps/played_source.hpp"

#include <sstream>

#include "tools/walkthrough/possible_steps.hpp"

namespace qz::meaning {

using tools::walkthrough::ControlPicture;
using tools::walkthrough::StepPicture;

namespace {

const toolkit::AttributedString& captionOf(const ControlPicture& control) {
  return drivers::isButton(control.view.kind) ? control.view.title : control.view.text;
}

std::string fontWords(const toolkit::Font& font) {
  std::ostringstream out;
  out << font.family << ' ' << font.size;
  return out.str();
}

/// The name of a font in a source, as the family and size that it means.
std::string familyAndSize(const std::string& said) {
  const auto blank = said.rfind(' ');
  const auto style = said.find('-');
  return said.substr(0, std::min(style, blank)) + said.substr(blank);
}

bool hasStyle(const std::string& font, const char* style) {
  return font.find(style) != std::string::npos;
}

Reading readingOf(const ControlPicture& control) {
  Reading reading;
  if (control.view.image) append(reading, {*control.view.image});
  const auto& caption = captionOf(control);
  for (const auto& run : caption.runs()) {
    const auto& font = run.attributes.font;
    const auto& link = run.attributes.link;
    append(reading, {caption.string().substr(run.range.location, run.range.length),
                     font && font->bold, font && font->italic, link ? link->address() : ""});
  }
  return reading;
}

// "Styled text that is centred is a block, which ends with a line break."
void dropLineBreak(Reading& reading) {
  if (reading.empty() || !reading.back().text.ends_with('\n')) return;
  reading.back().text.pop_back();
  if (reading.back().text.empty()) reading.pop_back();
}

/// The font of the whole text; absent if no part of it has one.
std::optional<std::string> fontOf(const ControlPicture& control) {
  std::set<std::string> fonts;
  for (const auto& run : captionOf(control).runs()) {
    fonts.insert(run.attributes.font ? fontWords(*run.attributes.font) : "");
  }
  if (fonts == std::set<std::string>{""}) return std::nullopt;
  return fonts.size() == 1 ? *fonts.begin() : "several";
}

bool isCentered(const ControlPicture& control) {
  for (const auto& run : captionOf(control).runs()) {
    const auto& style = run.attributes.paragraphStyle;
    if (!style || style->alignment != toolkit::TextAlignment::center) return false;
  }
  return !captionOf(control).runs().empty();
}

std::string colorOf(const ControlPicture& control) {
  constexpr std::pair<const char*, toolkit::Color> colors[] = {
      {"red", toolkit::colors::red},     {"white", toolkit::colors::white},
      {"blue", toolkit::colors::blue},   {"green", toolkit::colors::green},
      {"black", toolkit::colors::black}, {"orange", toolkit::colors::orange},
      {"gray", toolkit::colors::gray}};
  std::string found;
  for (const auto& run : captionOf(control).runs()) {
    for (const auto& [name, color] : colors) {
      if (run.attributes.foregroundColor == color) found += found == name ? "" : name;
    }
  }
  return found;
}

ControlLook seen(const ControlPicture& control, const ControlLook& expected, bool flashingAllowed) {
  ControlLook look = expected;
  look.state = control.view.state;
  look.isShown = !control.view.hidden;
  if (!look.isShown && !expected.isShown) return look;  // nobody sees the rest
  look.reading = readingOf(control);
  if (expected.isCentered) dropLineBreak(look.reading);
  const bool isEmpty = captionOf(control).string().empty();  // and so has neither font nor color
  look.font = isEmpty ? expected.font : fontOf(control);
  look.isCentered = isEmpty ? expected.isCentered : isCentered(control);
  look.toolTip = control.view.toolTip;
  look.color = !drivers::isButton(control.view.kind) || isEmpty ? expected.color : colorOf(control);
  look.isRed = control.view.background == toolkit::colors::red;
  look.isEnabled = control.view.enabled;
  look.isFlashing = (control.flashing && flashingAllowed) ||
                    control.view.highlighted;  // no button stays pressed in
  return look;
}

std::ostream& operator<<(std::ostream& out, const Reading& reading) {
  for (const Span& span : reading) {
    out << (span.isBold ? "bold " : "") << (span.isItalic ? "italic " : "") << "“" << span.text
        << "”" << (span.link.empty() ? "" : " to " + span.link) << " ";
  }
  return out;
}

std::string words(const ControlLook& look) {
  std::ostringstream out;
  out << look.reading << (look.font ? ", font " + *look.font : "")
      << (look.isCentered ? ", centered" : "") << ", tooltip “" << look.toolTip << "”, color “"
      << look.color << "”" << (look.isRed ? ", red" : "") << ", state "
      << static_cast<int>(look.state) << (look.isShown ? ", shown" : ", hidden")
      << (look.isEnabled ? ", enabled" : ", disabled") << (look.isFlashing ? ", flashing" : "");
  return out.str();
}

/// What the interpreter expects, with the font in the terms of the toolkit.
ControlLook inTheSameTerms(ControlLook look) {
  if (!look.font) return look;
  for (Span& span : look.reading) {
    span.isBold |= hasStyle(*look.font, "-Bold");
    span.isItalic |= hasStyle(*look.font, "-Italic");
  }
  Reading joined;
  for (const Span& span : look.reading) append(joined, span);
  look.reading = joined;
  look.font = familyAndSize(*look.font);
  return look;
}

}  // namespace

Play::Play(const PlayableSource& source) {
  driver_.setResourcePath(source.folder);
  stage_ = std::make_unique<tools::walkthrough::Stage>(driver_, source.plan);
  stage_->start(source.script, source.startKey);
}

StepPicture Play::picture() {
  return tools::walkthrough::takePicture(driver_, stage_->engine(), stage_->title());
}

void Play::click(std::size_t control) {
  driver_.click(stage_->engine().tutorialWindow()->contentView()->subviews().at(control));
}

Look seen(const StepPicture& picture, const Look& expected) {
  Look look;
  for (std::size_t i = 0; i < picture.controls.size() && i < expected.controls.size(); ++i) {
    look.controls.push_back(
        seen(picture.controls[i], inTheSameTerms(expected.controls[i]), picture.flashingAllowed));
  }
  if (picture.window) look.background = picture.window->layerImage.value_or("");
  return look;
}

std::string everythingSeen(const StepPicture& picture) {
  std::ostringstream out;
  for (const ControlPicture& control : picture.controls) {
    if (control.view.hidden) continue;
    const auto& caption = captionOf(control);
    out << caption.string() << '\n';
    for (const auto& run : caption.runs()) {
      const auto& attributes = run.attributes;
      out << run.range.length << (attributes.font ? fontWords(*attributes.font) : "")
          << attributes.underline << attributes.strikethrough << attributes.superscript;
      for (const auto& color : {attributes.foregroundColor, attributes.backgroundColor}) {
        if (color) out << ' ' << color->red << ' ' << color->green << ' ' << color->blue;
      }
      const auto& style = attributes.paragraphStyle;
      if (style) out << "align " << static_cast<int>(style->alignment) << ' ' << style->headIndent;
      out << '\n';
    }
  }
  return out.str();
}

std::string everythingKept(const StepPicture& picture) {
  std::ostringstream out;
  out << everythingSeen(picture) << picture.ended << picture.flashingAllowed;
  for (const ControlPicture& control : picture.controls) {
    ControlLook look = seen(control, {}, false);
    look.isFlashing = control.flashing;  // whatever its phase
    out << '\n' << control.view.tag << control.hasList << control.shadowed << words(look);
  }
  for (const auto& timer : picture.timers) out << '\n' << timer.key << ' ' << timer.timeLeft;
  return out.str();
}

std::string difference(const Look& expected, const Look& seen) {
  if (expected.controls.size() != seen.controls.size()) return "the number of controls";
  for (std::size_t i = 0; i < seen.controls.size(); ++i) {
    const ControlLook look = inTheSameTerms(expected.controls[i]);
    if (look == seen.controls[i]) continue;
    return "control " + std::to_string(i) + "\n  expected: " + words(look) +
           "\n  seen:     " + words(seen.controls[i]);
  }
  if (expected.background == seen.background) return "";
  return "background: expected “" + expected.background + "”, seen “" + seen.background + "”";
}

}  // namespace qz::meaning
