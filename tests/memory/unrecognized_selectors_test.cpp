// SPDX-License-Identifier: MIT
// Messages that a kind of view does not understand: they raise, naming the class and the selector.

#include <optional>

#include "qz/toolkit/exception.hpp"
#include "tests/memory/support.hpp"
#include "toolkit/memory/views.hpp"

namespace qz::toolkit::memory::test {
namespace {

struct Message {
  std::string_view selector;
  void (*send)(View&);
  bool controlsUnderstand;  // in addition to buttons, which understand them all
};

constexpr Message messages[] = {
    {"setEnabled:", [](View& view) { view.setEnabled(false); }, true},
    {"setAction:", [](View& view) { view.setAction("pressed:"); }, true},
    {"stringValue", [](View& view) { view.stringValue(); }, true},
    {"setStringValue:", [](View& view) { view.setStringValue("text"); }, true},
    {"setAttributedStringValue:",
     [](View& view) { view.setAttributedStringValue(AttributedString("text")); }, true},
    {"highlight:", [](View& view) { view.highlight(true); }, false},
    {"attributedTitle", [](View& view) { view.attributedTitle(); }, false},
    {"setAttributedTitle:", [](View& view) { view.setAttributedTitle(AttributedString("title")); },
     false},
};

/// Returns the reason of the exception that `message` raises, if any.
std::optional<std::string> reasonOf(const Message& message, View& view) {
  try {
    message.send(view);
  } catch (const InvalidArgumentException& exception) {
    return exception.reason();
  }
  return std::nullopt;
}

class UnrecognizedSelector : public MemoryTest {
 protected:
  static void expectRaises(const Message& message, View& view) {
    EXPECT_EQ(reasonOf(message, view), "-[" + view.className() + " " +
                                           std::string(message.selector) +
                                           "]: unrecognized selector sent to instance");
  }
  static void expectUnderstands(const Message& message, View& view) {
    EXPECT_EQ(reasonOf(message, view), std::nullopt) << view.className();
  }
};

TEST_F(UnrecognizedSelector, ButtonsUnderstandAll) {
  for (const drivers::ViewKind kind :
       {drivers::ViewKind::button, drivers::ViewKind::toggle, drivers::ViewKind::popUpButton}) {
    for (const Message& message : messages) expectUnderstands(message, *make(kind));
  }
}

TEST_F(UnrecognizedSelector, OtherControlsRaiseForWhatOnlyButtonsHave) {
  for (const drivers::ViewKind kind :
       {drivers::ViewKind::textField, drivers::ViewKind::imageView}) {
    for (const Message& message : messages) {
      const Ref<View> view = make(kind);
      message.controlsUnderstand ? expectUnderstands(message, *view) : expectRaises(message, *view);
    }
  }
}

TEST_F(UnrecognizedSelector, ViewsThatAreNoControlsRaise) {
  for (const drivers::ViewKind kind : {drivers::ViewKind::box, drivers::ViewKind::plain}) {
    for (const Message& message : messages) expectRaises(message, *make(kind));
  }
}

TEST_F(UnrecognizedSelector, AViewOfAHostsOwnRaisesUnderItsOwnName) {
  const auto gradient =
      std::make_shared<MemoryView<Gradient>>("NSGradient", Rect{}, toolkit.application().screen());
  window->contentView()->addSubview(Ref<View>(gradient));
  EXPECT_EQ(gradient->asGradient(), gradient.get());
  for (const Message& message : messages) expectRaises(message, *gradient);
  EXPECT_EQ(driver.look(Ref<View>(gradient)).kind, drivers::ViewKind::plain);
}

TEST_F(UnrecognizedSelector, EveryViewHasAState) {
  for (const drivers::ViewKind kind :
       {drivers::ViewKind::textField, drivers::ViewKind::imageView, drivers::ViewKind::box}) {
    EXPECT_EQ(make(kind)->state(), State::off);
  }
}

TEST_F(UnrecognizedSelector, AReferenceToAKindSharesTheView) {
  const struct {
    drivers::ViewKind kind;
    bool button, textField, imageView;
  } cases[] = {
      {drivers::ViewKind::button, true, false, false},
      {drivers::ViewKind::popUpButton, true, false, false},
      {drivers::ViewKind::textField, false, true, false},
      {drivers::ViewKind::imageView, false, false, true},
      {drivers::ViewKind::box, false, false, false},
      {drivers::ViewKind::plain, false, false, false},
  };
  for (const auto& c : cases) {
    Ref<View> view = driver.makeView(c.kind, 5, {}, nullptr);
    const Ref<View> kinds[] = {asButton(view), asTextField(view), asImageView(view)};
    const bool expected[] = {c.button, c.textField, c.imageView};
    view = nullptr;
    for (int i = 0; i < 3; ++i) EXPECT_EQ(kinds[i]->tag(), expected[i] ? 5 : 0);
  }
}

}  // namespace
}  // namespace qz::toolkit::memory::test
