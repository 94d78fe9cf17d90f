// SPDX-License-Identifier: MIT
// Which widgets of a host's window are the controls of a walk-through, and how it treats them.
#pragma once

#include <QString>
#include <cstdint>
#include <map>
#include <memory>

#include "qz/api.hpp"
#include "qz/toolkit/qt/qt_toolkit.hpp"
#include "qz/toolkit/tag.hpp"
#include "qz/toolkit/window.hpp"

namespace qz::toolkit::qt {

class AdoptedForm;

/// How a walk-through takes over a window.
struct QZ_API Adoption {
  /// Which widgets are controls.
  enum class Reading : std::uint8_t {
    everyTaggedWidget,  ///< every widget with a tag, however deep, in the order of the widget tree
    directSubviews      ///< the direct children of the content, with and without a tag
  };
  /// What the end of an adoption restores.
  enum class Restoring : std::uint8_t {
    everything,  ///< all that commands have changed, unless somebody else has changed it since
    tags         ///< only the tags, as the engine does on its own
  };

  /// Which widgets are controls.
  Reading reading = Reading::everyTaggedWidget;
  /// The tags of widgets and actions by their object names. An object's own tag, the dynamic
  /// property `qzTag`, counts more.
  std::map<QString, Tag> tags = {};
  /// Whether a command that shows a control, flashes it or changes what it shows brings it into
  /// view: opens its tab, page, dock or pane, and scrolls to it.
  bool bringsIntoView = true;
  /// What the end of the adoption restores.
  Restoring restoring = Restoring::everything;
};

/// Presents a top-level widget of the host to a walk-through while it lives. An action that a tool
/// bar shows is the control that shows it there. Writes a line to the log for each tag that no
/// command can reach.
class QZ_API AdoptedWindow {
 public:
  /// `toolkit` must outlive this object; `window` need not.
  AdoptedWindow(QtToolkit& toolkit, QWidget& window, Adoption how = {});
  /// Restores what the adoption is to restore.
  ~AdoptedWindow();
  AdoptedWindow(const AdoptedWindow&) = delete;
  AdoptedWindow& operator=(const AdoptedWindow&) = delete;

  /// Returns the window for the engine. Its content view holds the controls.
  const Ref<Window>& window() const { return window_; }

 private:
  std::shared_ptr<AdoptedForm> form_;
  Ref<Window> window_;
};

}  // namespace qz::toolkit::qt
