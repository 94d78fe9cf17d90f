// SPDX-License-Identifier: MIT
// Drives a toolkit from outside, as its user and its host do. Each backend has a driver, so that
// the same scenarios and the same player run on every toolkit. No host needs a driver.
#pragma once

#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "qz/api.hpp"
#include "qz/drivers/view_kinds.hpp"
#include "qz/toolkit/geometry.hpp"
#include "qz/toolkit/toolkit.hpp"

namespace qz::drivers {

using namespace toolkit;

/// A snapshot of a view.
struct QZ_API ViewPicture {
  ViewKind kind = ViewKind::plain;  ///< button, toggle or mixed, by the button's behaviour
  std::string className;            ///< the toolkit's own class name
  Tag tag = 0;                      ///< by which scripts find it
  Rect frame;                       ///< in the coordinates of its superview
  bool hidden = false;              ///< whether it is hidden itself
  /// YES for a view that cannot be disabled
  bool enabled = true;
  State state = State::off;           ///< whether a button is on
  bool highlighted = false;           ///< whether a button looks pressed in
  AttributedString title;             ///< of a button
  AttributedString text;              ///< of any other control
  std::string toolTip;                ///< empty if it has none
  std::optional<std::string> image;   ///< the name of an image view's image
  std::shared_ptr<Responder> target;  ///< who receives its action
  std::optional<std::string> action;  ///< the message that it sends
  std::optional<Color> background;    ///< of a button, within its bezel

  friend bool operator==(const ViewPicture&, const ViewPicture&) = default;
};

/// A snapshot of a window.
struct QZ_API WindowPicture {
  bool visible = false;                   ///< whether it is on the screen
  bool key = false;                       ///< whether it receives keys
  int closes = 0;                         ///< how often it was closed
  Rect content;                           ///< the frame of its content, on the screen
  unsigned style = 0;                     ///< bits of StyleMask
  Color background;                       ///< behind the content
  std::shared_ptr<Responder> delegate;    ///< who hears of its events
  bool layered = false;                   ///< whether the content view draws through a layer
  std::optional<std::string> layerImage;  ///< the name of its layer's contents
  Ref<Window> sheetOf;                    ///< the window it is attached to as a sheet
  std::vector<long> sheetEnds;            ///< return codes of all requests to end it, in order

  friend bool operator==(const WindowPicture&, const WindowPicture&) = default;
};

/// What the program does whose windows these are.
class QZ_API HostActions {
 public:
  virtual ~HostActions() = default;

  /// Makes a host's window and shows it. The caller owns it: it is destroyed with the reference.
  virtual Ref<Window> makeWindow(const Rect& content) = 0;
  /// Makes a view of the kind, in front of the other views in `parent`. `parent` owns it.
  virtual Ref<View> makeView(ViewKind kind, Tag tag, const Rect& frame,
                             const Ref<View>& parent) = 0;
  /// Takes the view out of its superview.
  virtual void removeFromSuperview(const Ref<View>& view) = 0;
  /// Moves and resizes the view, in the coordinates of its superview.
  virtual void setFrame(const Ref<View>& view, const Rect& frame) = 0;
  /// Sets the text of a text field, the title of a button, or the image of an image view by its
  /// name.
  virtual void setCaption(const Ref<View>& view, std::string_view text) = 0;
  /// Sets the text in the window's title bar; does nothing if there are no title bars.
  virtual void setWindowTitle(const Ref<Window>& /*window*/, std::string_view /*title*/) {}
  /// Sets the toolkit's resource directory.
  virtual void setResourcePath(std::string_view path) = 0;
  /// Returns this toolkit's class name for a view of the kind.
  virtual std::string_view className(ViewKind kind) const = 0;
};

/// What a user does.
class QZ_API UserActions {
 public:
  virtual ~UserActions() = default;

  /// Clicks with the primary mouse button where the user sees the view. Hidden and disabled
  /// controls, and those behind a sheet, ignore the click.
  virtual void click(const Ref<View>& view) = 0;
  /// Presses the primary mouse button on a button that accepts clicks, and holds it. Until it is
  /// released, timers wait, and `click` presses buttons by the keyboard. A button that was held
  /// before is released first.
  virtual void hold(const Ref<View>& view) = 0;
  /// Releases the mouse button over the held button, which is clicked if it still accepts clicks
  /// and was not pressed by the keyboard meanwhile. Then the timers that are due fire. Does nothing
  /// if no button is held.
  virtual void letGo() = 0;
  /// Lets `seconds` (0 or more) pass at once: the clock jumps from timer to timer.
  virtual void advance(double seconds) = 0;
  /// Makes `advance` take real time from now on, so that a person can watch. Does nothing if there
  /// are no visible windows.
  virtual void useRealTime() {}
};

/// The display, and the person in front of it.
class QZ_API Display {
 public:
  virtual ~Display() = default;

  /// Whether a person can see the windows and act on them.
  virtual bool hasPerson() const { return false; }
  /// Lets that person act until `goesOn` answers NO; it is asked whenever something may have
  /// happened. `willAct` is called with a control before the person's press sends its action.
  /// Exceptions of actions and timers leave this function.
  virtual void handOver(const std::function<void(const Ref<View>&)>& /*willAct*/,
                        const std::function<bool()>& /*goesOn*/) {}

  /// Whether windows have pixels, so that pictures of them can be saved.
  virtual bool draws() const { return false; }
  /// Saves a picture of the window to a PNG file, together with the parent window if it is a sheet.
  /// NO if the window is not on the screen or the file cannot be written.
  virtual bool savePicture(const Ref<Window>& /*window*/, const std::string& /*path*/) {
    return false;
  }
};

/// Reads back what the windows show.
class QZ_API Inspector {
 public:
  virtual ~Inspector() = default;

  /// Returns what the view shows and how it is wired.
  virtual ViewPicture look(const Ref<View>& view) = 0;
  /// Returns what the window shows and how it is wired.
  virtual WindowPicture look(const Ref<Window>& window) = 0;
  /// Passes every log line to `sink` as it is written. Without a sink, as at first, log lines are
  /// discarded.
  virtual void setLogSink(std::function<void(std::string_view)> sink) = 0;
};

/// Acts as the user and the host of a toolkit of its own, and inspects the result.
class QZ_API Driver : public HostActions, public UserActions, public Display, public Inspector {
 public:
  /// Returns the name for `--toolkit`, such as "memory".
  virtual std::string_view name() const = 0;
  /// Returns the driver's own toolkit, for engines.
  virtual Toolkit& toolkit() = 0;

  void setCaption(const Ref<View>& view, std::string_view text) override {
    asTextField(view)->setStringValue(text);
    asButton(view)->setTitle(text);
    if (const auto imageView = asImageView(view)) {
      imageView->setImage(toolkit().images().imageNamed(text));
    }
  }
};

}  // namespace qz::drivers
