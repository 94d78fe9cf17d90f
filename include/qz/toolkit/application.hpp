// SPDX-License-Identifier: MIT
// The application: makes windows and controls, and runs sheets.
#pragma once

#include <memory>

#include "qz/api.hpp"
#include "qz/toolkit/geometry.hpp"
#include "qz/toolkit/ref.hpp"
#include "qz/toolkit/view.hpp"
#include "qz/toolkit/window.hpp"

namespace qz::toolkit {

/// Notified when a sheet ends.
class QZ_API SheetDelegate {
 public:
  virtual ~SheetDelegate() = default;

  /// `sheet` was ended with `returnCode`; `contextInfo` is the one given to `beginSheet`. The sheet
  /// is still on the screen: the delegate must order it out.
  virtual void sheetDidEnd(const Ref<Window>& sheet, long returnCode, void* contextInfo) = 0;
};

/// Makes windows and controls, and shows sheets.
class QZ_API Application {
 public:
  virtual ~Application() = default;

  /// Makes a hidden window whose content view has the size of `content`, a rectangle in screen
  /// coordinates. With `defer` it takes up screen resources only when shown. The caller and, while
  /// it is on the screen, the application keep it alive. Absent on failure.
  virtual Ref<Window> makeWindow(const Rect& content, StyleMask style, BackingStore backing,
                                 bool defer) = 0;

  /// Make controls that are not yet in a window: a push button, an image view without an image, an
  /// empty text field. Their tags are the toolkit's default.
  virtual Ref<Button> makeButton(const Rect& frame) = 0;
  /// Makes an image view. It has no superview yet.
  virtual Ref<ImageView> makeImageView(const Rect& frame) = 0;
  /// Makes a text field. It has no superview yet.
  virtual Ref<TextField> makeTextField(const Rect& frame) = 0;

  /// Shows `sheet` attached to `parent`, whose input is blocked until the sheet is ordered out. An
  /// absent parent shows it on its own. The delegate may be null and is not kept alive.
  virtual void beginSheet(const Ref<Window>& sheet, const Ref<Window>& parent,
                          const std::shared_ptr<SheetDelegate>& delegate, void* contextInfo) = 0;

  /// Ends `sheet` and notifies its delegate once, before this returns. Does nothing if the window
  /// is not a sheet or was already ended.
  virtual void endSheet(const Ref<Window>& sheet, long returnCode) = 0;
};

}  // namespace qz::toolkit
