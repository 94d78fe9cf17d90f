// SPDX-License-Identifier: MIT
// Styled text from HTML: a fragment of the script within one of three fixed documents.

#include "engine/state.hpp"
#include "engine/text_of.hpp"
#include "text/ascii.hpp"

namespace qz {

namespace {

// The exact text of the documents matters. Two differ by one blank before `vlink`, on purpose.
#define DOCUMENT_HEAD                                                                       \
  "<!DOCTYPE HTML PUBLIC \"-//W3C//DTD HTML 4.01 Transitional//EN\" "                       \
  "\"http://www.w3.org/TR/html4/loose.dtd\"><html><head><meta http-equiv=\"Content-type\" " \
  "content=\"text/html; charset=iso-8859-1\"></head>"

constexpr std::string_view linkedTwoBlanks =
    DOCUMENT_HEAD "<body bgcolor=\"#000000\" link=\"#00e5ff\"  vlink=\"#00e5ff\">";
constexpr std::string_view linkedOneBlank =
    DOCUMENT_HEAD "<body bgcolor=\"#000000\" link=\"#00e5ff\" vlink=\"#00e5ff\">";
constexpr std::string_view plain = DOCUMENT_HEAD "<body bgcolor=\"#000000\">";
#undef DOCUMENT_HEAD

static_assert(linkedTwoBlanks.size() == 249 && linkedOneBlank.size() == 248 && plain.size() == 217);

// Absent if the fragment has characters beyond ASCII (they must be written as references), or if it
// cannot be read.
std::optional<toolkit::AttributedString> read(std::string_view documentHead,
                                              const std::string& fragment,
                                              toolkit::Toolkit& toolkit) {
  const auto document = text::asciiBytes(std::string(documentHead) + fragment + "</body></html>");
  return document ? toolkit.attributedStringWithHTML(*document) : std::nullopt;
}

void setStyle(toolkit::AttributedString& text, toolkit::TextAlignment alignment,
              const toolkit::Fonts& fonts, const toolkit::ValueRef<>& fontName, float points) {
  const toolkit::TextRange all{0, text.length()};
  text.beginEditing();
  text.addParagraphStyle(toolkit::ParagraphStyle{.alignment = alignment}, all);
  text.addFont(fonts.fontWithName(textOf(fontName), static_cast<double>(points)), all);
  text.endEditing();
}

void show(const toolkit::AttributedString& text, const toolkit::Ref<toolkit::View>& control) {
  if (const auto button = toolkit::asButton(control)) {
    button->setAttributedTitle(text);
  } else {
    control->setAttributedStringValue(text);
  }
}

}  // namespace

bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML(
    Value html, Value WITH_FONT_NAME, Value WITH_SIZE, ObjectId FOR_OBJECT_ID) {
  if (const auto other = state_->overridden("QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_"
                                            "HTML:WITH_FONT_NAME:WITH_SIZE:FOR_OBJECT_ID:",
                                            html, WITH_FONT_NAME, WITH_SIZE, FOR_OBJECT_ID)) {
    return other->yes;
  }
  return QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_IS(
      false, std::move(html), std::move(WITH_FONT_NAME), std::move(WITH_SIZE),
      std::move(FOR_OBJECT_ID));
}

bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER(
    Value html, Value WITH_FONT_NAME, Value WITH_SIZE, ObjectId FOR_OBJECT_ID) {
  if (const auto other =
          state_->overridden("QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER:"
                             "WITH_FONT_NAME:WITH_SIZE:FOR_OBJECT_ID:",
                             html, WITH_FONT_NAME, WITH_SIZE, FOR_OBJECT_ID)) {
    return other->yes;
  }
  return showHtml(linkedOneBlank, toolkit::TextAlignment::natural, html, WITH_FONT_NAME, WITH_SIZE,
                  FOR_OBJECT_ID);
}

bool QZ_Plist_State_Parser::QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_IS(
    bool asIs, Value WITH_HTML, Value WITH_FONT_NAME, Value WITH_SIZE, ObjectId FOR_OBJECT_ID) {
  if (const auto other =
          state_->overridden("QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_IS:WITH_HTML:WITH_"
                             "FONT_NAME:WITH_SIZE:FOR_OBJECT_ID:",
                             asIs, WITH_HTML, WITH_FONT_NAME, WITH_SIZE, FOR_OBJECT_ID)) {
    return other->yes;
  }
  if (asIs) {
    return showHtml(linkedTwoBlanks, std::nullopt, WITH_HTML, WITH_FONT_NAME, WITH_SIZE,
                    FOR_OBJECT_ID);
  }
  return showHtml(plain, toolkit::TextAlignment::center, WITH_HTML, WITH_FONT_NAME, WITH_SIZE,
                  FOR_OBJECT_ID);
}

// Without `alignment` the HTML keeps its own alignment and fonts.
bool QZ_Plist_State_Parser::showHtml(std::string_view documentHead,
                                     std::optional<toolkit::TextAlignment> alignment,
                                     const Value& html, const Value& fontName, const Value& size,
                                     const ObjectId& id) {
  const auto kept = keepAlive();
  const Control control = findObjectWithTag(id->longValue());
  const auto points = static_cast<float>(size->intValue());  // whole points; read even if not used
  // An absent fragment reads as the text that the system's formats print for an absent object.
  const std::string fragment = html ? html->description() : "(null)";
  auto text = read(documentHead, fragment, state_->toolkit);
  if (!text) return false;
  try {
    if (alignment) setStyle(*text, *alignment, state_->toolkit.fonts(), fontName, points);
    show(*text, control);
    return true;
  } catch (const toolkit::Exception&) {
    // Every exception is reported, on purpose. A range exception was meant to count as success, but
    // the test compares the exception's class with that of the *name* (a string) of the range
    // exception, and never matches.
    state_->toolkit.log().write("Couldn't set attributed string of HTML:" + fragment +
                                " to object.");
    return false;
  }
}

}  // namespace qz
