// SPDX-License-Identifier: MIT
// The rules for adding a view to another.

#include "toolkit/backend/insertion.hpp"

#include <string>

#include "qz/toolkit/exception.hpp"

namespace qz::toolkit {
namespace {

[[noreturn]] void refuse(std::string_view receiver, std::string_view reason) {
  throw InvalidArgumentException("-[" + std::string(receiver) +
                                 " addSubview:]: " + std::string(reason));
}

}  // namespace

void requireOwnView(std::string_view receiver, const Ref<View>& view, bool isOwn) {
  if (!view) refuse(receiver, "the view is absent");
  if (!isOwn) {
    refuse(receiver, "the view, of class " + view->className() + ", belongs to another toolkit");
  }
}

void requireFreeView(std::string_view receiver, bool isContentView, bool isAroundReceiver) {
  if (isContentView) refuse(receiver, "the view is the content view of a window");
  if (isAroundReceiver) refuse(receiver, "the view is the superview itself, or contains it");
}

}  // namespace qz::toolkit
