// SPDX-License-Identifier: MIT
// Target and action, the responder chain, and how an action may affect its sender.

#include <string>
#include <vector>

#include "tests/memory/support.hpp"
#include "toolkit/memory/views.hpp"

namespace qz::toolkit::memory::test {
namespace {

/// A host's own view that takes part in the responder chain.
class HostView : public MemoryView<View> {
 public:
  HostView(const std::shared_ptr<Screen>& screen, std::shared_ptr<Recorder> recorder)
      : MemoryView("HostView", {}, screen), recorder_(std::move(recorder)) {}
  bool tryToPerform(std::string_view action, const Ref<View>& sender) override {
    return recorder_->tryToPerform(action, sender);
  }

 private:
  std::shared_ptr<Recorder> recorder_;
};

class ResponderChain : public MemoryTest {
 protected:
  ResponderChain() { window->setDelegate(delegate); }

  std::shared_ptr<Recorder> delegate = std::make_shared<Recorder>();
  std::shared_ptr<Recorder> target = std::make_shared<Recorder>();
};

TEST_F(ResponderChain, TheTargetPerformsTheAction) {
  driver.click(makeButton(target, drivers::ViewKind::button, 7));
  EXPECT_EQ(target->senders, std::vector<Tag>{7});
  EXPECT_TRUE(delegate->asked.empty());
}

TEST_F(ResponderChain, WithoutATargetTheActionReachesTheWindowsDelegate) {
  driver.click(makeButton(nullptr, drivers::ViewKind::button, 7));
  EXPECT_EQ(delegate->senders, std::vector<Tag>{7});
}

TEST_F(ResponderChain, WithATargetThatIsGoneItDoesToo) {
  const Ref<Button> button = makeButton(target);
  target = nullptr;
  EXPECT_EQ(driver.look(button).target, nullptr);
  driver.click(button);
  EXPECT_EQ(delegate->senders.size(), 1U);
}

TEST_F(ResponderChain, ATargetThatDoesNotUnderstandEndsIt) {
  const Ref<Button> button = makeButton(target);
  EXPECT_FALSE(button->sendAction("other:", target));
  EXPECT_EQ(target->asked, std::vector<std::string>{"other:"});
  EXPECT_TRUE(delegate->asked.empty());
}

TEST_F(ResponderChain, SuperviewsAreAskedFromTheInsideOut) {
  std::vector<std::string> order;
  const auto link = [&](const std::string& understood, const std::string& name) {
    auto recorder = std::make_shared<Recorder>(understood);
    recorder->perform = [&order, name](const Ref<View>&) { order.push_back(name); };
    return std::make_shared<HostView>(toolkit.application().screen(), recorder);
  };
  const auto outer = link("pressed:", "outer");
  const auto inner = link("other:", "inner");
  window->contentView()->addSubview(Ref<View>(outer));
  outer->addSubview(Ref<View>(inner));
  const Ref<Button> button = makeButton(nullptr);
  inner->addSubview(button);
  EXPECT_TRUE(button->sendAction("pressed:", nullptr));
  EXPECT_TRUE(button->sendAction("other:", nullptr));
  EXPECT_EQ(order, (std::vector<std::string>{"outer", "inner"}));
  EXPECT_TRUE(delegate->asked.empty());
}

TEST_F(ResponderChain, SendActionTellsWhetherAnybodyPerformedIt) {
  const Ref<Button> button = makeButton(nullptr);
  EXPECT_TRUE(button->sendAction("pressed:", target));
  EXPECT_TRUE(button->sendAction("pressed:", nullptr));
  EXPECT_FALSE(button->sendAction("unknown:", nullptr));
  EXPECT_FALSE(button->sendAction("", target));
  window->setDelegate(nullptr);
  EXPECT_FALSE(button->sendAction("pressed:", nullptr));
  driver.removeFromSuperview(button);
  EXPECT_FALSE(button->sendAction("pressed:", nullptr));
}

TEST_F(ResponderChain, SendActionAsksNeitherForEnabledNorForHidden) {
  const Ref<Button> button = makeButton(nullptr);
  button->setEnabled(false);
  button->setHidden(true);
  EXPECT_TRUE(button->sendAction("pressed:", nullptr));
  EXPECT_EQ(delegate->senders.size(), 1U);
}

TEST_F(ResponderChain, AControlWithoutAnActionSendsNone) {
  const Ref<Button> button = makeButton(target);
  EXPECT_EQ(driver.look(button).action, "pressed:");
  button->setAction("");
  EXPECT_EQ(driver.look(button).action, std::nullopt);
  driver.click(button);
  EXPECT_TRUE(target->asked.empty());
}

TEST_F(ResponderChain, AWindowDoesNotKeepItsDelegate) {
  const std::weak_ptr<Recorder> watched = delegate;
  delegate = nullptr;
  EXPECT_TRUE(watched.expired());
  EXPECT_EQ(window->delegate(), nullptr);
  EXPECT_FALSE(makeButton(nullptr)->sendAction("pressed:", nullptr));
}

// --- how an action may affect its sender ---

TEST_F(ResponderChain, AControlMayRemoveItselfInItsAction) {
  const std::shared_ptr<Responder> receivers[] = {nullptr, target};
  target->perform = delegate->perform = [this](const Ref<View>& sender) {
    driver.removeFromSuperview(sender);
    EXPECT_EQ(sender->tag(), 3);
  };
  for (const auto& receiver : receivers) {
    const std::weak_ptr<View> watched =
        makeButton(receiver, drivers::ViewKind::button, 3).pointer();
    // A plain pointer, so that only the superview keeps the button.
    View* const button = watched.lock().get();
    dynamic_cast<MemoryButton*>(button)->click();
    EXPECT_TRUE(watched.expired());
  }
  EXPECT_EQ(delegate->senders, std::vector<Tag>{3});
  EXPECT_EQ(target->senders, std::vector<Tag>{3});
}

TEST_F(ResponderChain, TheWindowMayEndInAnAction) {
  const std::weak_ptr<View> button = makeButton(nullptr, drivers::ViewKind::button, 3).pointer();
  delegate->perform = [&](const Ref<View>& sender) {
    window = nullptr;
    sender->setTag(4);
    EXPECT_EQ(sender->tag(), 4);
  };
  driver.click(button.lock());
  EXPECT_TRUE(button.expired());
  EXPECT_TRUE(toolkit.application().screen()->windows().empty());
}

TEST_F(ResponderChain, ATargetMayEndInItsAction) {
  const Ref<Button> button = makeButton(nullptr);
  const std::weak_ptr<Recorder> watched = target;
  Tag sender = 0;
  std::shared_ptr<Responder> receiver = std::move(target);  // the only reference
  watched.lock()->perform = [&](const Ref<View>&) {
    receiver = nullptr;
    sender = watched.lock()->senders.front();
  };
  EXPECT_TRUE(button->sendAction("pressed:", receiver));
  EXPECT_TRUE(watched.expired());
  EXPECT_EQ(sender, 1);
}

TEST_F(ResponderChain, AnActionMayReplaceTheActionThatIsBeingSent) {
  const std::string action(100, 'a');
  const auto recorder = std::make_shared<Recorder>(action);
  const Ref<Button> button = makeButton(recorder);
  button->setAction(action);
  recorder->perform = [&](const Ref<View>& sender) { sender->setAction(std::string(200, 'b')); };
  driver.click(button);
  EXPECT_EQ(recorder->performed, std::vector<std::string>{action});
}

TEST_F(ResponderChain, AnActionMayPressAgain) {
  const Ref<Button> button = makeButton(nullptr, drivers::ViewKind::toggle);
  delegate->perform = [&](const Ref<View>&) {
    if (delegate->senders.size() < 3) driver.click(button);
  };
  driver.click(button);
  EXPECT_EQ(delegate->senders.size(), 3U);
  EXPECT_EQ(button->state(), State::on);
}

}  // namespace
}  // namespace qz::toolkit::memory::test
