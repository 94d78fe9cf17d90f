// SPDX-License-Identifier: MIT
// Class names on a toolkit with its own names.
#include <gtest/gtest.h>

#include <string>

#include "tools/scenario/class_names.hpp"
#include "tools/support/drivers.hpp"

namespace qz::tools::scenario {
namespace {

using drivers::ViewKind;
using toolkit::Rect;
using toolkit::Ref;
using toolkit::View;
using toolkit::Window;

/// A driver of the memory toolkit with other class names.
class ForeignDriver final : public drivers::Driver {
 public:
  std::string_view name() const override { return "foreign"; }
  toolkit::Toolkit& toolkit() override { return driver_->toolkit(); }
  Ref<Window> makeWindow(const Rect& content) override { return driver_->makeWindow(content); }
  Ref<View> makeView(drivers::ViewKind kind, toolkit::Tag tag, const Rect& frame,
                     const Ref<View>& in) override {
    return driver_->makeView(kind, tag, frame, in);
  }
  void removeFromSuperview(const Ref<View>& view) override { driver_->removeFromSuperview(view); }
  void setFrame(const Ref<View>& view, const Rect& frame) override {
    driver_->setFrame(view, frame);
  }
  void setCaption(const Ref<View>& view, std::string_view text) override {
    driver_->setCaption(view, text);
  }
  void setResourcePath(std::string_view path) override { driver_->setResourcePath(path); }
  void click(const Ref<View>& view) override { driver_->click(view); }
  void hold(const Ref<View>& view) override { driver_->hold(view); }
  void letGo() override { driver_->letGo(); }
  void advance(double seconds) override { driver_->advance(seconds); }
  drivers::ViewPicture look(const Ref<View>& view) override { return driver_->look(view); }
  drivers::WindowPicture look(const Ref<Window>& window) override { return driver_->look(window); }
  void setLogSink(std::function<void(std::string_view)> sink) override {
    driver_->setLogSink(std::move(sink));
  }
  // On-off buttons have their own class; texts and images share one.
  std::string_view className(drivers::ViewKind kind) const override {
    switch (kind) {
      case drivers::ViewKind::button:
        return "PushButton";
      case drivers::ViewKind::toggle:
      case drivers::ViewKind::mixed:
        return "CheckBox";
      case drivers::ViewKind::popUpButton:
        return "ComboBox";
      case drivers::ViewKind::textField:
      case drivers::ViewKind::imageView:
        return "Label";
      case drivers::ViewKind::box:
        return "GroupBox";
      default:
        break;
    }
    return "Widget";
  }

 private:
  std::unique_ptr<drivers::Driver> driver_ = makeDriver("memory");
};

TEST(ScenarioClassNames, StandardNamesStandForTheToolkits) {
  const ForeignDriver driver;
  const ClassNames names(driver);
  const struct {
    const char* expected;
    const char* got;
    bool same;
  } cases[] = {
      {"NSButton", "PushButton", true},
      {"NSButton", "CheckBox", true},
      {"NSButton", "ComboBox", false},
      {"NSPopUpButton", "ComboBox", true},
      {"NSTextField", "Label", true},
      {"NSImageView", "Label", true},
      {"NSTextField", "PushButton", false},
      {"NSView", "Widget", true},
      {"PushButton", "PushButton", true},
      {"for object: NSButton using", "for object: PushButton using", true},
      {"-[NSTextField setX:]: no", "-[Label setX:]: no", true},
      {"NSButtonCell", "PushButtonCell", false},
      {"MyNSButton", "MyPushButton", false},
      {"a NSButton", "a  PushButton", false},
      {"", "", true},
  };
  for (const auto& test : cases) {
    EXPECT_EQ(names.unified(test.expected) == names.unified(test.got), test.same)
        << test.expected << " | " << test.got;
  }
}

TEST(ScenarioClassNames, AlsoWithinJson) {
  const ForeignDriver driver;
  const ClassNames names(driver);
  EXPECT_EQ(names.unifiedTexts(Json::parse(R"({"1": ["NSButton", 2]})")),
            names.unifiedTexts(Json::parse(R"({"1": ["PushButton", 2]})")));
  EXPECT_NE(names.unifiedTexts(Json::parse(R"(["NSButton"])")),
            names.unifiedTexts(Json::parse(R"(["Label"])")));
}

TEST(ScenarioClassNames, OnAToolkitWithTheStandardNamesNothingChanges) {
  const auto driver = makeDriver("memory");
  const ClassNames names(*driver);
  EXPECT_EQ(names.unified("NSButton, PushButton: NSView"), "NSButton, PushButton: NSView");
}

}  // namespace
}  // namespace qz::tools::scenario
