// SPDX-License-Identifier: MIT
// Statements that set a scenario up: files, windows, controls.

#include <cstddef>
#include <filesystem>
#include <fstream>
#include <sstream>

#include "qz/property_list/xml_writer.hpp"
#include "tools/scenario/statements.hpp"
#include "tools/scenario/unmet.hpp"
#include "tools/scenario/values.hpp"
#include "tools/support/failure.hpp"
#include "tools/support/input_file.hpp"
#include "tools/walkthrough/host_window.hpp"

namespace qz::tools::scenario {
namespace setting_up {
namespace {

using toolkit::Rect;

Outcome script(Stage& stage, const Arguments& a) {
  const auto value = readValue(a.word("JSON"), anyJson).value().value;
  stage.resources.write(a.text("FILE"), toolkit::writeXmlPropertyList(toValue(value)));
  return {};
}

Outcome file(Stage& stage, const Arguments& a) {
  stage.resources.write(a.text("FILE"), a.text("TEXT"));
  return {};
}

Outcome copy(Stage& stage, const Arguments& a) {
  const auto folder = std::filesystem::absolute(stage.file).parent_path();
  const auto path = folder / a.text("PATH");
  std::ifstream source(path, std::ios::binary);
  std::ostringstream contents;
  // An empty file is fine: copying it sets the fail bit of `contents`, not of `source`.
  if (std::filesystem::is_regular_file(path)) contents << source.rdbuf();
  if (!source || !std::filesystem::is_regular_file(path)) {
    throw Unmet("the file " + a.text("PATH") + " in " + folder.string(), "none");
  }
  stage.resources.write(a.text("FILE"), contents.str());
  return {};
}

Outcome image(Stage& stage, const Arguments& a) {
  stage.resources.writeImage(a.text("FILE"));
  return {};
}

Rect rectangle(const Arguments& a, const Rect& otherwise) {
  if (!a.has("X")) return otherwise;
  return {a.number("X"), a.number("Y"), a.number("WIDTH"), a.number("HEIGHT")};
}

Outcome window(Stage& stage, const Arguments& a) {
  const auto made = stage.driver.makeWindow(rectangle(a, {100, 100, 640, 480}));
  stage.cast.nameWindow(a.text("+W"), toolkit::StoredRef<toolkit::Window>::own(made));
  return {};
}

Outcome host(Stage& stage, const Arguments& a) try {
  const auto path = std::filesystem::absolute(stage.file).replace_filename(a.text("PATH")).string();
  const auto described = walkthrough::parseHostWindow(InputFile(path, "a host's window"));
  const auto made = walkthrough::makeHostWindow(stage.driver, described, path);
  stage.cast.nameWindow(a.text("+W"), toolkit::StoredRef<toolkit::Window>::own(made));
  return {};
} catch (const Failure& failure) {
  throw Unmet("the description of a host's window", failure.what());
}

Cast::View viewNamed(const Stage& stage, const std::string& place) {
  return stage.cast.namesWindow(place) ? stage.cast.window(place)->contentView()
                                       : stage.cast.control(place);
}

// Five in a row, so that no control covers another and each can be clicked.
Rect frameAt(std::size_t index) {
  const auto column = index % 5;
  const auto row = index / 5;
  return {20.0 + 120.0 * static_cast<double>(column), 20.0 + 40.0 * static_cast<double>(row), 100,
          30};
}

Outcome control(Stage& stage, const Arguments& a) {
  const auto parent = viewNamed(stage, a.text("PLACE"));
  const auto made = stage.driver.makeView(*drivers::viewKindNamed(a.text("CLASS")), a.whole("TAG"),
                                          rectangle(a, frameAt(parent->subviews().size())), parent);
  stage.cast.nameControl(a.text("+C"), toolkit::StoredRef<toolkit::View>::refer(made));
  return {};
}

Outcome controls(Stage& stage, const Arguments& a) {
  const auto parent = viewNamed(stage, a.text("PLACE"));
  const auto kind = *drivers::viewKindNamed(a.text("CLASS"));
  std::size_t index = parent->subviews().size();
  for (toolkit::Tag i = 0; i < a.whole("COUNT"); ++i) {
    stage.driver.makeView(kind, a.whole("TAG") + i, frameAt(index++), parent);
  }
  return {};
}

Outcome delegate(Stage& stage, const Arguments& a) {
  stage.cast.window(a.text("W"))->setDelegate(stage.host);
  return {};
}

Outcome target(Stage& stage, const Arguments& a) {
  const auto button = toolkit::asButton(stage.cast.control(a.text("C")));
  if (!button) throw Unmet("a button", a.text("C") + ", which is not a button");
  button->setTarget(stage.host);
  button->setAction(HostResponder::action);
  return {};
}

Outcome name(Stage& stage, const Arguments& a) {
  if (a.has("+W")) {
    stage.cast.nameWindow(
        a.text("+W"), toolkit::StoredRef<toolkit::Window>::refer(stage.cast.window(a.text("W"))));
  } else {
    stage.cast.nameControl(
        a.text("+C"), toolkit::StoredRef<toolkit::View>::refer(stage.cast.control(a.text("C"))));
  }
  return {};
}

constexpr StatementKind table[] = {
    {"script FILE JSON", Result::never, script},
    {"file FILE TEXT", Result::never, file},
    {"copy FILE PATH", Result::never, copy},
    {"image FILE", Result::never, image},
    {"window +W [X Y WIDTH HEIGHT]", Result::never, window},
    {"host +W PATH", Result::never, host},
    {"control +C CLASS TAG in PLACE [X Y WIDTH HEIGHT]", Result::never, control},
    {"controls COUNT CLASS TAG in PLACE", Result::never, controls},
    {"delegate W", Result::never, delegate},
    {"target C", Result::never, target},
    {"name +C C", Result::never, name},
    {"name +W W", Result::never, name},
};

}  // namespace
}  // namespace setting_up

std::span<const StatementKind> settingUpStatements() { return setting_up::table; }

}  // namespace qz::tools::scenario
