// SPDX-License-Identifier: MIT
// GUI-asset loading: builds the walk-through window and its controls from a description.

#include "engine/state.hpp"
#include "engine/text_of.hpp"
#include "qz/toolkit/class_names.hpp"

namespace qz {

namespace {

constexpr toolkit::Rect defaultContent{100, 100, 640, 480};

// A description entry is a list: class name, x, y, width, height.
bool isOfClass(const toolkit::ValueRef<>& entry, std::string_view className) {
  return textOf(entry->objectAtIndex(0)) == className;
}

// Reads lengths in single precision: 0.1 becomes 0.100000001490116.
toolkit::Rect rectOf(const toolkit::ValueRef<>& entry) {
  const auto length = [&](std::size_t position) {
    return static_cast<double>(entry->objectAtIndex(position)->floatValue());
  };
  const double x = length(1);
  const double y = length(2);
  const double width = length(3);
  return {x, y, width, length(4)};
}

// What a control is made from.
struct ControlPlan {
  QZ_Plist_State_Parser& engine;
  toolkit::Application& application;
  // Receives the control before it is set up. Looked up then: making a control can replace it.
  const Property<QZ_Plist_State_Parser::Controls>& added;
  const toolkit::ValueRef<>& key;
  toolkit::Rect frame;
};

// Only buttons get a tag: scripts reach the other controls by the toolkit's default tag, or by a
// tag that the host sets.
QZ_Plist_State_Parser::Control makeButton(const ControlPlan& plan) {
  const auto button = plan.application.makeButton(plan.frame);
  plan.added->addObject(button);
  button->setBezelStyle(toolkit::BezelStyle::texturedSquare);
  button->setHidden(false);
  button->setEnabled(true);
  button->setAction("buttonPushed:");
  button->setTag(plan.key->integerValue());
  return button;
}

QZ_Plist_State_Parser::Control makeImageView(const ControlPlan& plan) {
  const auto imageView = plan.application.makeImageView(plan.frame);
  plan.added->addObject(imageView);
  imageView->setImageFrameStyle(toolkit::ImageFrameStyle::none);
  imageView->setImageScaling(toolkit::ImageScaling::proportionallyDown);
  imageView->setImageAlignment(toolkit::ImageAlignment::center);
  imageView->setHidden(false);
  return imageView;
}

QZ_Plist_State_Parser::Control makeTextField(const ControlPlan& plan) {
  const auto textField = plan.application.makeTextField(plan.frame);
  plan.added->addObject(textField);
  textField->setDelegate(plan.engine.shared_from_this());
  textField->setTitle("");
  textField->setHidden(false);
  return textField;
}

// A class that a description can name.
struct DescribedClass {
  std::string_view name;
  QZ_Plist_State_Parser::Control (*make)(const ControlPlan& plan);  // null for the window
};

constexpr DescribedClass describedClasses[] = {
    {toolkit::class_names::button, makeButton},
    {toolkit::class_names::imageView, makeImageView},
    {toolkit::class_names::textField, makeTextField},
    {toolkit::class_names::window, nullptr},
};

// Null for a class that no description can name.
const DescribedClass* describedClass(std::string_view name) {
  for (const DescribedClass& row : describedClasses) {
    if (row.name == name) return &row;
  }
  return nullptr;
}

}  // namespace

bool QZ_Plist_State_Parser::loadGuiAssets(Dictionary description,
                                          std::shared_ptr<toolkit::Exception>*) {
  const auto kept = keepAlive();
  const Dictionary assets = description->copy(toolkit::Mutability::immutable);
  state_->addedObjectToTutorial->removeAllObjects();
  state_->tutorialWindow.set({});  // a window of an earlier load is not closed
  if (assets->count() == 0) return false;

  Value windowEntry;
  for (const auto& [key, entry] : assets->entries()) {
    const bool isWindow = isOfClass(entry, toolkit::class_names::window);
    if (!isWindow || windowEntry) continue;
    windowEntry = entry;
    makeTutorialWindow(rectOf(entry))->makeKeyAndOrderFront();
  }
  // Discovery of the empty window clears the records of an earlier one.
  if (!windowEntry) getGuiAssetsFromWindow(makeTutorialWindow(defaultContent));

  const Window window = tutorialWindow();
  if (!window) return false;
  bool added = false;
  for (const auto& [key, entry] : assets->entries()) {
    if (!makeControl(key, entry)) continue;
    // Adds the last control of the list. Without a list, as after termination, adds nothing, but
    // the entry still counts.
    const Controls controls = *state_->addedObjectToTutorial;
    if (controls->count() > 0) {
      const Control last = controls->elements().back();  // kept alive: adding may change the list
      window->contentView()->addSubview(last);
    }
    added = true;
  }
  window->makeKeyAndOrderFront();
  return added;
}

QZ_Plist_State_Parser::Window QZ_Plist_State_Parser::makeTutorialWindow(
    const toolkit::Rect& content) {
  Window window = state_->toolkit.application().makeWindow(
      content, toolkit::StyleMask::titledAndClosable, toolkit::BackingStore::buffered, true);
  state_->tutorialWindow.set(toolkit::StoredRef<toolkit::Window>::own(window));
  window->setBackgroundColor(toolkit::colors::black);
  // The buttons have no target: their actions reach the engine through the end of the responder
  // chain.
  window->setDelegate(shared_from_this());
  return window;
}

// Absent for an entry that makes no control.
QZ_Plist_State_Parser::Control QZ_Plist_State_Parser::makeControl(const Value& key,
                                                                  const Value& entry) {
  // Reads everything before the test of the class: a malformed entry raises, whatever its class.
  const std::string_view className = textOf(entry->objectAtIndex(0));
  const toolkit::Rect frame = rectOf(entry);
  const ControlPlan plan{*this, state_->toolkit.application(), state_->addedObjectToTutorial, key,
                         frame};
  const DescribedClass* const described = describedClass(className);
  return described && described->make ? described->make(plan) : Control();
}

bool QZ_Plist_State_Parser::createNextGuiAssetEntry(Dictionary* entries,
                                                    const std::optional<std::string>& forObject,
                                                    const toolkit::Rect& usingFrame,
                                                    std::uint64_t withTagId) {
  if (!entries || !*entries || !forObject) return false;
  const DescribedClass* const described = describedClass(*forObject);
  if (!described) return false;
  const auto number = [](double length) {
    return toolkit::Number::withFloat(static_cast<float>(length));
  };
  try {
    (*entries)->setObject(
        toolkit::Array::make(
            {toolkit::String::make(described->name), number(usingFrame.x), number(usingFrame.y),
             number(usingFrame.width), number(usingFrame.height)},
            toolkit::Mutability::immutable),
        std::to_string(withTagId));
    return true;
  } catch (const toolkit::Exception&) {
    return false;
  }
}

}  // namespace qz
