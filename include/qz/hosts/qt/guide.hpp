// SPDX-License-Identifier: MIT
// A panel for the texts and buttons of a walk-through, beside the control that a step is about.
//
// A script drives it with its ordinary commands: what the panel shows are controls with tags, and
// they belong to the form's window. One of them is a text field that nobody sees: its text is the
// tag of the control at which the guide points. An empty text points at nothing.
#pragma once

#include <QWidget>
#include <memory>
#include <optional>

#include "qz/api.hpp"
#include "qz/toolkit/qt/qt_toolkit.hpp"
#include "qz/toolkit/tag.hpp"

namespace qz::hosts::qt {

/// The tags of a guide's controls. They must differ from those of the form.
struct GuideTags {
  toolkit::Tag heading = 901;   ///< a text field
  toolkit::Tag text = 902;      ///< a text field
  toolkit::Tag picture = 903;   ///< an image view
  toolkit::Tag progress = 904;  ///< a text field, such as "2 of 5"
  toolkit::Tag target = 905;    ///< a hidden text field: the tag of the control to point at
  toolkit::Tag skip = 906;      ///< a button
  /// Buttons. The tags after each are free for a script that gives the button another tag for each
  /// step.
  toolkit::Tag back = 1000;
  toolkit::Tag next = 2000;
};

/// What a guide looks like, and which keys it has.
struct GuideOptions {
  GuideTags tags = {};
  /// Whether the control has a frame around it.
  bool frame = true;
  /// Whether the rest of the window is dimmed. With high contrast nothing is dimmed.
  bool dimming = true;
  /// Whether the panel takes the keyboard focus when it appears, if the form is the active window.
  /// Later steps leave the focus where the user has put it. But while a step has no Next, because
  /// the user is to press the control itself, the control has the focus that the panel had.
  bool takesFocus = true;
  /// Whether the panel comes right after the control in the order of the Tab key. Otherwise Tab
  /// stays within the panel or within the form.
  bool tab = true;
  /// Whether Enter in the panel presses the button with the focus, or else Next.
  bool enter = true;
  /// Whether Escape in the panel presses Skip.
  bool escape = true;
  /// Whether the panel stays inside the form's window. Otherwise it is a window of its own, which
  /// keeps on the screen. Absent means: inside on Wayland, where programs cannot place windows.
  std::optional<bool> insideWindow = std::nullopt;
};

/// A panel over a form. It appears when a command gives it a heading, a text or a picture, and
/// disappears when it has none, as at the end of a walk-through, which restores what it was. It
/// moves with the form and the control, and never changes the form's layout.
class QZ_API Guide {
 public:
  /// Makes the panel, hidden. `toolkit` must outlive this object, and `form`, a top-level widget,
  /// need not. Make it before the walk-through begins.
  Guide(toolkit::qt::QtToolkit& toolkit, QWidget& form, const GuideOptions& options = {});
  /// Removes the panel, even during a walk-through, which then no longer has the guide's controls.
  ~Guide();
  Guide(const Guide&) = delete;
  Guide& operator=(const Guide&) = delete;

  /// Empties the panel, so that it disappears. Only a host whose walk-throughs restore nothing but
  /// the tags needs this, at their ends.
  void clear();

  /// Returns the panel, for example to give it a style sheet; null if the form is gone.
  QWidget* panel() const;
  /// Returns the control at which the guide points; null if there is none.
  QWidget* target() const;

 private:
  class Stage;

  const std::unique_ptr<Stage> stage_;
};

}  // namespace qz::hosts::qt
