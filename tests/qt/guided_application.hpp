// SPDX-License-Identifier: MIT
// A tour through an application that knows nothing of it. The test counts these lines.
#pragma once

#include "qz/hosts/qt/walk_through.hpp"
#include "tests/qt/plain_application.hpp"

struct GuidedApplication : PlainApplication {
  explicit GuidedApplication(const std::string& resources) {
    toolkit.files().setResourcePath(resources);
    tour.setAdoption({.tags = {{"save", 1}, {"name", 2}, {"bold", 3}, {"apply", 4}, {"open", 5}}});
    connect(help, &QAction::triggered, this, [this] { tour.play("tour.plist", *this); });
  }
  qz::toolkit::qt::QtToolkit toolkit;
  qz::hosts::qt::WalkThrough tour{toolkit};
};
