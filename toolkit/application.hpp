// SPDX-License-Identifier: MIT
// The application: makes windows and controls, and runs sheets.
#pragma once

#include <memory>

#include "toolkit/geometry.hpp"
#include "toolkit/ref.hpp"
#include "toolkit/view.hpp"
#include "toolkit/window.hpp"

namespace toolkit {

/// Who is told that a sheet ended.
class SheetDelegate {
 public:
  virtual ~SheetDelegate() = default;

  /// `sheet` was ended with `returnCode`; `contextInfo` is what its beginning was given. The sheet
  /// is still on the screen: ordering it out is the delegate's part.
  virtual void sheetDidEnd(const Ref<Window>& sheet, long returnCode, void* contextInfo) = 0;
};

class Application {
 public:
  virtual ~Application() = default;

  /// Makes a window, not yet shown, with a content view of the rectangle's size. `content` is in
  /// screen coordinates. With `defer` it takes up resources of the screen only when shown. Kept
  /// alive by the caller and, while it is on the screen, by the application. Absent on failure.
  virtual Ref<Window> makeWindow(const Rect& content, StyleMask style, BackingStore backing,
                                 bool defer) = 0;

  /// Make controls that are not yet in a window: a push button, an image view without an image, an
  /// empty text field. Their tags are the toolkit's default.
  virtual Ref<Button> makeButton(const Rect& frame) = 0;
  virtual Ref<ImageView> makeImageView(const Rect& frame) = 0;
  virtual Ref<TextField> makeTextField(const Rect& frame) = 0;

  /// Shows `sheet` attached to `parent`, whose input is blocked until the sheet is ordered out. An
  /// absent parent shows it on its own. The delegate may be null and is not kept alive.
  virtual void beginSheet(const Ref<Window>& sheet, const Ref<Window>& parent,
                          const std::shared_ptr<SheetDelegate>& delegate, void* contextInfo) = 0;

  /// Ends `sheet`: its delegate is told once, before this returns. Of a window that is no sheet, or
  /// was ended already, nothing comes.
  virtual void endSheet(const Ref<Window>& sheet, long returnCode) = 0;
};

}  // namespace toolkit
