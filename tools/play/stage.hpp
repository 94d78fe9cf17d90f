// SPDX-License-Identifier: MIT
// What a walk-through is played on: the host's windows and the engine.
#pragma once

#include <memory>
#include <string>

#include "QZ_Plist_State_Parser.hpp"
#include "toolkit/test_driver.hpp"
#include "tools/play/host_window.hpp"
#include "tools/play/play.hpp"

namespace tools::play {

/// Sets the walk-through window up as the options say, from the host's window, from a description,
/// or, without either, from the script itself. The driver outlives it; at its end the engine is
/// terminated, for its timers would keep it alive.
class Stage {
 public:
  /// A Failure when a file is not what it should be.
  Stage(toolkit::TestDriver& driver, const PlayOptions& options,
        const QZ_Plist_State_Parser::Dictionary& script);
  ~Stage();
  Stage(const Stage&) = delete;
  Stage& operator=(const Stage&) = delete;

  QZ_Plist_State_Parser& engine() { return *engine_; }
  /// The walk-through window's title; empty when it has none.
  const std::string& title() const { return title_; }

  /// Loads the script at an absolute path and runs its list under `startKey`. What a list raises
  /// flies through.
  bool load(const std::string& script, const std::string& startKey);

 private:
  void buildFrom(const std::string& descriptionFile);
  void adopt(const HostWindow& host, const std::string& file);

  toolkit::TestDriver& driver_;
  bool sheet_;
  std::string title_;
  toolkit::Ref<toolkit::Window> parent_;  // of the sheet; absent when there is none
  toolkit::Ref<toolkit::Window> adopted_;
  std::shared_ptr<toolkit::SheetDelegate> delegate_;
  std::shared_ptr<QZ_Plist_State_Parser> engine_;
};

}  // namespace tools::play
