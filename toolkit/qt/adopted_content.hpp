// SPDX-License-Identifier: MIT
// The content view of an adopted window.
#pragma once

#include <memory>

#include "toolkit/qt/adopted_form.hpp"
#include "toolkit/qt/tree_watch.hpp"
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
  bool isUpToDate();
  void adoptControls();

  const std::shared_ptr<AdoptedForm> form_;
  Listing found_;  // by the last walk
  TreeWatch tree_;
};

class AdoptedContent final : public QtView<View, AdoptedNode> {
 public:
  using QtView::QtView;
};

}  // namespace qz::toolkit::qt
