// SPDX-License-Identifier: MIT
// Views and their kinds: they make up a window, and scripts act on them by tag.
//
// Callers send a View messages without checking its kind first. Functions that every view
// understands are pure here. Functions that only some kinds understand raise here ("unrecognized
// selector") and are overridden by those kinds. A superview owns its subviews; a control does not
// own its target or delegate.
#pragma once

#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "qz/api.hpp"
#include "qz/styled_text/attributed_string.hpp"
#include "qz/toolkit/geometry.hpp"
#include "qz/toolkit/image.hpp"
#include "qz/toolkit/ref.hpp"
#include "qz/toolkit/responder.hpp"
#include "qz/toolkit/tag.hpp"

namespace qz::toolkit {

class Button;
class Gradient;
class ImageView;
class TextField;
class View;

/// The direct subviews of a view, back to front.
using Subviews = std::vector<Ref<View>>;

/// A button's state. The `state` of a view without one is `off`.
enum class State : int { mixed = -1, off = 0, on = 1 };

/// A rectangle of a window that draws and has a tag.
class QZ_API View : public Responder {
 public:
  /// Returns the object behind absent references: it answers zero, NO or absent, and changes do
  /// nothing.
  static View& nothing();

  // --- what every view understands ---

  /// Returns the toolkit's run-time class name, such as "NSButton"; a subclass returns its own
  /// name.
  virtual std::string className() const = 0;

  /// Returns this view as a button or a subclass of it; null if it is of another kind
  /// (`isKindOfClass:`).
  virtual Button* asButton() { return nullptr; }
  /// The same for text fields.
  virtual TextField* asTextField() { return nullptr; }
  /// The same for image views.
  virtual ImageView* asImageView() { return nullptr; }
  /// The same for gradients.
  virtual Gradient* asGradient() { return nullptr; }

  /// Returns the number by which scripts find the view; a new view has the toolkit's default. Must
  /// not call foreign code: a search reads the tags while it walks a live list of views.
  virtual Tag tag() const = 0;
  /// Sets the number by which scripts know the view.
  virtual void setTag(Tag tag) = 0;

  /// Returns the position and size in the superview's coordinates.
  virtual Rect frame() const = 0;

  /// Returns the live list of direct subviews; valid until a subview is added or removed.
  virtual const Subviews& subviews() const = 0;
  /// Adds `view` in front of the other subviews and removes it from its previous superview.
  virtual void addSubview(const Ref<View>& view) = 0;

  /// Hides or shows the view, with all views in it.
  virtual void setHidden(bool hidden) = 0;
  /// Sets the tooltip to plain text; an empty text removes it.
  virtual void setToolTip(std::string_view text) = 0;
  /// Whether a redraw is pending. Does not request one.
  virtual bool needsDisplay() const = 0;

  /// Sets whether the view draws through a layer. Only a layer can have contents.
  virtual void setWantsLayer(bool wants) = 0;
  /// Shows `image`, scaled to fill the view's layer, behind the subviews; an absent image clears
  /// the layer. Does nothing without a layer.
  virtual void setLayerContents(const Ref<Image>& image) = 0;

  // --- what some kinds understand ---

  /// Enables or disables a control.
  virtual void setEnabled(bool enabled);
  /// Sets the message that a control sends.
  virtual void setAction(std::string_view action);
  /// Returns the text of a control.
  virtual std::string stringValue() const;
  /// Sets the text of a control.
  virtual void setStringValue(std::string_view text);
  /// Sets the text of a control with its attributes.
  virtual void setAttributedStringValue(const AttributedString&);
  /// Gives a button the pressed-in look, or takes it away.
  virtual void highlight(bool highlighted);
  /// Returns the displayed title with its attributes; absent only if the view itself is absent.
  virtual std::optional<AttributedString> attributedTitle() const;
  /// Sets the title of a button with its attributes.
  virtual void setAttributedTitle(const AttributedString& title);
  /// The only one of these that does not raise: a view without a state is off.
  virtual State state() const { return State::off; }
};

/// A view that the user can act on.
class QZ_API Control : public View {
 public:
  /// Sets whether the control accepts the user's input.
  void setEnabled(bool enabled) override = 0;
  /// Sets the receiver of the action, which is not kept alive. If it is absent or destroyed, the
  /// action travels along the responder chain.
  virtual void setTarget(const std::shared_ptr<Responder>& target) = 0;
  /// Sets the message sent when the user acts: a selector such as "buttonPushed:".
  void setAction(std::string_view action) override = 0;
  /// Sends `action` to `target`, or along the responder chain if it is null, with this control as
  /// the sender. True if a responder performed it. Works for disabled and hidden controls too.
  virtual bool sendAction(std::string_view action, const std::shared_ptr<Responder>& target) = 0;

  /// Returns the text.
  std::string stringValue() const override = 0;
  /// Shows plain text in the control's own font and colour.
  void setStringValue(std::string_view text) override = 0;
  /// Sets the text with its attributes.
  void setAttributedStringValue(const AttributedString& text) override = 0;
};

/// How a button's edge is drawn (`NSBezelStyle`).
enum class BezelStyle : int { rounded = 1, texturedSquare = 8 };

/// A push button, on/off button or three-state button.
class QZ_API Button : public Control {
 public:
  /// Returns the object behind absent references: it answers zero, NO or absent, and changes do
  /// nothing.
  static Button& nothing();
  Button* asButton() override { return this; }

  /// Sets the plain title, which replaces any attributed title.
  virtual void setTitle(std::string_view title) = 0;
  std::optional<AttributedString> attributedTitle() const override = 0;
  /// Sets the title with its attributes.
  void setAttributedTitle(const AttributedString& title) override = 0;

  State state() const override = 0;
  /// Sets the state without sending the action. A button without a mixed state turns on instead of
  /// mixed.
  virtual void setState(State state) = 0;

  /// Whether the button looks pressed in.
  virtual bool isHighlighted() const = 0;
  /// Gives the button the pressed-in look, or takes it away.
  void highlight(bool highlighted) override = 0;

  /// Sets the colour behind the title, within the bezel.
  virtual void setBackgroundColor(const Color& color) = 0;
  /// Sets how the button is drawn.
  virtual void setBezelStyle(BezelStyle style) = 0;
};

/// A text field, editable or used as a label.
class QZ_API TextField : public Control {
 public:
  /// Returns the object behind absent references: it answers zero, NO or absent, and changes do
  /// nothing.
  static TextField& nothing();
  /// Returns this text field.
  TextField* asTextField() override { return this; }

  /// Sets the text: a text field has no separate title.
  virtual void setTitle(std::string_view title) = 0;
  /// Sets the object that is notified of editing. Not kept alive.
  virtual void setDelegate(const std::shared_ptr<Responder>& delegate) = 0;
};

/// The frame around an image (`NSImageFrameStyle`).
enum class ImageFrameStyle : int { none = 0 };
/// How an image is fitted (`NSImageScaling`): shrunk to fit with its proportions, never enlarged.
enum class ImageScaling : int { proportionallyDown = 0 };
/// The position of an image that does not fill its view (`NSImageAlignment`).
enum class ImageAlignment : int { center = 0 };

/// A view that shows one image.
class QZ_API ImageView : public Control {
 public:
  /// Returns the object behind absent references: it answers zero, NO or absent, and changes do
  /// nothing.
  static ImageView& nothing();
  /// Returns this image view.
  ImageView* asImageView() override { return this; }

  /// Shows `image`; an absent image clears the view.
  virtual void setImage(const Ref<Image>& image) = 0;
  /// Sets the frame around the image.
  virtual void setImageFrameStyle(ImageFrameStyle style) = 0;
  /// Sets how the image is scaled.
  virtual void setImageScaling(ImageScaling scaling) = 0;
  /// Sets where the image is placed.
  virtual void setImageAlignment(ImageAlignment alignment) = 0;
};

/// A painted surface that a host uses like a button (the kind `NSGradient`). `setAction` raises, as
/// for a plain view, unless the toolkit overrides it.
class QZ_API Gradient : public View {
 public:
  /// Returns this gradient.
  Gradient* asGradient() override { return this; }
};

/// Returns `view` as a button; absent if it is absent or of another kind.
QZ_API Ref<Button> asButton(Ref<View> view);
/// Returns `view` as a text field; absent if it is absent or of another kind.
QZ_API Ref<TextField> asTextField(Ref<View> view);
/// Returns `view` as an image view; absent if it is absent or of another kind.
QZ_API Ref<ImageView> asImageView(Ref<View> view);

}  // namespace qz::toolkit
