// SPDX-License-Identifier: MIT
// The host's window that a walk-through is played over.
#include "tools/walkthrough/host_window.hpp"

#include <cstddef>

#include "qz/property_list/collections.hpp"
#include "qz/property_list/scalars.hpp"
#include "tools/support/failure.hpp"
#include "tools/support/suggestions.hpp"
#include "tools/support/text_layout.hpp"
#include "tools/walkthrough/form_file.hpp"
#include "tools/walkthrough/plist_entry.hpp"

namespace qz::tools::walkthrough {
namespace {

constexpr auto windowWords = "a host's window";

using drivers::Caption;
using toolkit::State;

bool isWindow(const toolkit::ValueRef<>& entry) {
  const auto name = toolkit::asString(toolkit::asDictionary(entry)->objectForKey("class"));
  return name->text() == toolkit::class_names::window;
}

void readWindow(const PlistEntry& entry, HostWindow& host) {
  entry.expectOnly({"class", "frame", "title"});
  host.title = entry.text("title");
  host.content = entry.requiredRect("frame");
}

drivers::ViewKind readKind(const PlistEntry& entry) {
  const std::string name = entry.requiredText("class");
  if (name == toolkit::class_names::window) {
    entry.fail("class", "a control (the window is the first entry)");
  }
  const auto kind = drivers::viewKindNamed(name);
  if (!kind) {
    std::string names = "one of " + std::string(toolkit::class_names::window);
    for (const auto known : drivers::viewKindNames()) names.append(", ").append(known);
    entry.fail("class", names);
  }
  return *kind;
}

State readState(const PlistEntry& entry, drivers::ViewKind kind) {
  if (!entry.has("state")) return State::off;
  const std::string name = entry.text("state");
  if (name == "on") return State::on;
  const bool hasMixedState = rowOf(kind).hasMixedState;
  if (name == "mixed" && hasMixedState) return State::mixed;
  if (name != "off") {
    entry.fail("state", hasMixedState ? "“on”, “off” or “mixed”" : "“on” or “off”");
  }
  return State::off;
}

/// Returns the key of what a view shows.
std::string_view captionKey(Caption caption) {
  return caption == Caption::imageName ? "image" : "title";
}

/// Returns the keys that an entry of the kind may have: a caption only if the kind shows one, a
/// state only if it has one.
std::vector<std::string_view> keysOf(drivers::ViewKind kind) {
  std::vector<std::string_view> keys = {"class", "tag", "frame", "hidden", "toolTip"};
  const drivers::ViewKindRow& row = rowOf(kind);
  if (row.caption != Caption::none) keys.push_back(captionKey(row.caption));
  if (row.isButton) keys.emplace_back("state");
  if (row.isControl) keys.emplace_back("enabled");
  return keys;
}

HostControl readControl(const PlistEntry& entry) {
  HostControl control;
  control.kind = readKind(entry);
  entry.expectOnly(keysOf(control.kind));
  control.tag = entry.integer("tag");
  control.frame = entry.requiredRect("frame");
  const std::string_view caption = captionKey(rowOf(control.kind).caption);
  if (entry.has(caption)) control.caption = entry.text(caption);
  control.hidden = entry.flag("hidden", false);
  control.enabled = entry.flag("enabled", true);
  control.state = readState(entry, control.kind);
  control.toolTip = entry.text("toolTip");
  return control;
}

void expectImage(toolkit::Toolkit& toolkit, std::string_view name, std::string_view file) {
  if (toolkit.images().imageNamed(name)) return;
  throw Failure(ExitStatus::badInput, std::string(file) + ": image " + quote(name) +
                                          ": expected an image of this name in " +
                                          toolkit.files().resourcePath());
}

/// Throws a Failure if the window shows an image that there is not.
void expectImages(const HostWindow& host, toolkit::Toolkit& toolkit, std::string_view file) {
  for (const HostControl& control : host.controls) {
    if (rowOf(control.kind).caption == Caption::imageName && control.caption) {
      expectImage(toolkit, *control.caption, file);
    }
  }
}

void makeControl(drivers::Driver& driver, const HostControl& control,
                 const toolkit::Ref<toolkit::View>& parent) {
  const auto view = driver.makeView(control.kind, control.tag, control.frame, parent);
  if (control.caption) driver.setCaption(view, *control.caption);
  view->setHidden(control.hidden);
  // A view that is not a control does not understand setEnabled.
  if (!control.enabled) view->setEnabled(false);
  toolkit::asButton(view)->setState(control.state);
  if (!control.toolTip.empty()) view->setToolTip(control.toolTip);
}

}  // namespace

HostWindow parseHostWindow(const InputFile& file) {
  const auto entries = toolkit::asArray(file.root());
  if (!entries) {
    file.fail(file.root(), "expected an array of controls, found " + foundWords(file.root()));
  }
  HostWindow host;
  for (std::size_t i = 0; i < entries->count(); ++i) {
    const auto value = entries->objectAtIndex(i);
    const PlistEntry entry(file, "entry " + std::to_string(i + 1), value);
    if (i == 0 && isWindow(value)) {
      readWindow(entry, host);
    } else {
      host.controls.push_back(readControl(entry));
    }
  }
  return host;
}

HostWindow readHostWindow(const std::string& path) {
  if (!namesForm(path)) return parseHostWindow(InputFile(path, windowWords));
  auto host = parseHostWindow(InputFile(path, windowWords, describeFormFile(path)));
  if (!host.controls.empty()) return host;
  throw Failure(ExitStatus::badInput,
                path + ": expected widgets with the dynamic property qzTag, found none");
}

toolkit::Ref<toolkit::Window> makeHostWindow(drivers::Driver& driver, const HostWindow& host,
                                             std::string_view file) {
  expectImages(host, driver.toolkit(), file);
  auto window = driver.makeWindow(host.content);
  if (!host.title.empty()) driver.setWindowTitle(window, host.title);
  for (const HostControl& control : host.controls) {
    makeControl(driver, control, window->contentView());
  }
  return window;
}

}  // namespace qz::tools::walkthrough
