// SPDX-License-Identifier: MIT
// Tells the form of changes to its controls.

#include "toolkit/qt/view_change.hpp"

#include <utility>

namespace qz::toolkit::qt {

ViewChange::ViewChange(QWidget* widget, std::shared_ptr<AdoptedForm> form, Notice notice)
    : widget_(widget), form_(std::move(form)), notice_(notice) {
  if (form_ && widget) before_ = form_->look(*widget, notice);
}

ViewChange::~ViewChange() {
  if (form_) form_->changed(widget_, notice_, before_);
}

}  // namespace qz::toolkit::qt
