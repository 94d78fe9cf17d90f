// SPDX-License-Identifier: MIT
// Begins and ends the adoption of a window.

#include "qz/toolkit/qt/adoption.hpp"

#include <utility>

#include "toolkit/qt/adopted_form.hpp"
#include "toolkit/qt/desk.hpp"
#include "toolkit/qt/window.hpp"

namespace qz::toolkit::qt {

AdoptedWindow::AdoptedWindow(QtToolkit& toolkit, QWidget& window, Adoption how)
    : form_(std::make_shared<AdoptedForm>(*window.window(), std::move(how))),
      window_(toolkit.application().window(window)) {
  QtWindow::of(window_)->present(form_);
  for (const std::string& complaint : form_->unreachableTags()) toolkit.log().write(complaint);
}

AdoptedWindow::~AdoptedWindow() {
  form_->restore();
  QtWindow::of(window_)->present(nullptr);
}

}  // namespace qz::toolkit::qt
