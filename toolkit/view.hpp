// SPDX-License-Identifier: MIT
// Views and their kinds: what a window shows, and what a script drives by tag.
//
// A View is sent messages without being asked first what it is. What every view understands is pure
// here; what only some kinds understand raises here ("unrecognized selector") and is overridden by
// those that do. A superview owns its subviews; a control does not own its target or delegate.
#pragma once

#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "toolkit/geometry.hpp"
#include "toolkit/image.hpp"
#include "toolkit/ref.hpp"
#include "toolkit/responder.hpp"
#include "toolkit/styled_text/attributed_string.hpp"
#include "toolkit/tag.hpp"

namespace toolkit {

class Button;
class Gradient;
class ImageView;
class TextField;
class View;

/// The direct subviews of a view, back to front.
using Subviews = std::vector<Ref<View>>;

/// A button's state; `state` of anything that has none is `off`.
enum class State : int { mixed = -1, off = 0, on = 1 };

class View : public Responder {
 public:
  static View& nothing();

  // --- what every view understands ---

  /// The toolkit's run-time class name, such as "NSButton"; a subclass reports its own.
  virtual std::string className() const = 0;

  /// Itself as the kind named, subclasses included, or null (`isKindOfClass:`).
  virtual Button* asButton() { return nullptr; }
  virtual TextField* asTextField() { return nullptr; }
  virtual ImageView* asImageView() { return nullptr; }
  virtual Gradient* asGradient() { return nullptr; }

  /// The number by which scripts find the view; a new view has the toolkit's default. Asking calls
  /// nobody: a search asks it of every view of a live list.
  virtual Tag tag() const = 0;
  virtual void setTag(Tag tag) = 0;

  /// Position and size in the superview's coordinates.
  virtual Rect frame() const = 0;

  /// The live list of direct subviews; valid until a subview comes or goes.
  virtual const Subviews& subviews() const = 0;
  /// Puts `view` in front of the subviews already there, taking it from where it was.
  virtual void addSubview(const Ref<View>& view) = 0;

  virtual void setHidden(bool hidden) = 0;
  /// The tooltip's plain text; an empty text removes it.
  virtual void setToolTip(std::string_view text) = 0;
  /// Whether a redraw is pending. Asking changes nothing.
  virtual bool needsDisplay() const = 0;

  /// Whether the view draws through a layer, which alone can have contents.
  virtual void setWantsLayer(bool wants) = 0;
  /// Shows `image` scaled to the whole of the view's layer, behind the subviews; absent clears it.
  /// Without a layer nothing happens.
  virtual void setLayerContents(const Ref<Image>& image) = 0;

  // --- what some kinds understand ---

  virtual void setEnabled(bool enabled);                           // controls
  virtual void setAction(std::string_view action);                 // controls
  virtual std::string stringValue() const;                         // controls
  virtual void setStringValue(std::string_view text);              // controls
  virtual void setAttributedStringValue(const AttributedString&);  // controls
  virtual void highlight(bool highlighted);                        // buttons: the pressed-in look
  /// The title as shown, with its attributes; absent only where there is no view.
  virtual std::optional<AttributedString> attributedTitle() const;  // buttons
  virtual void setAttributedTitle(const AttributedString& title);   // buttons
  /// The one of these that does not raise: a view without a state is off.
  virtual State state() const { return State::off; }
};

/// A view that the user can act on.
class Control : public View {
 public:
  /// An enabled control takes the user's input.
  void setEnabled(bool enabled) override = 0;
  /// Whom the action is sent to. The target is not kept alive; with none (absent, or gone) the
  /// action travels the responder chain.
  virtual void setTarget(const std::shared_ptr<Responder>& target) = 0;
  /// The selector's text of what is sent when the user acts, such as "buttonPushed:".
  void setAction(std::string_view action) override = 0;
  /// Sends `action` to `target`, or along the responder chain without one, with this control as
  /// the sender; whether anybody performed it. Asks neither for enabled nor for hidden.
  virtual bool sendAction(std::string_view action, const std::shared_ptr<Responder>& target) = 0;

  std::string stringValue() const override = 0;
  /// Shows plain text, in the control's own font and colour.
  void setStringValue(std::string_view text) override = 0;
  void setAttributedStringValue(const AttributedString& text) override = 0;
};

/// How a button's edge is drawn (`NSBezelStyle`).
enum class BezelStyle : int { rounded = 1, texturedSquare = 8 };

/// A push, on/off or three-state button.
class Button : public Control {
 public:
  static Button& nothing();
  Button* asButton() override { return this; }

  /// Its plain title, replacing any attributed one.
  virtual void setTitle(std::string_view title) = 0;
  std::optional<AttributedString> attributedTitle() const override = 0;
  void setAttributedTitle(const AttributedString& title) override = 0;

  State state() const override = 0;
  /// Sets the state without sending the action. A button that has no mixed state turns on.
  virtual void setState(State state) = 0;

  virtual bool isHighlighted() const = 0;
  void highlight(bool highlighted) override = 0;

  /// The colour behind the title, within the bezel.
  virtual void setBackgroundColor(const Color& color) = 0;
  virtual void setBezelStyle(BezelStyle style) = 0;
};

/// A field of text, editable or a label.
class TextField : public Control {
 public:
  static TextField& nothing();
  TextField* asTextField() override { return this; }

  /// A text field has no title of its own: this sets its text.
  virtual void setTitle(std::string_view title) = 0;
  /// Whom the field tells about editing. Not kept alive.
  virtual void setDelegate(const std::shared_ptr<Responder>& delegate) = 0;
};

/// The frame around an image (`NSImageFrameStyle`).
enum class ImageFrameStyle : int { none = 0 };
/// How an image is fitted (`NSImageScaling`): shrunk to fit with its proportions, never enlarged.
enum class ImageScaling : int { proportionallyDown = 0 };
/// Where an image lies that does not fill its view (`NSImageAlignment`).
enum class ImageAlignment : int { center = 0 };

/// A view that shows one image.
class ImageView : public Control {
 public:
  static ImageView& nothing();
  ImageView* asImageView() override { return this; }

  /// Absent shows nothing.
  virtual void setImage(const Ref<Image>& image) = 0;
  virtual void setImageFrameStyle(ImageFrameStyle style) = 0;
  virtual void setImageScaling(ImageScaling scaling) = 0;
  virtual void setImageAlignment(ImageAlignment alignment) = 0;
};

/// A painted surface that a host uses like a button (the kind `NSGradient`). Whether it takes an
/// action is the toolkit's affair: as a plain view it raises.
class Gradient : public View {
 public:
  Gradient* asGradient() override { return this; }
};

/// `view` as the kind asked for, or absent when it is none or of another kind.
Ref<Button> asButton(Ref<View> view);
Ref<TextField> asTextField(Ref<View> view);
Ref<ImageView> asImageView(Ref<View> view);

}  // namespace toolkit
