// SPDX-License-Identifier: MIT
// A walk-through in a panel beside the form's controls.
#pragma once

#include "order_form.hpp"
#include "qz/hosts/qt/guide.hpp"
#include "qz/hosts/qt/walk_through.hpp"

class FormGuide {
 public:
  FormGuide(qz::toolkit::qt::QtToolkit& toolkit, OrderForm& form)
      : form_(form), guide_(toolkit, form) {}

  void play(qz::hosts::qt::WalkThrough& walkThrough) { walkThrough.play("guide.plist", form_); }

 private:
  OrderForm& form_;
  qz::hosts::qt::Guide guide_;
};
