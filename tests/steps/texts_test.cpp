// SPDX-License-Identifier: MIT
// The texts of a source for translators, and files of translations.

#include <gtest/gtest.h>

#include "tests/steps/source_folder.hpp"
#include "tools/steps/po.hpp"

namespace qz::tools::steps {
namespace {

TEST(Texts, AreFoundOnceWithAllTheirUses) {
  const SourceFolder folder;
  folder.writeSource(
      "every step: {next: {title: Next}}\n"
      "steps:\n"
      "  a: {text: Hello, picture: sea, next: {press: b, tooltip: Go on}}\n"
      "  b: {text: {html: <b>Bye</b>}, next: {title: Hello, press: end}, picture: sea}\n");
  const Source source = readSource("tour.yaml");
  std::vector<std::string> found;
  for (const Text& text : source.texts) {
    std::string line = text.text + ":";
    for (const TextUse& use : text.uses) {
      line += " " + use.step + "/" + use.control + "/" + use.property;
    }
    found.push_back(line);
  }
  EXPECT_EQ(found, (std::vector<std::string>{"Next: every step/next/title",
                                             "Hello: a/text/text b/next/title",
                                             "Go on: a/next/tooltip", "<b>Bye</b>: b/text/html"}));
}

TEST(Texts, AreTranslatedWhereThereIsATranslation) {
  const SourceFolder folder;
  folder.writeSource("steps: {a: {text: Hello, next: {title: Bye, press: end}}}");
  const Source source = readSource("tour.yaml", [](const std::string& text) {
    return text == "Hello" ? Translation{.text = "Grüße"} : Translation{};
  });
  EXPECT_EQ(source.tour.steps[0].words.controls[0].content->text, "Grüße");
  EXPECT_EQ(source.tour.steps[0].words.controls[3].content->text, "Bye");
  EXPECT_TRUE(source.texts[0].translation->text);
  EXPECT_FALSE(source.texts[1].translation->text);
}

TEST(Texts, CanBeMadeLonger) {
  EXPECT_EQ(lengthened("Next"), "Next ö");
  EXPECT_EQ(lengthened(""), "");
}

TEST(Po, ATemplateIsReadBack) {
  const std::vector<PoEntry> entries = {
      {.text = "Say \"hi\"\n\tand \\ go",
       .comments = {"step a: text of text"},
       .references = {"t.yaml:3"}},
      {.text = "ü"},
  };
  const auto read = readPo(writePoTemplate(entries, "tour"), "tour.pot");
  ASSERT_EQ(read.size(), 2U);
  EXPECT_EQ(read[0].text, entries[0].text);
  EXPECT_EQ(read[0].translation, "");
  EXPECT_EQ(read[1].text, "ü");
}

TEST(Po, ReadsWhatEditorsWrite) {
  const auto read = readPo(
      "# A comment\r\nmsgid \"\"\r\nmsgstr \"Language: de\\n\"\r\n\r\n"
      "#: tour.yaml:3\n#, fuzzy\n#| msgid \"Old\"\nmsgid \"One\"\nmsgstr \"Eins\"\n"
      "msgid \"\"\n\"Two \"\n\"lines\"\nmsgstr \"\"\n\"Zwei \"\n\"Zeilen\"\n"
      "#~ msgid \"Gone\"\n#~ msgstr \"Weg\"\n",
      "de.po");
  ASSERT_EQ(read.size(), 2U);
  EXPECT_EQ(read[0].translation, "Eins");
  EXPECT_TRUE(read[0].isFuzzy);
  EXPECT_EQ(read[1].text, "Two lines");
  EXPECT_EQ(read[1].translation, "Zwei Zeilen");
  EXPECT_FALSE(read[1].isFuzzy);
}

TEST(Po, SaysWhereAFileIsWrong) {
  const auto refusal = [](const std::string& text) -> std::string {
    try {
      readPo(text, "de.po");
    } catch (const Failure& failure) {
      return failure.what();
    }
    return "";
  };
  EXPECT_EQ(refusal("msgid \"a\"\nmsgstr b\n"), "de.po:2: expected a text in quotes, found “b”");
  EXPECT_EQ(refusal("hello\n"),
            "de.po:1: expected “msgid”, “msgstr”, a text in quotes or a comment, found “hello”");
  EXPECT_EQ(refusal("\"a\"\n"), "de.po:1: expected “msgid” before a text, found “\"a\"”");
  EXPECT_EQ(refusal("msgid \"a\\q\"\n"),
            "de.po:1: expected \\n, \\t, \\r, \\\" or \\\\, found “\\q”");
}

}  // namespace
}  // namespace qz::tools::steps
