// SPDX-License-Identifier: MIT
// Driving a toolkit from outside, as its user and its host do: one driver stands beside each
// backend, so that the same scenarios and the same player run on every toolkit.
#pragma once

#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "toolkit/geometry.hpp"
#include "toolkit/toolkit.hpp"

namespace toolkit {

/// The kinds of view that a host can be asked to make.
enum class ViewKind { button, toggle, mixed, popUpButton, textField, imageView, box, plain };

/// What a view is and shows, read at one moment.
struct ViewPicture {
  ViewKind kind = ViewKind::plain;  // push, toggle or mixed by the button's behaviour
  std::string className;
  Tag tag = 0;
  Rect frame;
  bool hidden = false;
  bool enabled = true;  // YES of a view that cannot be disabled
  State state = State::off;
  bool highlighted = false;
  AttributedString title;  // buttons
  AttributedString text;   // any other control
  std::string toolTip;
  std::optional<std::string> image;  // the name of an image view's image
  std::shared_ptr<Responder> target;
  std::optional<std::string> action;
  std::optional<Color> background;  // a button's, within its bezel
};

/// What a window is and shows, read at one moment.
struct WindowPicture {
  bool visible = false;
  bool key = false;
  int closes = 0;  // how often it was closed
  Rect content;
  unsigned style = 0;  // bits of StyleMask
  Color background;
  std::shared_ptr<Responder> delegate;
  bool layered = false;                   // the content view draws through a layer
  std::optional<std::string> layerImage;  // the name of its layer's contents
  Ref<Window> sheetOf;                    // the window it is attached to as a sheet
  std::vector<long> sheetEnds;            // return codes of the ends asked for, in order
};

class TestDriver {
 public:
  virtual ~TestDriver() = default;

  /// The name that `--toolkit` takes, such as "memory".
  virtual std::string_view name() const = 0;
  virtual Toolkit& toolkit() = 0;

  // --- as the host ---

  /// A host's window, on the screen. The caller owns it: destroying the reference destroys it.
  virtual Ref<Window> makeWindow(const Rect& content) = 0;
  /// A view of the kind, in front of what `parent` holds. `parent` owns it.
  virtual Ref<View> makeView(ViewKind kind, Tag tag, const Rect& frame,
                             const Ref<View>& parent) = 0;
  virtual void removeFromSuperview(const Ref<View>& view) = 0;
  virtual void setFrame(const Ref<View>& view, const Rect& frame) = 0;
  /// The text of a text field, the title of a button, the name of an image view's image.
  virtual void setCaption(const Ref<View>& view, std::string_view text) = 0;
  /// What the window's title bar says; nothing where there are no title bars.
  virtual void setWindowTitle(const Ref<Window>& /*window*/, std::string_view /*title*/) {}
  /// Where the toolkit's resource directory lies from now on.
  virtual void setResourcePath(std::string_view path) = 0;
  /// The class name that this toolkit gives a view of the kind.
  virtual std::string_view className(ViewKind kind) const = 0;

  // --- as the user ---

  /// A click with the primary button where the user sees the view. Hidden or disabled controls, and
  /// those behind a sheet, take none.
  virtual void click(const Ref<View>& view) = 0;
  /// Presses the primary button down on a button that would take the click, and keeps it down:
  /// timers wait meanwhile, and `click` is a press by the keyboard. What was held before is let go.
  virtual void hold(const Ref<View>& view) = 0;
  /// Lets the primary button up over the held button, which takes the click if it still can and no
  /// key has pressed it meanwhile; then the timers fire that are due. Nothing happens where nothing
  /// is held.
  virtual void letGo() = 0;
  /// Lets time pass, at once: the clock jumps from timer to timer. 0 or more seconds.
  virtual void advance(double seconds) = 0;
  /// From now on `advance` takes as long as it says, so that a person can watch. Nothing changes
  /// where there are no windows to watch.
  virtual void useRealTime() {}

  // --- with a person at the screen ---

  /// Whether a person can see the windows and act on them.
  virtual bool hasPerson() const { return false; }
  /// Hands the windows over to that person. `willAct` is told of a control before its action is
  /// sent on their behalf. `goesOn` is asked whenever something may have happened; NO ends it. What
  /// an action or a timer raises leaves here.
  virtual void handOver(const std::function<void(const Ref<View>&)>& /*willAct*/,
                        const std::function<bool()>& /*goesOn*/) {}

  // --- as an observer ---

  /// Whether windows have pixels, so that there can be pictures of them.
  virtual bool draws() const { return false; }
  /// Writes the window as it shows, with the window under it when it is a sheet, to a PNG file. NO
  /// when the window is not on the screen, or the file cannot be written.
  virtual bool savePicture(const Ref<Window>& /*window*/, const std::string& /*path*/) {
    return false;
  }

  virtual ViewPicture look(const Ref<View>& view) = 0;
  virtual WindowPicture look(const Ref<Window>& window) = 0;
  /// Where every log line goes as it comes. Without a sink, as at first, the lines go nowhere.
  virtual void setLogSink(std::function<void(std::string_view)> sink) = 0;
};

}  // namespace toolkit
