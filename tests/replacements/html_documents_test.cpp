// The documents that the HTML commands hand to the toolkit's reader, to the letter. This program
// brings a reader of its own, which the linker takes in the toolkit's place.

#include <gtest/gtest.h>

#include <optional>
#include <string>
#include <string_view>

#include "QZ_Plist_State_Parser.hpp"
#include "toolkit/memory/memory_driver.hpp"
#include "toolkit/styled_text/html_reader.hpp"

namespace {

std::string document;  // what was handed over last

}  // namespace

namespace toolkit {

std::optional<AttributedString> attributedStringFromHTML(std::string_view bytes, const Fonts&) {
  document = bytes;
  return AttributedString("read");
}

}  // namespace toolkit

namespace {

using Engine = QZ_Plist_State_Parser;
using toolkit::Number;
using toolkit::String;

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
  toolkit::memory::MemoryDriver driver;
  std::shared_ptr<Engine> engine = Engine::init(driver.toolkit());
  const Engine::Value b = String::make("b");
  const Engine::Value font = String::make("Times");
  const Engine::ObjectId number = Number::withLong(12);
};

TEST_F(HtmlDocuments, AreTheFragmentBetweenFixedTexts) {
  EXPECT_TRUE(
      engine->QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML(b, font, number, number));
  EXPECT_EQ(document, plain + "b" + tail);
  EXPECT_TRUE(
      engine->QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_IS(false, b, font, number, number));
  EXPECT_EQ(document, plain + "b" + tail);
  EXPECT_TRUE(
      engine->QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_IS(true, b, font, number, number));
  EXPECT_EQ(document, twoBlanks + "b" + tail);
  EXPECT_TRUE(engine->QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER(
      b, font, number, number));
  EXPECT_EQ(document, oneBlank + "b" + tail);
}

TEST_F(HtmlDocuments, OfAnAbsentFragmentSayWhatFormatsPrintForNothing) {
  EXPECT_TRUE(
      engine->QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML({}, font, number, number));
  EXPECT_EQ(document, plain + "(null)" + tail);
}

}  // namespace
