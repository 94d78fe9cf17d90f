// SPDX-License-Identifier: MIT
// The exact documents that the HTML commands pass to the toolkit's reader.

#include <gtest/gtest.h>

#include <optional>
#include <string>
#include <string_view>

#include "qz/engine.hpp"
#include "qz/toolkit/memory/memory_toolkit.hpp"

namespace qz {

namespace {

using Engine = QZ_Plist_State_Parser;
using toolkit::Number;
using toolkit::String;

/// The memory toolkit with another reader of HTML, which stores the document and returns `text`.
struct DocumentKeeper final : toolkit::Toolkit {
  DocumentKeeper() {
    memory.log().setSink([](std::string_view) {});
  }

  toolkit::memory::MemoryToolkit memory;
  std::string document;
  std::optional<toolkit::AttributedString> text = toolkit::AttributedString("read");

  toolkit::Application& application() override { return memory.application(); }
  toolkit::RunLoop& runLoop() override { return memory.runLoop(); }
  toolkit::Images& images() override { return memory.images(); }
  toolkit::Fonts& fonts() override { return memory.fonts(); }
  toolkit::Files& files() override { return memory.files(); }
  toolkit::Log& log() override { return memory.log(); }
  std::optional<toolkit::AttributedString> attributedStringWithHTML(
      std::string_view bytes) override {
    document = bytes;
    return text;
  }
};

const std::string head =
    "<!DOCTYPE HTML PUBLIC \"-//W3C//DTD HTML 4.01 Transitional//EN\" "
    "\"http://www.w3.org/TR/html4/loose.dtd\"><html><head><meta http-equiv=\"Content-type\" "
    "content=\"text/html; charset=iso-8859-1\"></head>";
const std::string plain = head + "<body bgcolor=\"#000000\">";
const std::string twoBlanks =
    head + "<body bgcolor=\"#000000\" link=\"#00e5ff\"  vlink=\"#00e5ff\">";
const std::string oneBlank = head + "<body bgcolor=\"#000000\" link=\"#00e5ff\" vlink=\"#00e5ff\">";
const std::string tail = "</body></html>";

class HtmlDocuments : public testing::Test {
 protected:
  DocumentKeeper keeper;
  std::shared_ptr<Engine> engine = Engine::init(keeper);
  const Engine::Value b = String::make("b");
  const Engine::Value font = String::make("Times");
  const Engine::ObjectId number = Number::withLong(12);
};

TEST_F(HtmlDocuments, AreTheFragmentBetweenFixedTexts) {
  EXPECT_TRUE(
      engine->QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML(b, font, number, number));
  EXPECT_EQ(keeper.document, plain + "b" + tail);
  EXPECT_TRUE(
      engine->QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_IS(false, b, font, number, number));
  EXPECT_EQ(keeper.document, plain + "b" + tail);
  EXPECT_TRUE(
      engine->QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_IS(true, b, font, number, number));
  EXPECT_EQ(keeper.document, twoBlanks + "b" + tail);
  EXPECT_TRUE(engine->QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER(
      b, font, number, number));
  EXPECT_EQ(keeper.document, oneBlank + "b" + tail);
}

// A toolkit's reader may fail to read a document, even one of ASCII characters only.
TEST_F(HtmlDocuments, ThatTheReaderMakesNothingOfFailWithoutALogLine) {
  int lines = 0;
  keeper.memory.log().setSink([&](std::string_view) { ++lines; });
  keeper.text = std::nullopt;
  EXPECT_FALSE(
      engine->QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML(b, font, number, number));
  EXPECT_EQ(keeper.document, plain + "b" + tail);
  EXPECT_FALSE(
      engine->QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_IS(true, b, font, number, number));
  EXPECT_FALSE(engine->QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER(
      b, font, number, number));
  EXPECT_EQ(keeper.document, oneBlank + "b" + tail);
  EXPECT_EQ(lines, 0);
}

TEST_F(HtmlDocuments, OfAnAbsentFragmentSayWhatFormatsPrintForNothing) {
  EXPECT_TRUE(
      engine->QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML({}, font, number, number));
  EXPECT_EQ(keeper.document, plain + "(null)" + tail);
}

}  // namespace

}  // namespace qz
