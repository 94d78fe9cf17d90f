// SPDX-License-Identifier: MIT
// Commands on controls that misbehave: that store another text than the one given, or raise. Also
// which controls the commands ask whether they need a redraw.

#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <stdexcept>
#include <string>
#include <vector>

#include "drivers/memory/memory_driver.hpp"
#include "qz/engine.hpp"
#include "tests/engine/fakes.hpp"

namespace qz {

namespace {

using toolkit::AttributedString;
using toolkit::Number;

constexpr toolkit::Tag unrulyTag = 7;

/// A control that keeps only the first letter of a plain text, and calls the test for styled text.
class Unruly final : public fakes::FakeRole<toolkit::View> {
 public:
  Unruly() : FakeRole(unrulyTag) {}

  std::string stringValue() const override { return text; }
  void setStringValue(std::string_view value) override { text = value.substr(0, 1); }
  void setAttributedStringValue(const AttributedString& value) override {
    text = value.string();
    onStyled();
  }
  std::optional<AttributedString> attributedTitle() const override {
    return AttributedString("title");
  }
  void setAttributedTitle(const AttributedString&) override { onStyled(); }
  void highlight(bool) override {}

  std::string text;
  std::function<void()> onStyled = [] {};
};

/// An image view that ignores its image.
class Blank final : public fakes::FakeRole<toolkit::ImageView> {
 public:
  Blank() : FakeRole(unrulyTag) {}

  void setTarget(const std::shared_ptr<toolkit::Responder>&) override {}
  void setAction(std::string_view) override {}
  bool sendAction(std::string_view, const std::shared_ptr<toolkit::Responder>&) override {
    return false;
  }
  std::string stringValue() const override { return {}; }
  void setStringValue(std::string_view) override {}
  void setAttributedStringValue(const AttributedString&) override {}
  void setImage(const toolkit::Ref<toolkit::Image>&) override {}
  void setImageFrameStyle(toolkit::ImageFrameStyle) override {}
  void setImageScaling(toolkit::ImageScaling) override {}
  void setImageAlignment(toolkit::ImageAlignment) override {}
};

class MisbehavingControls : public testing::Test {
 protected:
  MisbehavingControls() {
    driver.setLogSink([this](std::string_view line) { log.emplace_back(line); });
    engine->setTutorialWindow(fakes::windowWith(control));
  }

  bool setText(const char* text) {
    return engine->QZ_Plist_State_Processor_SET_TEXT(toolkit::String::make(text),
                                                     Number::withLong(unrulyTag));
  }
  bool setHtml(const char* html) {
    return engine->QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML(
        toolkit::String::make(html), toolkit::String::make("Times"), Number::withLong(12),
        Number::withLong(unrulyTag));
  }
  bool setColor() {
    return engine->QZ_Plist_State_Processor_SET_FOREGROUND_COLOR(toolkit::String::make("red"),
                                                                 Number::withLong(unrulyTag));
  }

  std::vector<std::string> log;
  drivers::MemoryDriver driver;
  std::shared_ptr<Unruly> control = std::make_shared<Unruly>();
  std::shared_ptr<QZ_Plist_State_Parser> engine = QZ_Plist_State_Parser::init(driver.toolkit());
};

TEST_F(MisbehavingControls, ATextThatReadsBackDifferentlyIsSetButNoSuccess) {
  EXPECT_FALSE(setText("Next"));
  EXPECT_EQ(control->text, "N");
  EXPECT_TRUE(setText("B"));
  EXPECT_TRUE(log.empty());
}

// Including range exceptions, although they were once meant to count as success.
TEST_F(MisbehavingControls, WhatAControlRaisesOverStyledTextIsLogged) {
  const std::vector<std::function<void()>> raises = {
      [] { throw toolkit::RangeException("beyond"); },
      [] { throw toolkit::InvalidArgumentException("absent"); },
      [] { throw toolkit::Exception("Custom", "custom"); },
  };
  for (const auto& raise : raises) {
    control->onStyled = raise;
    log.clear();
    EXPECT_FALSE(setHtml("<b>x</b>"));
    EXPECT_EQ(log, std::vector<std::string>{
                       "Couldn't set attributed string of HTML:<b>x</b> to object."});
    log.clear();
    EXPECT_FALSE(setColor());
    EXPECT_EQ(log, std::vector<std::string>{"Unable to set the foreground color"});
  }
}

TEST_F(MisbehavingControls, WhatWasSetBeforeTheExceptionStays) {
  control->onStyled = [] { throw toolkit::RangeException("beyond"); };
  EXPECT_FALSE(setHtml("late"));
  EXPECT_EQ(control->text, "late");
}

TEST_F(MisbehavingControls, OnlyTheToolkitsExceptionsAreCaught) {
  control->onStyled = [] { throw std::runtime_error("not the toolkit's"); };
  EXPECT_THROW(setHtml("x"), std::runtime_error);
  EXPECT_THROW(setColor(), std::runtime_error);
  EXPECT_TRUE(log.empty());
}

// The answer changes nothing; that the commands ask is part of their behaviour.
TEST_F(MisbehavingControls, SomeCommandsAskWhetherARedrawIsPending) {
  const std::vector<std::string> once = {"needsDisplay"};
  const auto id = Number::withLong(unrulyTag);
  const auto image = std::make_shared<Blank>();
  EXPECT_TRUE(engine->QZ_Plist_State_Processor_SET_TOOL_TIP(
      toolkit::Array::make({toolkit::String::make("tip")}), id));
  EXPECT_EQ(control->calls, (std::vector<std::string>{"tooltip", "needsDisplay"}));
  engine->setFlashingTagIds(toolkit::Dictionary::make());
  EXPECT_TRUE(engine->QZ_Plist_State_Processor_FLASH_ID(id, false));
  EXPECT_EQ(control->calls.size(), 3U);
  EXPECT_FALSE(engine->QZ_Plist_State_Processor_FLASH_ID(id, false));
  EXPECT_EQ(control->calls.size(), 3U);
  engine->setTutorialWindow(fakes::windowWith(image));
  EXPECT_TRUE(engine->QZ_Plist_State_Processor_LOAD_GRAPHIC_OBJECT_WITH_PATH(
      toolkit::Array::make({toolkit::String::make("no such image"), id}), id));
  EXPECT_EQ(image->calls, once);
}

}  // namespace

}  // namespace qz
