// SPDX-License-Identifier: MIT
// Operations that call out to the host keep their arguments and their engine. Here the host changes
// every variable that it passed in, and releases the engine, at the first call that the engine
// makes to its toolkit or its window.

#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "drivers/memory/memory_driver.hpp"
#include "qz/engine.hpp"
#include "tests/engine/fakes.hpp"

namespace qz {

namespace {

using Engine = QZ_Plist_State_Parser;
using drivers::ViewKind;
using toolkit::Array;
using toolkit::Dictionary;
using toolkit::Number;
using toolkit::String;

/// A toolkit that calls the host whenever it is used, and forwards to another toolkit.
struct CallingToolkit final : toolkit::Toolkit {
  CallingToolkit(toolkit::Toolkit& other, std::function<void()> host)
      : real(other), call(std::move(host)) {}
  toolkit::Toolkit& asked() const { return call(), real; }

  toolkit::Application& application() override { return asked().application(); }
  toolkit::RunLoop& runLoop() override { return asked().runLoop(); }
  toolkit::Images& images() override { return asked().images(); }
  toolkit::Fonts& fonts() override { return asked().fonts(); }
  toolkit::Files& files() override { return asked().files(); }
  toolkit::Log& log() override { return asked().log(); }

  toolkit::Toolkit& real;
  std::function<void()> call;
};

/// A content view that calls the host whenever its subviews are read.
struct CallingContent final : fakes::FakeRole<toolkit::View> {
  const toolkit::Subviews& subviews() const override { return call(), views; }

  std::function<void()> call;
};

/// A button that calls the host when it is asked for its kind.
struct CallingButton final : fakes::FakeRole<toolkit::View> {
  toolkit::Button* asButton() override { return call(), &toolkit::Button::nothing(); }
  void setAction(std::string_view text) override { action = text; }

  std::string action;
  std::function<void()> call;
};

/// A timer that calls the host when it is asked whether it is valid.
struct CallingTimer final : toolkit::Timer {
  bool isValid() const override { return call(), valid; }
  void invalidate() override { valid = false; }
  double interval() const override { return 1; }
  double timeLeft() const override { return 1; }

  bool valid = true;
  std::function<void()> call;
};

struct Delegate final : toolkit::SheetDelegate {
  void sheetDidEnd(const Engine::Window&, long, void*) override { ++told; }
  int told = 0;
};

class CallingOut : public testing::Test {
 protected:
  CallingOut() {
    content->call = callHost;
    content->views = {button, other};
    driver.setLogSink([this](std::string_view) { ++lines; });
    engine->setTutorialWindow(window);
    engine->flashingTimer()->invalidate();
    engine->plistDictionary()->setObject(list, "7");
  }

  /// Runs `call` with the host armed. True if the engine called the host.
  template <class Call>
  bool isCalledOut(Call call) {
    Engine& called = *engine;
    armed = true;
    call(called);
    return !armed;
  }
  /// As above; true if the engine, which only the host kept, has ended as well. The operation's
  /// effect and the address sanitizer show that it did not end before the operation.
  template <class Call>
  bool endsOnlyAfter(Call call) {
    const std::weak_ptr<Engine> watched = engine;
    return isCalledOut(call) && watched.expired();
  }
  void changeEverything() {
    engine.reset();
    id = Number::withLong(8);
    newTag = Number::withLong(88);
    text = String::make("changed");
    font = size = list = nullptr;
    if (parameters) parameters->removeAllObjects();
    parameters = nullptr;
    table = nullptr;
    command.assign(command.size(), '-');
    key = "8";
    window = nullptr;
    control = nullptr;
    timer = nullptr;
    delegate = std::make_shared<Delegate>();
  }
  drivers::ViewPicture look() { return driver.look(button); }

  bool armed = false;
  int lines = 0;
  std::function<void()> callHost = [this] {
    if (!std::exchange(armed, false)) return;
    changeEverything();
  };
  drivers::MemoryDriver driver;
  CallingToolkit calling{driver.toolkit(), callHost};
  Engine::Window screen = driver.makeWindow({0, 0, 300, 200});
  Engine::Control button =
      driver.makeView(drivers::ViewKind::toggle, 7, {20, 20, 100, 30}, screen->contentView());
  Engine::Control other =
      driver.makeView(drivers::ViewKind::toggle, 8, {20, 60, 100, 30}, screen->contentView());
  std::shared_ptr<CallingContent> content = std::make_shared<CallingContent>();

  // The variables that the host passes in and changes.
  Engine::ObjectId id = Number::withLong(7);
  Engine::ObjectId newTag = Number::withLong(9);
  Engine::Value text = String::make("done, and long enough to be let go of");
  Engine::Value font = String::make("Helvetica");
  Engine::Value size = Number::withLong(12);
  // Its first element raises and is logged, its second hides the control of the list's id.
  Engine::Value list = Array::make({Array::make(), String::make("HIDE_OBJECT_WITH_ID")});
  Engine::Parameters parameters;
  Engine::Dictionary table = Dictionary::make();
  std::string command;
  std::optional<std::string> key = "7";
  Engine::Window window = std::make_shared<fakes::FakeWindow>(content);
  Engine::Control control = button;
  Engine::Timer timer;
  std::shared_ptr<Delegate> delegate = std::make_shared<Delegate>();
  std::shared_ptr<Engine> engine = Engine::initWithWindow(calling, nullptr);
};

TEST_F(CallingOut, ARunIsOfItsListForItsId) {
  EXPECT_TRUE(endsOnlyAfter([&](Engine& called) { called.processCommandArray(list, id); }));
  EXPECT_TRUE(look().hidden);
}

TEST_F(CallingOut, ASimpleCommandIsTheOneNamed) {
  command = "HIDE_OBJECT_WITH_ID";
  EXPECT_TRUE(
      endsOnlyAfter([&](Engine& called) { called.doSimpleCommand(command, parameters, id); }));
  EXPECT_TRUE(look().hidden);
}

TEST_F(CallingOut, ACompoundCommandHasItsParameters) {
  command = "DISABLE_OBJECT_WITH_ID";
  parameters = Array::make({Number::withLong(99)});
  EXPECT_TRUE(endsOnlyAfter([&](Engine& called) {
    EXPECT_TRUE(called.doCompoundCommand(command, parameters, id));  // aimed by its parameter
  }));
}

TEST_F(CallingOut, ACompoundCommandActsOnItsId) {
  command = "HIDE_OBJECT_WITH_ID";
  EXPECT_TRUE(endsOnlyAfter(
      [&](Engine& called) { EXPECT_TRUE(called.doCompoundCommand(command, parameters, id)); }));
  EXPECT_TRUE(look().hidden);
}

TEST_F(CallingOut, TheBackgroundIsTheEnginesWindows) {
  command = "LOAD_BACKGROUND_WITH_IMAGE";
  parameters = Array::make({text});
  EXPECT_TRUE(endsOnlyAfter(
      [&](Engine& called) { EXPECT_TRUE(called.doCompoundCommand(command, parameters, id)); }));
  EXPECT_EQ(content->calls, (std::vector<std::string>{"layer", "contents"}));
}

TEST_F(CallingOut, APressIsOfItsButton) {
  EXPECT_TRUE(endsOnlyAfter([&](Engine& called) { called.buttonPushed(control); }));
  EXPECT_TRUE(look().hidden);
}

TEST_F(CallingOut, TheStateRecordedIsThatOfTheButtonPressed) {
  toolkit::asButton(button)->setState(toolkit::State::on);
  const auto keeping = engine;
  EXPECT_TRUE(isCalledOut([&](Engine& called) { called.buttonPushed(control); }));
  EXPECT_TRUE(keeping->buttonStates()->objectForKey("7")->boolValue());
  EXPECT_EQ(keeping->currentCommandState(), "7");
}

TEST_F(CallingOut, AFiringTimerPressesItsButton) {
  timer = std::make_shared<CallingTimer>();
  engine->objectIdTimers()->setObject(timer, "7");
  EXPECT_TRUE(endsOnlyAfter([&](Engine& called) { called.pseudoButtonPush(timer); }));
  EXPECT_TRUE(look().hidden);
}

TEST_F(CallingOut, ALoadIsOfItsKey) {
  std::optional<std::string> name = "none.plist";
  EXPECT_TRUE(endsOnlyAfter([&](Engine& called) { called.loadPlist(name, key, nullptr, false); }));
  EXPECT_TRUE(look().hidden);
}

TEST_F(CallingOut, ASheetsDelegateIsTheOneOfItsLoad) {
  const auto first = delegate;
  engine->setTutorialWindow(screen);
  EXPECT_TRUE(endsOnlyAfter([&](Engine& called) {
    EXPECT_TRUE(called.loadPlist("none.plist", std::nullopt, delegate, true));
    driver.toolkit().application().endSheet(screen, 0);
  }));
  EXPECT_EQ(first->told, 1);
  EXPECT_EQ(delegate->told, 0);
}

TEST_F(CallingOut, DiscoveryIsOfItsWindow) {
  const auto assets = engine->guiAssets();
  engine->setTutorialWindow(nullptr);
  EXPECT_TRUE(
      endsOnlyAfter([&](Engine& called) { EXPECT_TRUE(called.getGuiAssetsFromWindow(window)); }));
  EXPECT_EQ(assets->count(), 2U);
  EXPECT_EQ(lines, 2);
}

TEST_F(CallingOut, AWindowIsBuiltOfItsDescription) {
  const auto number = Number::withLong(9);
  table->setObject(Array::make({String::make("NSButton"), number, number, number, number}), "7");
  const auto controls = engine->addedObjectToTutorial();
  EXPECT_TRUE(
      endsOnlyAfter([&](Engine& called) { EXPECT_TRUE(called.loadGuiAssets(table, nullptr)); }));
  EXPECT_EQ(controls->count(), 1U);
}

TEST_F(CallingOut, TheStatesAreThoseGiven) {
  table->setObject(Number::withBool(true), "7");
  table->setObject(Number::withBool(true), "8");
  EXPECT_TRUE(endsOnlyAfter([&](Engine& called) { EXPECT_TRUE(called.setButtonSates(table)); }));
  EXPECT_EQ(look().state, toolkit::State::on);
  EXPECT_EQ(driver.look(other).state, toolkit::State::on);
}

TEST_F(CallingOut, EveryTagIsPutBack) {
  engine->getGuiAssetsFromWindow(window);
  button->setTag(70);
  other->setTag(80);
  EXPECT_TRUE(endsOnlyAfter([](Engine& called) { called.restoreOriginalTagValues(); }));
  EXPECT_EQ(button->tag(), 7);
  EXPECT_EQ(other->tag(), 8);
}

TEST_F(CallingOut, ATerminationIsDone) {
  const auto shown = std::make_shared<fakes::FakeWindow>(content);
  engine->getGuiAssetsFromWindow(Engine::Window(shown));
  EXPECT_TRUE(
      endsOnlyAfter([](Engine& called) { called.QZ_Plist_State_Processor_TERMINATE_PARSER(); }));
  EXPECT_EQ(shown->closes, 1);
}

TEST_F(CallingOut, AnActionIsGivenToItsButton) {
  const auto calledButton = std::make_shared<CallingButton>();
  calledButton->call = callHost;
  control = calledButton;
  EXPECT_TRUE(endsOnlyAfter([&](Engine& called) {
    EXPECT_TRUE(called.forceButtonPushedToBeActionForGuiAttribute(control));
  }));
  EXPECT_EQ(calledButton->action, "buttonPushed:");
}

TEST_F(CallingOut, EveryTimerIsCancelled) {
  const auto first = std::make_shared<CallingTimer>();
  const auto second = std::make_shared<CallingTimer>();
  first->call = second->call = callHost;
  const auto timers = engine->objectIdTimers();
  timers->setObject(Engine::Timer(first), "1");
  timers->setObject(Engine::Timer(second), "2");
  EXPECT_TRUE(endsOnlyAfter([](Engine& called) { called.killAllTimers(); }));
  EXPECT_FALSE(first->valid || second->valid);
  EXPECT_EQ(timers->count(), 0U);
}

TEST_F(CallingOut, ATimerIsForItsKey) {
  const auto timers = engine->objectIdTimers();
  const std::weak_ptr<Engine> watched = engine;
  EXPECT_TRUE(isCalledOut([&](Engine& called) { called.startTimerWithValue(3, key); }));
  EXPECT_TRUE(timers->contains("7"));
  timers->objectForKey("7")->invalidate();  // the timer kept the engine
  EXPECT_TRUE(watched.expired());
}

TEST_F(CallingOut, ATimerIsForItsTag) {
  const auto timers = engine->objectIdTimers();
  EXPECT_TRUE(
      isCalledOut([&](Engine& called) { called.QZ_Plist_State_Processor_SET_TIMER(3, id); }));
  EXPECT_TRUE(timers->contains("7"));
  timers->objectForKey("7")->invalidate();
}

TEST_F(CallingOut, ATickTogglesEveryButton) {
  for (const auto& tag : {id, Number::withLong(8)}) {
    engine->QZ_Plist_State_Processor_FLASH_ID(tag, true);
  }
  engine->setFlashing(true);
  EXPECT_TRUE(endsOnlyAfter([&](Engine& called) { called.flasherFired(timer); }));
  EXPECT_TRUE(look().highlighted);
  EXPECT_TRUE(driver.look(other).highlighted);
}

TEST_F(CallingOut, ForbiddingFlashingClearsEveryButton) {
  engine->plistDictionary()->setObject(list, "8");
  button->highlight(true);
  other->highlight(true);
  EXPECT_TRUE(
      endsOnlyAfter([](Engine& called) { called.QZ_Plist_State_Processor_ALLOW_FLASHING(false); }));
  EXPECT_FALSE(look().highlighted);
  EXPECT_FALSE(driver.look(other).highlighted);
}

TEST_F(CallingOut, AFlashingMarkIsForItsTag) {
  button->highlight(true);
  EXPECT_TRUE(
      endsOnlyAfter([&](Engine& called) { called.QZ_Plist_State_Processor_FLASH_ID(id, false); }));
  EXPECT_FALSE(look().highlighted);
}

TEST_F(CallingOut, ATagIsGivenToTheControlOfItsId) {
  const auto marks = engine->flashingTagIds();
  marks->setObject(Number::withBool(true), "7");
  EXPECT_TRUE(endsOnlyAfter(
      [&](Engine& called) { EXPECT_TRUE(called.QZ_Plist_State_Processor_SET_TAG(newTag, id)); }));
  EXPECT_EQ(button->tag(), 9);
}

TEST_F(CallingOut, ATagsTimerIsForTheTagGiven) {
  const auto timers = engine->objectIdTimers();
  EXPECT_TRUE(isCalledOut([&](Engine& called) {
    EXPECT_TRUE(called.QZ_Plist_State_Processor_SET_TAG(newTag, id, size));
  }));
  EXPECT_EQ(button->tag(), 9);
  ASSERT_TRUE(timers->contains("9"));
  timers->objectForKey("9")->invalidate();
}

TEST_F(CallingOut, AChainedListRunsForItsId) {
  EXPECT_TRUE(endsOnlyAfter(
      [&](Engine& called) { called.QZ_Plist_State_Processor_PROCESS_COMMANDS_FOR_ID(id); }));
  EXPECT_TRUE(look().hidden);
}

TEST_F(CallingOut, ATextIsTheOneGiven) {
  EXPECT_TRUE(endsOnlyAfter(
      [&](Engine& called) { EXPECT_TRUE(called.QZ_Plist_State_Processor_SET_TEXT(text, id)); }));
}

TEST_F(CallingOut, ATitleIsTheOneGiven) {
  EXPECT_TRUE(endsOnlyAfter(
      [&](Engine& called) { EXPECT_TRUE(called.QZ_Plist_State_Processor_SET_TITLE(text, id)); }));
  EXPECT_EQ(look().title.string(), "done, and long enough to be let go of");
}

TEST_F(CallingOut, ToolTipsAreTheOnesGiven) {
  parameters = Array::make({text});
  EXPECT_TRUE(endsOnlyAfter([&](Engine& called) {
    EXPECT_TRUE(called.QZ_Plist_State_Processor_SET_TOOL_TIP(parameters, id));
  }));
  EXPECT_EQ(look().toolTip, "done, and long enough to be let go of");
}

TEST_F(CallingOut, AnImageIsForTheControlGiven) {
  const auto picture =
      driver.makeView(drivers::ViewKind::imageView, 5, {20, 90, 30, 30}, screen->contentView());
  content->views.push_back(picture);
  parameters = Array::make({text, Number::withLong(5)});
  EXPECT_TRUE(endsOnlyAfter([&](Engine& called) {
    EXPECT_TRUE(called.QZ_Plist_State_Processor_LOAD_GRAPHIC_OBJECT_WITH_PATH(parameters, id));
  }));
}

TEST_F(CallingOut, StylesAndFontsOfHtmlAreThoseGiven) {
  const std::vector<std::function<bool(Engine&)>> calls = {
      [&](Engine& called) {
        return called.QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML(text, font, size, id);
      },
      [&](Engine& called) {
        return called.QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER(text, font,
                                                                                       size, id);
      },
      [&](Engine& called) {
        return called.QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_IS(true, text, font, size,
                                                                           id);
      },
  };
  for (const auto& call : calls) {
    engine = Engine::init(calling);
    window = std::make_shared<fakes::FakeWindow>(content);
    engine->setTutorialWindow(window);
    id = Number::withLong(7);
    text = String::make("done");
    font = String::make("Helvetica");
    size = Number::withLong(12);
    EXPECT_TRUE(endsOnlyAfter([&](Engine& called) { EXPECT_TRUE(call(called)); }));
    EXPECT_EQ(look().title.string(), "done");
  }
}

TEST_F(CallingOut, HtmlThatCannotBeSetIsReported) {
  EXPECT_TRUE(endsOnlyAfter([&](Engine& called) {
    called.QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML(text, Number::withLong(1), size,
                                                                  id);
  }));
  EXPECT_EQ(lines, 1);
}

TEST_F(CallingOut, AColourThatCannotBeSetIsReported) {
  EXPECT_TRUE(endsOnlyAfter([&](Engine& called) {
    EXPECT_FALSE(called.QZ_Plist_State_Processor_SET_FOREGROUND_COLOR(String::make("pink"), id));
  }));
  EXPECT_EQ(lines, 1);
}

TEST_F(CallingOut, ColoursAndStatesAreOfTheControlGiven) {
  EXPECT_TRUE(isCalledOut([&](Engine& called) {
    EXPECT_TRUE(called.QZ_Plist_State_Processor_SET_BACKGROUND_COLOR(1, id));
  }));
  EXPECT_EQ(look().background, toolkit::colors::red);
  for (const bool on : {true, false}) {
    engine = Engine::init(calling);
    window = std::make_shared<fakes::FakeWindow>(content);
    engine->setTutorialWindow(window);
    id = Number::withLong(7);
    EXPECT_TRUE(endsOnlyAfter([&](Engine& called) {
      EXPECT_TRUE(on ? called.QZ_Plist_State_Processor_SET_STATE_ON(id)
                     : called.QZ_Plist_State_Processor_SET_STATE_OFF(id));
    }));
    EXPECT_EQ(look().state, on ? toolkit::State::on : toolkit::State::off);
  }
}

// After an operation that raised, the next one keeps and releases the engine as usual.
TEST_F(CallingOut, AnOperationThatRaisedDoesNotKeepTheEngine) {
  EXPECT_THROW(engine->processCommandArray(text, id), toolkit::Exception);
  EXPECT_TRUE(endsOnlyAfter([&](Engine& called) { called.processCommandArray(list, id); }));
  EXPECT_TRUE(look().hidden);
}

}  // namespace

}  // namespace qz
