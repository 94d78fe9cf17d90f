// SPDX-License-Identifier: MIT
// Plays a walk-through in a Qt application, from beginning to end, with one call.
//
// Does the work common to all hosts: keeps the windows alive while a walk-through needs them, keeps
// a form open when the end of its walk-through would close it, takes a sheet off the screen, and
// ends the walk-through when the user closes the window or dismisses the sheet.
#pragma once

#include <QPointer>
#include <QWidget>
#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <utility>

#include "qz/api.hpp"
#include "qz/engine.hpp"
#include "qz/toolkit/qt/adoption.hpp"
#include "qz/toolkit/qt/qt_toolkit.hpp"

namespace qz::hosts::qt {

/// Plays one walk-through at a time: beginning another ends the previous one.
class QZ_API WalkThrough {
 public:
  /// `toolkit` must outlive this object.
  explicit WalkThrough(toolkit::qt::QtToolkit& toolkit);
  ~WalkThrough();
  WalkThrough(const WalkThrough&) = delete;
  WalkThrough& operator=(const WalkThrough&) = delete;

  /// Plays a script (an absolute path, or one relative to the toolkit's resource directory) in a
  /// top-level widget, starting with the list of its smallest tag. Plays nothing, logs the reason
  /// and gives NO if the file is missing or not a script, no key is a tag, the value under the
  /// smallest tag is not a list, lists run each other endlessly, or another walk-through is
  /// beginning (as in `whenOver` of the previous one).
  bool play(std::string_view script, QWidget& window);
  /// The same in `panel`, a top-level widget, which is shown as a sheet over `window`.
  bool playInSheet(std::string_view script, QWidget& panel, QWidget& window);
  /// Ends the walk-through, if one is running. A walk-through also ends when its window is closed,
  /// hidden (as a dialog is by its buttons and Escape, even if it is shown again at once) or
  /// destroyed, or when its main window gets another central widget.
  void end();

  /// Sets how the following walk-throughs take over their windows: which widgets are the controls,
  /// and how they are treated.
  void setAdoption(toolkit::qt::Adoption adoption) { adoption_ = std::move(adoption); }

  /// Sets a function that is called after the end of every walk-through, when it no longer uses the
  /// widgets.
  void whenOver(std::function<void()> told) { over_ = std::move(told); }

  /// Returns the engine; null if no walk-through is running.
  const std::shared_ptr<QZ_Plist_State_Parser>& engine() const { return engine_; }

 private:
  class Watch;

  std::shared_ptr<QZ_Plist_State_Parser> load(const std::string& script,
                                              const toolkit::Ref<toolkit::Window>& window);
  bool begin(std::string_view script, QWidget& stage, QWidget& window);
  void refuse(const std::string& script, const std::string& reason);

  toolkit::qt::QtToolkit& toolkit_;
  toolkit::qt::Adoption adoption_;
  // Kept alive while the engine runs: the window given to it, and the one with the controls.
  toolkit::Ref<toolkit::Window> parent_;
  std::unique_ptr<toolkit::qt::AdoptedWindow> adopted_;
  std::shared_ptr<QZ_Plist_State_Parser> engine_;
  std::shared_ptr<Watch> watch_;
  std::function<void()> over_;
  bool isBeginning_ = false;
};

}  // namespace qz::hosts::qt
