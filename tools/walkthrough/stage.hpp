// SPDX-License-Identifier: MIT
// What a walk-through is played on: the host's windows and the engine.
#pragma once

#include <memory>
#include <optional>
#include <string>

#include "qz/drivers/driver.hpp"
#include "qz/engine.hpp"
#include "tools/walkthrough/host_window.hpp"
#include "tools/walkthrough/names.hpp"

namespace qz::tools::walkthrough {

/// No file can have this path: an engine that loads it keeps the script that it has.
inline constexpr const char* noFile = "/dev/null/no-script";

/// What a walk-through is played on. Without a window and a description, its window is made from
/// the script itself.
struct StageOptions {
  std::optional<std::string> window;  ///< path of the host's window; or
  /// The host's window, if that file has been read already; Qt reads forms on one thread only.
  std::shared_ptr<const HostWindow> host;
  std::optional<std::string> assets;  ///< path of a description from which the engine builds one
  bool sheet = false;                 ///< show it as a sheet over another window of the host
  Names names{};                      ///< of the script's source
};

/// What the options name, read from its files, so that any number of stages can be set up from it.
struct StagePlan {
  HostWindow host;       ///< without a description
  std::string hostFile;  ///< for messages
  QZ_Plist_State_Parser::Dictionary
      description;  ///< of the window that the engine builds; or absent
  bool sheet = false;
  Names names{};
};

/// Reads the host's window or the description that the options name; without either, makes a window
/// from the script itself. `path` is the script's file. Throws a Failure if a file does not hold
/// what it should.
StagePlan planStage(const StageOptions& options, const QZ_Plist_State_Parser::Dictionary& script,
                    const std::string& path);

/// Sets up the walk-through window as planned. The driver must outlive it. Terminates the engine on
/// destruction, because the engine's timers would keep it alive.
class Stage {
 public:
  /// Throws a Failure if an image of the host's window is unknown.
  Stage(drivers::Driver& driver, const StagePlan& plan);
  ~Stage();
  Stage(const Stage&) = delete;
  Stage& operator=(const Stage&) = delete;

  QZ_Plist_State_Parser& engine() { return *engine_; }
  /// Returns the walk-through window's title; empty if it has none.
  const std::string& title() const { return title_; }

  /// Loads the script at an absolute path and runs its list under `startKey`, if there is a key.
  /// Passes exceptions on.
  bool load(const std::string& script, const std::optional<std::string>& startKey);
  /// The same with a script that is not in a file.
  bool start(const QZ_Plist_State_Parser::Dictionary& script,
             const std::optional<std::string>& startKey);

 private:
  void buildFrom(const QZ_Plist_State_Parser::Dictionary& description);
  void adopt(const HostWindow& host, const std::string& file);

  drivers::Driver& driver_;
  bool sheet_;
  std::string title_;
  toolkit::Ref<toolkit::Window> parent_;  // of the sheet; absent when there is none
  toolkit::Ref<toolkit::Window> adopted_;
  std::shared_ptr<toolkit::SheetDelegate> delegate_;
  std::shared_ptr<QZ_Plist_State_Parser> engine_;
};

}  // namespace qz::tools::walkthrough
