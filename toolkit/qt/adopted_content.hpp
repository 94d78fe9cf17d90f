// SPDX-License-Identifier: MIT
// The content view of an adopted window.
#pragma once

#include <memory>
#include <vector>

#include "toolkit/qt/adopted_form.hpp"
#include "toolkit/qt/views.hpp"

namespace qz::toolkit::qt {

/// A view whose subviews are the controls of a form, wherever they are in the window. It exists
/// beside the widget's own view.
class AdoptedNode : public WidgetNode {
 public:
  AdoptedNode(QWidget& content, std::shared_ptr<Desk> desk, std::shared_ptr<AdoptedForm> form);

 protected:
  const Subviews& readSubviews() override;

 private:
  void adoptControls();

  const std::shared_ptr<AdoptedForm> form_;
  std::vector<QObject*> found_;  // by the last search; kept for its memory
};

class AdoptedContent final : public QtView<View, AdoptedNode> {
 public:
  using QtView::QtView;
};

}  // namespace qz::toolkit::qt
