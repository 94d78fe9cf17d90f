// SPDX-License-Identifier: MIT
// Explores on a thread that ends with the walk-through. What it has found is complete before it is
// used, so that nothing is locked.

#include "qz/hosts/progress/exploring_meter.hpp"

#include <atomic>
#include <exception>
#include <thread>
#include <utility>

#include "engine/tag_key.hpp"
#include "hosts/progress/shares.hpp"
#include "qz/property_list/reader.hpp"

namespace qz::hosts::progress {

namespace {

using drivers::ViewKind;
using tools::check::ExplorationLimits;

ViewKind viewKindOf(ControlOutline::Kind kind) {
  switch (kind) {
    case ControlOutline::Kind::button:
      return ViewKind::button;
    case ControlOutline::Kind::textField:
      return ViewKind::textField;
    case ControlOutline::Kind::imageView:
      return ViewKind::imageView;
    case ControlOutline::Kind::other:
      break;
  }
  return ViewKind::plain;
}

tools::walkthrough::StagePlan planOf(const WindowOutline& window) {
  tools::walkthrough::StagePlan plan;
  for (const ControlOutline& control : window.controls) {
    tools::walkthrough::HostControl copy;
    copy.kind = viewKindOf(control.kind);
    copy.tag = control.tag;
    copy.frame = {0, 0, 10, 10};
    copy.hidden = control.isHidden;
    copy.enabled = control.isEnabled || !drivers::rowOf(copy.kind).isControl;
    plan.host.controls.push_back(copy);
  }
  return plan;
}

Shares sharesIn(const std::string& bytes, const WindowOutline& window,
                const ExplorationLimits& limits, const std::stop_token& stop) {
  const auto dictionary = toolkit::dictionaryFromPropertyList(bytes);
  const auto start = dictionary ? smallestTagKey(*dictionary) : std::nullopt;
  if (!start) return {};
  const tools::check::Script script(dictionary);
  const auto plan = planOf(window);
  const auto setting = tools::check::settingOf(script, plan, "");
  tools::check::Exploration exploration(setting, {*start});
  exploration.run(limits, 1, {.isCancelled = [&] { return stop.stop_requested(); }});
  return sharesOf(exploration);
}

// What cannot be explored is not known.
Shares explored(const std::string& bytes, const WindowOutline& window,
                const ExplorationLimits& limits, const std::stop_token& stop) {
  try {
    return sharesIn(bytes, window, limits, stop);
  } catch (const std::exception&) {
    return {};
  }
}

class ExploringMeter final : public ProgressMeter {
 public:
  explicit ExploringMeter(const ExplorationBounds& bounds)
      : limits_{.places = bounds.places, .bytes = bounds.bytes, .seconds = bounds.seconds} {}

  void begin(std::string script, WindowOutline window, std::function<void()> changed) override {
    end();
    worker_ = std::jthread([this, script = std::move(script), window = std::move(window),
                            changed = std::move(changed)](const std::stop_token& stop) {
      shares_ = explored(script, window, limits_, stop);
      isKnown_ = true;
      changed();
    });
  }

  std::optional<double> share(const WindowOutline& window) const override {
    if (!isKnown_) return std::nullopt;
    const auto found = shares_.find(signatureOf(window));
    return found == shares_.end() ? std::nullopt : std::optional(found->second);
  }

  // Waits for the end of a round of the exploration: a few milliseconds.
  void end() override {
    worker_ = {};
    isKnown_ = false;
  }

 private:
  const ExplorationLimits limits_;
  Shares shares_;
  std::atomic<bool> isKnown_ = false;
  std::jthread worker_;  // last, so that it ends before the rest
};

}  // namespace

std::shared_ptr<ProgressMeter> exploringMeter(const ExplorationBounds& bounds) {
  return std::make_shared<ExploringMeter>(bounds);
}

}  // namespace qz::hosts::progress
