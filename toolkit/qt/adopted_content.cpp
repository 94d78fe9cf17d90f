// SPDX-License-Identifier: MIT
// Presents the controls of a form as the subviews of one view. The form is walked again only after
// something has changed that decides what its controls are.

#include "toolkit/qt/adopted_content.hpp"

#include <utility>

#include "toolkit/qt/action_view.hpp"

namespace qz::toolkit::qt {

AdoptedNode::AdoptedNode(QWidget& content, std::shared_ptr<Desk> desk,
                         std::shared_ptr<AdoptedForm> form)
    : WidgetNode(content, std::move(desk), KeptBy::host), form_(std::move(form)) {
  joinForm(form_, 0);
}

// A widget that is destroyed together with those around it sends no event.
bool AdoptedNode::isUpToDate() {
  return !tree_.hasChanged() && !form_->usesNames() && found_.hasAllPages() && presentsOnlyLiving();
}

const Subviews& AdoptedNode::readSubviews() {
  if (isUpToDate()) return presented();
  found_ = {};
  form_->list(found_);
  if (!presents(found_.controls)) {
    present(found_.controls);
    adoptControls();
  }
  return presented();
}

void AdoptedNode::adoptControls() {
  for (const auto& view : presented()) {
    if (const auto action = QtAction::of(view)) {
      action->joinForm(form_, form_->givenTag(*action->action()).value_or(0));
    } else {
      const auto node = of(view);
      node->joinForm(form_, form_->givenTag(*node->widget()).value_or(0));
    }
  }
}

}  // namespace qz::toolkit::qt
