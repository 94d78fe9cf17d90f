// SPDX-License-Identifier: MIT
// Windows.
#pragma once

#include <memory>

#include "qz/api.hpp"
#include "qz/toolkit/ref.hpp"
#include "qz/toolkit/responder.hpp"
#include "qz/toolkit/view.hpp"

namespace qz::toolkit {

/// Bits of a window's style mask (`NSWindowStyleMask`).
enum class StyleMask : unsigned { titled = 1, closable = 2, titledAndClosable = 3 };
/// How a window's pixels are stored (`NSBackingStoreType`).
enum class BackingStore : unsigned { buffered = 2 };

/// A window: content in a frame, on the screen or not.
class QZ_API Window {
 public:
  virtual ~Window() = default;
  /// Returns the object behind absent references: it answers zero, NO or absent, and changes do
  /// nothing.
  static Window& nothing();

  /// Returns the view that holds the window's controls; owned by the window.
  virtual Ref<View> contentView() const = 0;

  /// Returns the object that is notified of the window's events and ends its responder chain; null
  /// if there is none or it was destroyed. The window does not keep it alive.
  virtual std::shared_ptr<Responder> delegate() const = 0;
  /// Sets who hears of the window's events; it is not kept alive.
  virtual void setDelegate(const std::shared_ptr<Responder>& delegate) = 0;

  /// Sets the colour behind the content.
  virtual void setBackgroundColor(const Color& color) = 0;

  /// Shows the window in front of the others and gives it the keyboard focus.
  virtual void makeKeyAndOrderFront() = 0;
  /// Takes the window off the screen; it can be shown again. A sheet leaves its parent.
  virtual void orderOut() = 0;
  /// Takes the window off the screen; the application no longer keeps it alive.
  virtual void close() = 0;
};

}  // namespace qz::toolkit
