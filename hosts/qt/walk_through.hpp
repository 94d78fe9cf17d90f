// SPDX-License-Identifier: MIT
// Walk-throughs in a Qt application, from their beginning to their end, in one call.
//
// It does what every host would: it holds the windows while a walk-through needs them, keeps a form
// open that the end of its walk-through would close, takes a sheet off the screen, and ends the
// walk-through when its user closes the window or sends the sheet away.
#pragma once

#include <QPointer>
#include <QWidget>
#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "QZ_Plist_State_Parser.hpp"
#include "toolkit/qt/qt_toolkit.hpp"

namespace hosts::qt {

/// At most one walk-through at a time: beginning another ends the one before.
class WalkThrough {
 public:
  /// `toolkit` outlives it.
  explicit WalkThrough(toolkit::qt::QtToolkit& toolkit);
  ~WalkThrough();
  WalkThrough(const WalkThrough&) = delete;
  WalkThrough& operator=(const WalkThrough&) = delete;

  /// Plays a script (an absolute path, or one relative to the toolkit's resource directory) over a
  /// top-level widget, from its list with the smallest tag. NO, a line in the log that says why,
  /// and nothing played, when the file is missing or is not a script, when no key is a tag, when
  /// the value under the smallest tag is not a list, when lists run each other without end, and
  /// while another walk-through is beginning, as in `whenOver` of the one before.
  bool play(std::string_view script, QWidget& window);
  /// The same in `panel`, a top-level widget that is shown as a sheet over `window`.
  bool playInSheet(std::string_view script, QWidget& panel, QWidget& window);
  /// Ends the walk-through, if there is one. It also ends with its window: when that is closed,
  /// hidden (as a dialog is by its buttons and Escape), also if it is shown again at once, or
  /// destroyed, and when a main window is given another central widget.
  void end();

  /// Told after the end of each, however it came, when nothing of it is left in the widgets: the
  /// time to connect the clicks again that it took.
  void whenOver(std::function<void()> told) { over_ = std::move(told); }

  /// Null while none goes on.
  const std::shared_ptr<QZ_Plist_State_Parser>& engine() const { return engine_; }

 private:
  class Watch;

  std::shared_ptr<QZ_Plist_State_Parser> load(const std::string& script,
                                              const toolkit::Ref<toolkit::Window>& window);
  bool begin(std::string_view script, QWidget& stage, QWidget& window);
  void refuse(const std::string& script, const std::string& reason);

  toolkit::qt::QtToolkit& toolkit_;
  std::vector<toolkit::Ref<toolkit::Window>> windows_;  // held as long as the engine goes on
  std::shared_ptr<QZ_Plist_State_Parser> engine_;
  std::shared_ptr<Watch> watch_;
  std::function<void()> over_;
  bool isBeginning_ = false;
};

}  // namespace hosts::qt
