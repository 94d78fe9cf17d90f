// SPDX-License-Identifier: MIT
// How often HIDE, SHOW, ENABLE, DISABLE and others look up their control, and which result they act
// on when the window changes between two look-ups.

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

#include "drivers/memory/memory_driver.hpp"
#include "qz/engine.hpp"
#include "tests/engine/fakes.hpp"

namespace qz {

namespace {

using fakes::FakeView;
using toolkit::View;

constexpr toolkit::Tag target = 7;

/// A content view that shows another view at every look: the kinds that the letters of `script`
/// name, then nothing. Each look-up reads it once.
class ChangingContent final : public fakes::FakeRole<View> {
 public:
  explicit ChangingContent(const std::string& script) {
    for (const char kind : script) findings_.push_back(made(kind));
  }

  const toolkit::Subviews& subviews() const override {
    static const toolkit::Subviews none;
    const std::size_t look = looks_++;
    shown_.clear();
    if (look >= findings_.size() || !findings_[look]) return none;
    shown_.push_back(std::shared_ptr<View>(findings_[look]));
    return shown_;
  }

  std::size_t looks() const { return looks_; }
  /// Returns the calls that the view found by the n-th look received. Counts looks from 1.
  std::vector<std::string> calls(std::size_t look) const {
    return findings_[look - 1] ? findings_[look - 1]->calls : std::vector<std::string>();
  }

 private:
  static std::shared_ptr<FakeView> made(char kind) {
    using Kind = FakeView::Kind;
    if (kind == '-') return nullptr;
    return std::make_shared<FakeView>(target, kind == 'b'   ? Kind::button
                                              : kind == 't' ? Kind::textField
                                              : kind == 'i' ? Kind::imageView
                                                            : Kind::plain);
  }

  std::vector<std::shared_ptr<FakeView>> findings_;
  mutable std::size_t looks_ = 0;
  mutable toolkit::Subviews shown_;
};

/// Runs one command for the tag in a window over the content, and returns its result.
bool run(const std::string& command, const std::shared_ptr<ChangingContent>& content,
         const toolkit::ValueRef<toolkit::Array>& parameters = toolkit::Array::make()) {
  drivers::MemoryDriver driver;
  const auto engine = QZ_Plist_State_Parser::init(driver.toolkit());
  engine->setTutorialWindow(std::make_shared<fakes::FakeWindow>(content));
  return engine->doCompoundCommand(command, parameters, toolkit::Number::withLong(target));
}

// The result of each look-up: b button, t text field, i image view, v other view, - nothing.
struct Lookup {
  const char* name;
  const char* findings;
  bool result;
  std::size_t looks;
  std::size_t hidden;   // the look-up whose result is hidden; 0 for none
  std::size_t queried;  // the look-up whose result is asked whether it needs a redraw; 0 for none
};

constexpr Lookup lookups[] = {
    {"a button", "bb", true, 2, 2, 2},
    {"a button that is no longer there", "b-", false, 2, 0, 0},
    {"a button that became a text field", "bt", true, 2, 2, 2},
    {"a button that became some view", "bv", true, 2, 2, 2},
    {"a text field", "ttt", true, 3, 3, 3},
    {"a text field that is no longer there", "tt-", true, 3, 0, 0},
    {"a text field that became a button", "ttb", true, 3, 3, 3},
    {"nothing that became a text field", "-tv", true, 3, 3, 3},
    {"an image view", "iiii", true, 4, 4, 4},
    {"an image view that is no longer there", "iii-", true, 4, 0, 0},
    {"an image view that became a button", "iiib", true, 4, 4, 4},
    {"some view that became an image view", "vviv", true, 4, 4, 4},
    {"some view", "vvvvv", true, 5, 4, 5},
    {"some view that became a button late", "vbvvv", true, 5, 4, 5},
    {"some view that went before it was asked", "vvvv-", true, 5, 4, 0},
    {"some view that went before it was hidden", "vvv-v", true, 5, 0, 5},
    {"nothing at all", "-----", true, 5, 0, 0},
};

void check(const Lookup& wanted, const std::string& command, const std::string& change) {
  SCOPED_TRACE(command + ": " + wanted.name);
  const auto content = std::make_shared<ChangingContent>(wanted.findings);
  EXPECT_EQ(run(command, content), wanted.result);
  EXPECT_EQ(content->looks(), wanted.looks);
  for (std::size_t look = 1; look <= std::string(wanted.findings).size(); ++look) {
    std::vector<std::string> calls;
    if (look == wanted.hidden) calls.push_back(change);
    if (look == wanted.queried) calls.emplace_back("needsDisplay");
    EXPECT_EQ(content->calls(look), calls) << "look-up " << look;
  }
}

TEST(ControlLookups, HidingAndShowingActOnTheFindingOfTheirStep) {
  for (const Lookup& wanted : lookups) {
    check(wanted, "HIDE_OBJECT_WITH_ID", "hide");
    check(wanted, "SHOW_OBJECT_WITH_ID", "show");
  }
}

TEST(ControlLookups, EnablingAndDisablingLookOnce) {
  struct {
    const char* command;
    std::string change;
  } const rows[] = {{"ENABLE_OBJECT_WITH_ID", "enable"}, {"DISABLE_OBJECT_WITH_ID", "disable"}};
  for (const auto& [command, change] : rows) {
    const auto content = std::make_shared<ChangingContent>("b");
    EXPECT_TRUE(run(command, content));
    EXPECT_EQ(content->looks(), 1U);
    EXPECT_EQ(content->calls(1), (std::vector<std::string>{change, "needsDisplay"}));
    EXPECT_FALSE(run(command, std::make_shared<ChangingContent>("-")));
  }
}

// Simple commands look up their control before they compare their name.
TEST(ControlLookups, ASimpleCommandLooksOnceWhateverItsName) {
  for (const char* name : {"HIDE_OBJECT_WITH_ID", "IDLE_LOOP", "NO_SUCH_COMMAND", ""}) {
    SCOPED_TRACE(name);
    drivers::MemoryDriver driver;
    const auto content = std::make_shared<ChangingContent>("v");
    const auto engine = QZ_Plist_State_Parser::init(driver.toolkit());
    engine->setTutorialWindow(std::make_shared<fakes::FakeWindow>(content));
    engine->doSimpleCommand(name, toolkit::Array::make(), toolkit::Number::withLong(target));
    EXPECT_EQ(content->looks(), 1U);
  }
}

// With any other count of parameters, the command ends before it looks up its control.
TEST(ControlLookups, LoadingAnImageLooksOnceForTwoParametersOnly) {
  const toolkit::ValueRef<> name = toolkit::String::make("star");
  const toolkit::ValueRef<> tag = toolkit::Number::withLong(target);
  struct {
    std::vector<toolkit::ValueRef<>> parameters;
    std::size_t looks;
  } const rows[] = {{{}, 0}, {{name}, 0}, {{name, tag}, 1}, {{name, tag, tag}, 0}};
  for (const auto& [parameters, looks] : rows) {
    const auto content = std::make_shared<ChangingContent>("iiii");
    EXPECT_EQ(
        run("LOAD_GRAPHIC_OBJECT_WITH_PATH_AND_ID", content, toolkit::Array::make(parameters)),
        looks == 1);
    EXPECT_EQ(content->looks(), looks);
  }
}

TEST(ControlLookups, TheBackgroundIsLayeredBeforeItShowsAnImage) {
  drivers::MemoryDriver driver;
  const auto content = std::make_shared<FakeView>();
  const auto engine = QZ_Plist_State_Parser::init(driver.toolkit());
  engine->setTutorialWindow(std::make_shared<fakes::FakeWindow>(content));
  EXPECT_TRUE(engine->doCompoundCommand("LOAD_BACKGROUND_WITH_IMAGE",
                                        toolkit::Array::make({toolkit::String::make("none")}),
                                        toolkit::Number::withLong(target)));
  EXPECT_EQ(content->calls, (std::vector<std::string>{"layer", "contents"}));
}

}  // namespace

}  // namespace qz
