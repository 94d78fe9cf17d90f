// SPDX-License-Identifier: MIT
// A script, and what lift makes of it.
#pragma once

#include <optional>
#include <string>

#include "tests/check/both_opinions.hpp"
#include "tests/check/joint_play.hpp"
#include "tools/lift/lift.hpp"
#include "tools/steps/compiler.hpp"
#include "tools/steps/source.hpp"

namespace qz::tools::lift {

class LiftedScript {
 public:
  LiftedScript(naive::Script script, walkthrough::HostWindow host, std::string resources = "")
      : host_(std::move(host)), resources_(std::move(resources)) {
    comparison::Played played{.script = script,
                              .plan = {},
                              .resources = resources_,
                              .startKeys = {check::opinions::startKeyOf(check::Script(script))}};
    played.plan.host = host_;
    plan_ = played.plan;
    original_ = {script, played.startKeys.front()};
    const InputFile file("script.plist", "a script", script, {});
    LiftOptions options;
    options.window = "window: host.plist";
    options.limits.places = 20000;
    try {
      lifted_ = liftScript(file, played, options);
    } catch (const Failure& failure) {
      refusal_ = failure.what();
    }
  }

  /// Returns why the script was refused; absent if it was not.
  const std::optional<std::string>& refusal() const { return refusal_; }
  const Lifted& lifted() const { return lifted_; }
  const std::string& source() const { return lifted_.source; }

  /// Builds the source, and plays both scripts side by side. Returns what differs; empty if nothing
  /// does.
  std::string difference(std::size_t mostPairs) const {
    naive::JointPlay play(original_, built(), host_, resources_);
    const auto difference = play.run(mostPairs);
    return difference ? difference->words + "\n" + lifted_.source : "";
  }

 private:
  naive::StartedScript built() const {
    const auto controls = [&](const auto&) { return steps::controlsOf(plan_, resources_); };
    const auto nothing = [](const std::string&) { return std::nullopt; };
    const auto read = steps::readSourceText("source", lifted_.source, {controls, nothing});
    steps::Mistakes mistakes;
    const auto built = steps::build(read.tour, {0}, mistakes);
    return {built.script, built.startKeys.front()};
  }

  walkthrough::HostWindow host_;
  std::string resources_;
  walkthrough::StagePlan plan_;
  naive::StartedScript original_;
  Lifted lifted_;
  std::optional<std::string> refusal_;
};

}  // namespace qz::tools::lift
