// SPDX-License-Identifier: MIT
// The steps of a walk-through, so that it can be taken up again.
#pragma once

#include <QString>
#include <functional>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "qz/engine.hpp"
#include "qz/observer.hpp"

namespace qz::hosts::qt {

/// One step: a press of a control, or a list that ran without one.
struct JournalStep {
  toolkit::Tag tag = 0;
  bool isPress = false;
  bool isOn = false;  ///< the state of the pressed control

  /// Returns the step as text, such as "press 20".
  QString text() const;
  /// Returns the step of such a text; absent for any other text.
  static std::optional<JournalStep> of(const QString& text);
};

/// Records the steps of an engine that it observes.
class Journal final : public Observer {
 public:
  /// What the journal tells while the engine works.
  struct Listener {
    std::function<void()> pressed;                        ///< a control
    std::function<void(toolkit::Tag key)> stepped;        ///< the list of a step begins to run
    std::function<void(const std::string& what)> failed;  ///< a command has raised
  };

  explicit Journal(Listener listener) : listener_(std::move(listener)) {}

  const std::vector<JournalStep>& steps() const { return steps_; }
  /// True while a step's list runs.
  bool isInsideStep() const { return depth_ > 0; }

  void controlPressed(const toolkit::Ref<toolkit::View>& control) override;
  void listWillRun(const Value& list, const ObjectId& id) override;
  void listDidRun(const Value& list, const ObjectId& id) override;
  void commandRaised(const Value& list, std::size_t index,
                     const toolkit::Exception& exception) override;
  void timerFired(std::string_view key) override;

 private:
  Listener listener_;
  std::vector<JournalStep> steps_;
  int depth_ = 0;             // of running lists
  bool isPressed_ = false;    // a press whose list has not begun
  toolkit::Tag running_ = 0;  // the key of the step
};

/// Makes a step again.
void repeat(const JournalStep& step, QZ_Plist_State_Parser& engine);

}  // namespace qz::hosts::qt
