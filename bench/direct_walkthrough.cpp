// SPDX-License-Identifier: MIT
#include "bench/direct_walkthrough.hpp"

#include "qz/toolkit/view.hpp"

namespace qz::bench {
namespace {

toolkit::Ref<toolkit::View> viewWithTag(const toolkit::Ref<toolkit::Window>& window,
                                        toolkit::Tag tag) {
  const toolkit::Ref<toolkit::View> content = window->contentView();
  for (const auto& view : content->subviews()) {
    if (view->tag() == tag) return view;
  }
  return {};
}

}  // namespace

void runDirectly(const toolkit::Ref<toolkit::Window>& window,
                 const std::vector<Operation>& operations) {
  for (const Operation& operation : operations) {
    const auto view = viewWithTag(window, operation.tag);
    switch (operation.what) {
      case What::text:
        view->setStringValue(operation.text);
        static_cast<void>(view->stringValue() == operation.text);
        break;
      case What::title:
        toolkit::asButton(view)->setTitle(operation.text);
        break;
      case What::toolTip:
        view->setToolTip(operation.text);
        view->needsDisplay();
        break;
      case What::enable:
      case What::disable:
        view->setEnabled(operation.what == What::enable);
        view->needsDisplay();
        break;
      case What::stateOn:
        toolkit::asButton(view)->setState(toolkit::State::on);
        break;
    }
  }
}

}  // namespace qz::bench
