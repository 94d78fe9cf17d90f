// SPDX-License-Identifier: MIT
// Surrounds a change that a command makes to a widget.
#pragma once

#include <QPointer>
#include <QWidget>
#include <memory>

#include "toolkit/qt/adopted_form.hpp"

namespace qz::toolkit::qt {

/// Lives while a view of an adopted window changes its widget. Does nothing for other views.
class ViewChange {
 public:
  ViewChange(QWidget* widget, std::shared_ptr<AdoptedForm> form, Notice notice);
  ~ViewChange();
  ViewChange(const ViewChange&) = delete;
  ViewChange& operator=(const ViewChange&) = delete;

 private:
  const QPointer<QWidget> widget_;
  const std::shared_ptr<AdoptedForm> form_;
  const Notice notice_;
  std::vector<Sighting> before_;
};

}  // namespace qz::toolkit::qt
