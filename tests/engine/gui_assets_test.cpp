// SPDX-License-Identifier: MIT
// Building the walk-through window from a description: the engine's requests to the toolkit, and
// effects that only the toolkit sees.

#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "drivers/memory/memory_driver.hpp"
#include "qz/engine.hpp"
#include "tests/engine/fakes.hpp"
#include "toolkit/memory/views.hpp"

namespace qz {

namespace {

using drivers::MemoryDriver;
using toolkit::Ref;
using toolkit::ValueRef;

/// The arguments of a request for a window.
struct WindowOrder {
  toolkit::Rect content;
  toolkit::StyleMask style;
  toolkit::BackingStore backing;
  bool defer;
};

/// The memory toolkit's application. It records the windows requested and can refuse them. Its
/// controls start hidden, disabled and untidy, so that every property left unset shows.
class ObservedApplication final : public toolkit::Application {
 public:
  explicit ObservedApplication(toolkit::Application& application) : application_(application) {}

  Ref<toolkit::Window> makeWindow(const toolkit::Rect& content, toolkit::StyleMask style,
                                  toolkit::BackingStore backing, bool defer) override {
    orders.push_back({content, style, backing, defer});
    if (refuses) return {};
    if (given) return given;
    return application_.makeWindow(content, style, backing, defer);
  }
  Ref<toolkit::Button> makeButton(const toolkit::Rect& frame) override {
    if (onButton) onButton();
    auto button = application_.makeButton(frame);
    button->setHidden(true);
    button->setEnabled(false);
    return button;
  }
  Ref<toolkit::ImageView> makeImageView(const toolkit::Rect& frame) override {
    auto imageView = application_.makeImageView(frame);
    imageView->setHidden(true);
    imageView->setImageFrameStyle(toolkit::ImageFrameStyle{3});
    imageView->setImageScaling(toolkit::ImageScaling{1});
    imageView->setImageAlignment(toolkit::ImageAlignment{2});
    return imageView;
  }
  Ref<toolkit::TextField> makeTextField(const toolkit::Rect& frame) override {
    auto textField = application_.makeTextField(frame);
    textField->setHidden(true);
    textField->setStringValue("untidy");
    return textField;
  }
  void beginSheet(const Ref<toolkit::Window>& sheet, const Ref<toolkit::Window>& parent,
                  const std::shared_ptr<toolkit::SheetDelegate>& delegate,
                  void* contextInfo) override {
    application_.beginSheet(sheet, parent, delegate, contextInfo);
  }
  void endSheet(const Ref<toolkit::Window>& sheet, long returnCode) override {
    application_.endSheet(sheet, returnCode);
  }

  std::vector<WindowOrder> orders;
  bool refuses = false;
  Ref<toolkit::Window> given;      // returned in place of a window of the memory toolkit
  std::function<void()> onButton;  // called before a button is made

 private:
  toolkit::Application& application_;
};

/// The memory toolkit with the observed application.
class ObservedToolkit final : public toolkit::Toolkit {
 public:
  toolkit::Application& application() override { return observed; }
  toolkit::RunLoop& runLoop() override { return driver.toolkit().runLoop(); }
  toolkit::Images& images() override { return driver.toolkit().images(); }
  toolkit::Fonts& fonts() override { return driver.toolkit().fonts(); }
  toolkit::Files& files() override { return driver.toolkit().files(); }
  toolkit::Log& log() override { return driver.toolkit().log(); }

  drivers::MemoryDriver driver;
  ObservedApplication observed{driver.toolkit().application()};
};

ValueRef<> entry(std::string_view className, const std::vector<double>& frame) {
  const auto list = toolkit::Array::make({toolkit::String::make(className)});
  for (const double length : frame) list->addObject(toolkit::Number::withDouble(length));
  return list;
}

class GuiAssets : public testing::Test {
 protected:
  ~GuiAssets() override { engine->terminateParser(); }

  bool load(const std::vector<std::pair<std::string, ValueRef<>>>& entries) {
    const auto description = toolkit::Dictionary::make();
    for (const auto& [key, value] : entries) description->setObject(value, key);
    return engine->loadGuiAssets(description, nullptr);
  }

  /// Returns the memory toolkit's object for control `index` of those that the load made.
  template <class Kind>
  const Kind& made(std::size_t index) const {
    return dynamic_cast<const Kind&>(*engine->addedObjectToTutorial()->elements().at(index));
  }

  ObservedToolkit toolkit;
  std::shared_ptr<QZ_Plist_State_Parser> engine =
      QZ_Plist_State_Parser::initWithWindow(toolkit, nullptr);
};

TEST_F(GuiAssets, DefaultWindowIsBufferedDeferredTitledAndClosable) {
  EXPECT_TRUE(load({{"1", entry("NSButton", {0, 0, 9, 9})}}));
  ASSERT_EQ(toolkit.observed.orders.size(), 1U);
  const auto& order = toolkit.observed.orders[0];
  EXPECT_EQ(order.content, (toolkit::Rect{100, 100, 640, 480}));
  EXPECT_EQ(static_cast<unsigned>(order.style), 3U);
  EXPECT_EQ(static_cast<unsigned>(order.backing), 2U);
  EXPECT_TRUE(order.defer);
}

TEST_F(GuiAssets, DescribedWindowIsMadeInTheSameWay) {
  EXPECT_TRUE(load({{"1", entry("NSButton", {0, 0, 9, 9})},
                    {"first", entry("NSWindow", {1, 2, 300, 400})},
                    {"second", entry("NSWindow", {5, 6, 700, 800})}}));
  ASSERT_EQ(toolkit.observed.orders.size(), 1U);
  const auto& order = toolkit.observed.orders[0];
  EXPECT_EQ(order.content, (toolkit::Rect{1, 2, 300, 400}));
  EXPECT_EQ(static_cast<unsigned>(order.style), 3U);
  EXPECT_EQ(static_cast<unsigned>(order.backing), 2U);
  EXPECT_TRUE(order.defer);
}

TEST_F(GuiAssets, WindowRectangleIsReadInSinglePrecision) {
  EXPECT_FALSE(load({{"window", entry("NSWindow", {0.1, -0.2, 100.7, 16777217})}}));
  ASSERT_EQ(toolkit.observed.orders.size(), 1U);
  EXPECT_EQ(
      toolkit.observed.orders[0].content,
      (toolkit::Rect{0.10000000149011612, -0.20000000298023224, 100.69999694824219, 16777216}));
}

TEST_F(GuiAssets, WithoutAWindowNoControlIsMade) {
  toolkit.observed.refuses = true;
  EXPECT_FALSE(load({{"1", entry("NSButton", {0, 0, 9, 9})}}));
  EXPECT_FALSE(
      load({{"window", entry("NSWindow", {0, 0, 9, 9})}, {"1", entry("NSButton", {0, 0, 9, 9})}}));
  EXPECT_EQ(toolkit.observed.orders.size(), 2U);
  EXPECT_FALSE(engine->tutorialWindow());
  EXPECT_EQ(engine->addedObjectToTutorial()->count(), 0U);
}

// Only a discovery empties the records, and without a window there is no discovery.
TEST_F(GuiAssets, WithoutAWindowTheRecordsOfADiscoveryStay) {
  const auto window = toolkit.driver.makeWindow({0, 0, 300, 200});
  toolkit.driver.makeView(drivers::ViewKind::button, 7, {0, 0, 9, 9}, window->contentView());
  EXPECT_TRUE(engine->getGuiAssetsFromWindow(window));
  toolkit.observed.refuses = true;
  EXPECT_FALSE(load({{"1", entry("NSButton", {0, 0, 9, 9})}}));
  EXPECT_EQ(engine->guiAssets()->count(), 1U);
  EXPECT_EQ(engine->originalTagValues()->count(), 1U);
}

// Another window comes to the front while the controls are made.
TEST_F(GuiAssets, DescribedWindowShowsBeforeItsControlsAndAgainAfterThem) {
  const auto other = toolkit.driver.makeWindow({0, 0, 300, 200});
  bool shown = false;
  toolkit.observed.onButton = [&] {
    const auto picture = toolkit.driver.look(engine->tutorialWindow());
    shown = picture.visible && picture.key;
    other->makeKeyAndOrderFront();
  };
  EXPECT_TRUE(load(
      {{"1", entry("NSButton", {0, 0, 9, 9})}, {"window", entry("NSWindow", {1, 2, 300, 400})}}));
  EXPECT_TRUE(shown);
  EXPECT_TRUE(toolkit.driver.look(engine->tutorialWindow()).key);
}

TEST_F(GuiAssets, DefaultWindowShowsOnlyAfterItsControls) {
  bool shown = true;
  toolkit.observed.onButton = [&] {
    shown = toolkit.driver.look(engine->tutorialWindow()).visible;
  };
  EXPECT_TRUE(load({{"1", entry("NSButton", {0, 0, 9, 9})}}));
  EXPECT_FALSE(shown);
  EXPECT_TRUE(toolkit.driver.look(engine->tutorialWindow()).visible);
}

TEST_F(GuiAssets, ControlsAreSetUpForTheirKind) {
  ASSERT_TRUE(load({{"1", entry("NSButton", {0, 0, 9, 9})},
                    {"2", entry("NSImageView", {0, 0, 9, 9})},
                    {"3", entry("NSTextField", {0, 0, 9, 9})}}));
  const auto& button = made<toolkit::memory::MemoryButton>(0);
  EXPECT_EQ(static_cast<int>(button.bezelStyle()), 8);
  EXPECT_FALSE(button.isHidden());
  EXPECT_TRUE(button.isEnabled());
  const auto& imageView = made<toolkit::memory::MemoryImageView>(1);
  EXPECT_EQ(static_cast<int>(imageView.imageFrameStyle()), 0);
  EXPECT_EQ(static_cast<int>(imageView.imageScaling()), 0);
  EXPECT_EQ(static_cast<int>(imageView.imageAlignment()), 0);
  EXPECT_FALSE(imageView.isHidden());
  const auto& textField = made<toolkit::memory::MemoryTextField>(2);
  EXPECT_EQ(textField.delegate(), engine);
  EXPECT_EQ(textField.stringValue(), "");
  EXPECT_FALSE(textField.isHidden());
}

TEST_F(GuiAssets, ImageViewsAndTextFieldsKeepTheToolkitsDefaultTag) {
  ASSERT_TRUE(
      load({{"7", entry("NSImageView", {0, 0, 9, 9})}, {"8", entry("NSTextField", {0, 0, 9, 9})}}));
  const auto& controls = engine->addedObjectToTutorial()->elements();
  EXPECT_EQ(controls[0]->tag(), toolkit.application().makeImageView({})->tag());
  EXPECT_EQ(controls[1]->tag(), toolkit.application().makeTextField({})->tag());
}

TEST_F(GuiAssets, ErrorIsNeverWritten) {
  const auto mark = std::make_shared<toolkit::Exception>("name", "reason");
  const auto description = toolkit::Dictionary::make();
  std::shared_ptr<toolkit::Exception> marked = mark;
  std::shared_ptr<toolkit::Exception> absent;
  EXPECT_FALSE(engine->loadGuiAssets(description, &marked));
  EXPECT_FALSE(engine->loadGuiAssets(nullptr, &absent));
  description->setObject(entry("NSButton", {0, 0, 9, 9}), "1");
  EXPECT_TRUE(engine->loadGuiAssets(description, &marked));
  EXPECT_TRUE(engine->loadGuiAssets(description, &absent));
  description->setObject(entry("NSButton", {}), "2");
  EXPECT_THROW(engine->loadGuiAssets(description, &marked), toolkit::Exception);
  EXPECT_THROW(engine->loadGuiAssets(description, &absent), toolkit::Exception);
  EXPECT_EQ(marked, mark);
  EXPECT_EQ(absent, nullptr);
}

TEST_F(GuiAssets, EngineKeepsTheWindowThatItBuilt) {
  ASSERT_TRUE(load({{"1", entry("NSButton", {0, 0, 9, 9})}}));
  engine->tutorialWindow()->orderOut();  // off the screen, only the engine keeps it
  EXPECT_TRUE(engine->tutorialWindow());
}

TEST_F(GuiAssets, DescriptionIsLeftAsItIs) {
  const auto description = toolkit::Dictionary::make();
  description->setObject(entry("NSButton", {0, 0, 9, 9}), "1");
  const std::string before = description->description();
  EXPECT_TRUE(engine->loadGuiAssets(description, nullptr));
  EXPECT_EQ(description->description(), before);
}

TEST(AssetEntries, AnEntryIsAnUnchangeableListOfSinglePrecisionNumbers) {
  drivers::MemoryDriver driver;
  const auto engine = QZ_Plist_State_Parser::init(driver.toolkit());
  auto entries = toolkit::Dictionary::make();
  ASSERT_TRUE(engine->createNextGuiAssetEntry(&entries, "NSButton", {1, 2, 3, 4}, 12));
  const auto list = toolkit::asArray(entries->objectForKey("12"));
  ASSERT_EQ(list->count(), 5U);
  for (std::size_t i = 1; i < 5; ++i) {
    EXPECT_EQ(toolkit::asNumber(list->objectAtIndex(i))->type(), toolkit::Number::Type::real32);
  }
  EXPECT_THROW(list->removeAllObjects(), toolkit::Exception);
}

TEST(AssetEntries, WithoutAPlaceForThemNothingIsWritten) {
  drivers::MemoryDriver driver;
  const auto engine = QZ_Plist_State_Parser::init(driver.toolkit());
  EXPECT_FALSE(engine->createNextGuiAssetEntry(nullptr, "NSButton", {1, 2, 3, 4}, 12));
}

TEST_F(GuiAssets, AControlIsAddedAlthoughTheListOfControlsIsEmptiedMeanwhile) {
  struct Content final : fakes::FakeRole<toolkit::View> {
    void addSubview(const Ref<toolkit::View>& view) override {
      onAdd();
      FakeRole::addSubview(view);
    }
    std::function<void()> onAdd;
  };
  const auto content = std::make_shared<Content>();
  content->onAdd = [&] { engine->addedObjectToTutorial()->removeAllObjects(); };
  toolkit.observed.given = std::make_shared<fakes::FakeWindow>(content);
  EXPECT_TRUE(load({{"1", entry("NSButton", {0, 0, 9, 9})}}));
  ASSERT_EQ(content->views.size(), 1U);
  EXPECT_EQ(content->views.front()->tag(), 1);
}

TEST_F(GuiAssets, ADescriptionThatChangesMeanwhileIsBuiltAsItWas) {
  const auto description = toolkit::Dictionary::make();
  description->setObject(entry("NSButton", {0, 0, 9, 9}), "1");
  description->setObject(entry("NSTextField", {0, 0, 9, 9}), "2");
  toolkit.observed.onButton = [&] { description->removeAllObjects(); };
  EXPECT_TRUE(engine->loadGuiAssets(description, nullptr));
  EXPECT_EQ(engine->addedObjectToTutorial()->count(), 2U);
}

}  // namespace

}  // namespace qz
