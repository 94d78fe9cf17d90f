// SPDX-License-Identifier: MIT
// Adopting and wiring what no scenario can make: gradients, a host's own button class, windows
// without a content view.

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "drivers/memory/memory_driver.hpp"
#include "qz/engine.hpp"
#include "tests/engine/fakes.hpp"

namespace qz {

namespace {

class ActiveGradient final : public fakes::FakeRole<toolkit::Gradient> {
 public:
  using FakeRole::FakeRole;
  void setAction(std::string_view name) override { action = name; }

  std::string action;
};

/// A host's own button class: a view that is a button, with its own class name.
class HostButton final : public fakes::FakeRole<toolkit::View> {
 public:
  explicit HostButton(toolkit::Ref<toolkit::Button> button)
      : FakeRole(4), button_(std::move(button)) {}
  std::string className() const override { return "HostButton"; }
  toolkit::Button* asButton() override { return button_.pointer().get(); }

 private:
  toolkit::Ref<toolkit::Button> button_;
};

class Wiring : public testing::Test {
 protected:
  Wiring() {
    driver.setLogSink([this](std::string_view line) { log.emplace_back(line); });
  }

  std::vector<std::string> log;
  drivers::MemoryDriver driver;
  std::shared_ptr<QZ_Plist_State_Parser> engine = QZ_Plist_State_Parser::init(driver.toolkit());
};

TEST_F(Wiring, AGradientTakesTheActionLikeAButton) {
  const auto gradient = std::make_shared<ActiveGradient>();
  EXPECT_TRUE(engine->forceButtonPushedToBeActionForGuiAttribute(gradient));
  EXPECT_EQ(gradient->action, "buttonPushed:");
}

TEST_F(Wiring, WhetherAGradientTakesAnActionIsTheToolkitsAffair) {
  const auto gradient = std::make_shared<fakes::FakeRole<toolkit::Gradient>>();
  EXPECT_THROW(engine->forceButtonPushedToBeActionForGuiAttribute(gradient),
               toolkit::InvalidArgumentException);
}

TEST_F(Wiring, AnAdoptedGradientIsFoundButNotRecorded) {
  engine = QZ_Plist_State_Parser::initWithWindow(driver.toolkit(), nullptr);
  const auto gradient = std::make_shared<ActiveGradient>(4);
  const auto window = fakes::windowWith(gradient);
  EXPECT_FALSE(engine->getGuiAssetsFromWindow(toolkit::Ref<toolkit::Window>(window)));
  EXPECT_EQ(engine->guiAssets()->count(), 0U);
  EXPECT_EQ(gradient->action, "");
  EXPECT_EQ(engine->findObjectWithTag(4).pointer(), gradient);
  engine->terminateParser();
}

TEST_F(Wiring, AHostsOwnClassOfButtonIsRecordedUnderItsName) {
  engine = QZ_Plist_State_Parser::initWithWindow(driver.toolkit(), nullptr);
  const auto inner = driver.toolkit().application().makeButton({0, 0, 100, 30});
  const auto button = std::make_shared<HostButton>(inner);
  const auto window = fakes::windowWith(button);
  EXPECT_TRUE(engine->getGuiAssetsFromWindow(toolkit::Ref<toolkit::Window>(window)));
  EXPECT_EQ(log,
            std::vector<std::string>{"Found tag value: 4 for object: HostButton using Key: 4"});
  const AssetRecord record = engine->guiAssets()->objectForKey("4");
  EXPECT_EQ(record.classNames[0], "HostButton");
  EXPECT_EQ(record.control.get().pointer(), button);
  EXPECT_EQ(driver.look(inner).target, engine);
  EXPECT_EQ(driver.look(inner).action, "buttonPushed:");
  engine->terminateParser();
}

TEST_F(Wiring, AWindowWithoutAContentViewIsAdoptedWithoutControls) {
  const auto window = std::make_shared<fakes::FakeWindow>(nullptr);
  EXPECT_FALSE(engine->getGuiAssetsFromWindow(toolkit::Ref<toolkit::Window>(window)));
  EXPECT_EQ(engine->tutorialWindow().pointer(), window);
  EXPECT_EQ(window->delegate(), engine);
  EXPECT_FALSE(engine->findObjectWithTag(0));
}

// Only this action reaches the engine at the end of the responder chain.
TEST_F(Wiring, TheEngineUnderstandsItsOwnActionOnly) {
  EXPECT_TRUE(engine->tryToPerform("buttonPushed:", nullptr));
  EXPECT_EQ(log, std::vector<std::string>{"Button tag 0 pressed."});
  for (const char* other : {"buttonPushed", "buttonpushed:", "pseudoButtonPush:", ""}) {
    EXPECT_FALSE(engine->tryToPerform(other, nullptr)) << other;
  }
  EXPECT_EQ(log.size(), 1U);
}

}  // namespace

}  // namespace qz
