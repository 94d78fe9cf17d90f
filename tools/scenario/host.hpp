// SPDX-License-Identifier: MIT
// The host of a scenario: its own objects, and its reactions to events.
#pragma once

#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "qz/toolkit/application.hpp"
#include "qz/toolkit/responder.hpp"
#include "tools/scenario/arguments.hpp"

namespace qz::tools::scenario {

/// The target of the controls named by `target`, and the delegate of the windows named by
/// `delegate`.
class HostResponder final : public toolkit::Responder {
 public:
  using Performed = std::function<void(const toolkit::Ref<toolkit::View>& sender)>;

  /// The action that the host understands.
  static constexpr std::string_view action = "hostAction:";

  explicit HostResponder(Performed performed) : performed_(std::move(performed)) {}
  bool tryToPerform(std::string_view name, const toolkit::Ref<toolkit::View>& sender) override;

 private:
  Performed performed_;
};

/// The delegate of every sheet: records the return codes and orders the sheet out.
class SheetRecorder final : public toolkit::SheetDelegate {
 public:
  explicit SheetRecorder(std::function<void()> ended) : ended_(std::move(ended)) {}
  void sheetDidEnd(const toolkit::Ref<toolkit::Window>& sheet, long returnCode,
                   void* contextInfo) override;
  const std::vector<long>& returnCodes() const { return returnCodes_; }

 private:
  std::function<void()> ended_;
  std::vector<long> returnCodes_;
};

/// The statements that `when` holds; each runs once, when its event happens.
class Reactions {
 public:
  /// An event: a log line, the host's action, or the end of a sheet.
  struct Event {
    enum class Kind { log, action, sheetEnd };
    Kind kind;
    std::string logLine;
    toolkit::Ref<toolkit::View> sender;
  };
  struct Reaction {
    std::string awaited;  ///< the event in words
    std::function<bool(const Event&)> isFor;
    const Statement* when;  ///< the statement that holds it; the scenario owns it and outlives this
    std::shared_ptr<const Statement> statement;
  };

  void add(Reaction reaction) { waiting_.push_back(std::move(reaction)); }
  /// Removes and returns the reactions to `event`.
  std::vector<Reaction> take(const Event& event);
  const std::vector<Reaction>& waiting() const { return waiting_; }

 private:
  std::vector<Reaction> waiting_;
};

}  // namespace qz::tools::scenario
