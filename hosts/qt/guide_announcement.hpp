// SPDX-License-Identifier: MIT
// Tells assistive technology of a guide's steps.
#pragma once

#include <QString>

class QWidget;

namespace qz::hosts::qt {

class GuidePanel;

/// What the user is to hear of a step.
struct GuideMessage {
  QString heading;
  QString text;
  QString progress;
  QString control;  ///< the name of the control at which the guide points

  /// Returns the parts that are not empty as sentences.
  QString spoken() const;
  friend bool operator==(const GuideMessage&, const GuideMessage&) = default;
};

/// Returns what the panel shows. `control` is the one at which it points; null if there is none.
GuideMessage messageOf(const GuidePanel& panel, QWidget* control);

/// Makes the message the panel's name and description, and announces it. A button of the panel with
/// the focus has the message as its description, because a screen reader speaks at once what
/// changes of the object with the focus.
void announceStep(GuidePanel& panel, const GuideMessage& message);

/// Makes the message the panel's name and description without announcing a step.
void describe(GuidePanel& panel, const GuideMessage& message);

}  // namespace qz::hosts::qt
