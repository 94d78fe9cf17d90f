// SPDX-License-Identifier: MIT
// The words in which the transcript describes how a text looks.
#include <gtest/gtest.h>

#include "qz/drivers/view_kinds.hpp"
#include "tools/play/words.hpp"

namespace qz::tools::play {
namespace {

using toolkit::ParagraphStyle;
using toolkit::TextAlignment;
using toolkit::TextAttributes;

TEST(PlayWords, NameEveryAlignmentThatAnAuthorChose) {
  const struct {
    TextAlignment alignment;
    const char* words;
  } cases[] = {
      {TextAlignment::left, "left"},      {TextAlignment::right, "right"},
      {TextAlignment::center, "centred"}, {TextAlignment::justified, "justified"},
      {TextAlignment::natural, "plain"},
  };
  for (const auto& test : cases) {
    const TextAttributes attributes{.paragraphStyle = ParagraphStyle{.alignment = test.alignment}};
    EXPECT_EQ(styleWords(attributes), test.words);
  }
}

TEST(PlayWords, NameEveryKindOfControl) {
  using drivers::ViewKind;
  const struct {
    drivers::ViewKind kind;
    const char* word;
  } cases[] = {
      {drivers::ViewKind::button, "button"},
      {drivers::ViewKind::toggle, "check box"},
      {drivers::ViewKind::mixed, "mixed check box"},
      {drivers::ViewKind::popUpButton, "pop-up button"},
      {drivers::ViewKind::textField, "text field"},
      {drivers::ViewKind::imageView, "image"},
      {drivers::ViewKind::box, "box"},
      {drivers::ViewKind::plain, "view"},
  };
  for (const auto& test : cases) EXPECT_EQ(drivers::rowOf(test.kind).word, test.word);
}

TEST(PlayWords, NameWhatDiffersFromPlainText) {
  const struct {
    TextAttributes attributes;
    const char* words;
  } cases[] = {
      {{}, "plain"},
      {{.superscript = 2}, "raised"},
      {{.superscript = -1}, "lowered"},
      {{.backgroundColor = toolkit::colors::red, .strikethrough = true}, "on red, struck through"},
      {{.link = "x:y", .underline = true, .superscript = 1}, "underlined, raised, link to “x:y”"},
  };
  for (const auto& test : cases) EXPECT_EQ(styleWords(test.attributes), test.words);
}

}  // namespace
}  // namespace qz::tools::play
