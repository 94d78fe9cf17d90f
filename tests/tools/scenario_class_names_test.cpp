// SPDX-License-Identifier: MIT
// Class names on a toolkit with its own names.
#include <gtest/gtest.h>

#include <string>

#include "tools/drivers.hpp"
#include "tools/scenario/class_names.hpp"

namespace tools::scenario {
namespace {

using toolkit::Rect;
using toolkit::Ref;
using toolkit::View;
using toolkit::ViewKind;
using toolkit::Window;

/// A driver of the memory toolkit with other class names.
class ForeignDriver final : public toolkit::TestDriver {
 public:
  std::string_view name() const override { return "foreign"; }
  toolkit::Toolkit& toolkit() override { return driver_->toolkit(); }
  Ref<Window> makeWindow(const Rect& content) override { return driver_->makeWindow(content); }
  Ref<View> makeView(ViewKind kind, toolkit::Tag tag, const Rect& frame,
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
  toolkit::ViewPicture look(const Ref<View>& view) override { return driver_->look(view); }
  toolkit::WindowPicture look(const Ref<Window>& window) override { return driver_->look(window); }
  void setLogSink(std::function<void(std::string_view)> sink) override {
    driver_->setLogSink(std::move(sink));
  }
  // On-off buttons have their own class; texts and images share one.
  std::string_view className(ViewKind kind) const override {
    switch (kind) {
      case ViewKind::button:
        return "PushButton";
      case ViewKind::toggle:
      case ViewKind::mixed:
        return "CheckBox";
      case ViewKind::popUpButton:
        return "ComboBox";
      case ViewKind::textField:
      case ViewKind::imageView:
        return "Label";
      case ViewKind::box:
        return "GroupBox";
      case ViewKind::plain:
        break;
    }
    return "Widget";
  }

 private:
  std::unique_ptr<toolkit::TestDriver> driver_ = makeDriver("memory");
};

TEST(ScenarioClassNames, standardNamesStandForTheToolkits) {
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

TEST(ScenarioClassNames, alsoWithinJson) {
  const ForeignDriver driver;
  const ClassNames names(driver);
  EXPECT_EQ(names.unifiedTexts(Json::parse(R"({"1": ["NSButton", 2]})")),
            names.unifiedTexts(Json::parse(R"({"1": ["PushButton", 2]})")));
  EXPECT_NE(names.unifiedTexts(Json::parse(R"(["NSButton"])")),
            names.unifiedTexts(Json::parse(R"(["Label"])")));
}

TEST(ScenarioClassNames, onAToolkitWithTheStandardNamesNothingChanges) {
  const auto driver = makeDriver("memory");
  const ClassNames names(*driver);
  EXPECT_EQ(names.unified("NSButton, PushButton: NSView"), "NSButton, PushButton: NSView");
}

}  // namespace
}  // namespace tools::scenario
