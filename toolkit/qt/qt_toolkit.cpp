// SPDX-License-Identifier: MIT
// The Qt toolkit: gives access to its parts.

#include "qz/toolkit/qt/qt_toolkit.hpp"

#include "toolkit/qt/parts.hpp"

namespace qz::toolkit::qt {

QtToolkit::QtToolkit() : parts_(std::make_unique<Parts>()) {}
QtToolkit::QtToolkit(Clock& clock) : parts_(std::make_unique<Parts>(clock)) {}
QtToolkit::~QtToolkit() = default;

QtApplication& QtToolkit::application() { return parts_->application; }
RunLoop& QtToolkit::runLoop() { return parts_->runLoop; }
Images& QtToolkit::images() { return parts_->images; }
Fonts& QtToolkit::fonts() { return parts_->fonts; }
QtFiles& QtToolkit::files() { return parts_->files; }
QtLog& QtToolkit::log() { return parts_->log; }
Calls& QtToolkit::calls() { return parts_->application.desk()->calls; }

}  // namespace qz::toolkit::qt
