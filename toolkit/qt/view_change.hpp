// SPDX-License-Identifier: MIT
// Surrounds a change that a command makes to a widget or an action.
#pragma once

#include <QPointer>
#include <QWidget>
#include <memory>

#include "toolkit/qt/adopted_form.hpp"

namespace qz::toolkit::qt {

/// Lives while a view of an adopted window changes what it shows. Does nothing for other views.
class ViewChange {
 public:
  ViewChange(QWidget* widget, std::shared_ptr<AdoptedForm> form, Aspect aspect, Notice notice);
  ViewChange(QAction* action, std::shared_ptr<AdoptedForm> form);
  ~ViewChange();
  ViewChange(const ViewChange&) = delete;
  ViewChange& operator=(const ViewChange&) = delete;

 private:
  const QPointer<QWidget> widget_;  // null for an action
  const std::shared_ptr<AdoptedForm> form_;
  const Notice notice_;
  std::vector<Sighting> before_;
};

}  // namespace qz::toolkit::qt
