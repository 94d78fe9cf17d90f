// SPDX-License-Identifier: MIT
// The words in which the transcript describes how a text looks.
#include <gtest/gtest.h>

#include "tools/play/words.hpp"

namespace tools::play {
namespace {

using toolkit::ParagraphStyle;
using toolkit::TextAlignment;
using toolkit::TextAttributes;

TEST(PlayWords, nameEveryAlignmentThatAnAuthorChose) {
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

TEST(PlayWords, nameEveryKindOfControl) {
  using toolkit::ViewKind;
  const struct {
    ViewKind kind;
    const char* word;
  } cases[] = {
      {ViewKind::button, "button"},
      {ViewKind::toggle, "check box"},
      {ViewKind::mixed, "mixed check box"},
      {ViewKind::popUpButton, "pop-up button"},
      {ViewKind::textField, "text field"},
      {ViewKind::imageView, "image"},
      {ViewKind::box, "box"},
      {ViewKind::plain, "view"},
  };
  for (const auto& test : cases) EXPECT_EQ(kindWord(test.kind), test.word);
}

TEST(PlayWords, nameWhatDiffersFromPlainText) {
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
}  // namespace tools::play
