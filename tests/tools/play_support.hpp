// SPDX-License-Identifier: MIT
// Example pictures of walk-throughs, for tests.
#pragma once

#include <deque>
#include <fstream>
#include <memory>
#include <sstream>
#include <string>

#include "tools/walkthrough/step_picture.hpp"

namespace qz::tools::play {

using namespace walkthrough;

/// Returns a new identity for the picture of a control or timer, valid until the program ends.
inline Identity newIdentity() {
  static std::deque<std::shared_ptr<int>> identities;
  return identities.emplace_back(std::make_shared<int>());
}

inline ControlPicture controlPicture(drivers::ViewKind kind, toolkit::Tag tag,
                                     const std::string& caption = "") {
  ControlPicture control;
  control.identity = newIdentity();
  control.view.kind = kind;
  control.view.tag = tag;
  const bool isText = rowOf(kind).caption == drivers::Caption::text;
  if (!caption.empty()) {
    (isText ? control.view.text : control.view.title) = toolkit::AttributedString(caption);
  }
  return control;
}

inline StepPicture windowPicture() {
  StepPicture picture;
  picture.title = "Backup";
  picture.window.emplace();
  picture.window->visible = true;
  picture.window->content = {200, 200, 480, 320};
  picture.window->background = toolkit::colors::white;
  return picture;
}

/// Returns the whole text of a file in tests/data/play.
inline std::string playData(const std::string& name) {
  std::ifstream file(std::string(QZ_TEST_DATA) + "/play/" + name, std::ios::binary);
  std::ostringstream text;
  text << file.rdbuf();
  return text.str();
}

}  // namespace qz::tools::play
