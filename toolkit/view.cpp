// SPDX-License-Identifier: MIT
// The default answers of a view to messages that only some kinds understand, and references to
// kinds of view.

#include "qz/toolkit/view.hpp"

#include <utility>

#include "qz/toolkit/exception.hpp"

namespace qz::toolkit {

bool Responder::tryToPerform(std::string_view, const Ref<View>&) { return false; }

void View::setEnabled(bool) { raiseUnrecognizedSelector(className(), "setEnabled:"); }

void View::setAction(std::string_view) { raiseUnrecognizedSelector(className(), "setAction:"); }

std::string View::stringValue() const { raiseUnrecognizedSelector(className(), "stringValue"); }

void View::setStringValue(std::string_view) {
  raiseUnrecognizedSelector(className(), "setStringValue:");
}

void View::setAttributedStringValue(const AttributedString&) {
  raiseUnrecognizedSelector(className(), "setAttributedStringValue:");
}

void View::highlight(bool) { raiseUnrecognizedSelector(className(), "highlight:"); }

std::optional<AttributedString> View::attributedTitle() const {
  raiseUnrecognizedSelector(className(), "attributedTitle");
}

void View::setAttributedTitle(const AttributedString&) {
  raiseUnrecognizedSelector(className(), "setAttributedTitle:");
}

namespace {

// The result takes over the ownership of `view`.
template <class T>
Ref<T> seenAs(T* (View::*kind)(), Ref<View>&& view) {
  T* const seen = ((*view).*kind)();
  if (!seen) return {};
  return std::shared_ptr<T>(std::move(view).pointer(), seen);
}

}  // namespace

Ref<Button> asButton(Ref<View> view) { return seenAs(&View::asButton, std::move(view)); }
Ref<TextField> asTextField(Ref<View> view) { return seenAs(&View::asTextField, std::move(view)); }
Ref<ImageView> asImageView(Ref<View> view) { return seenAs(&View::asImageView, std::move(view)); }

}  // namespace qz::toolkit
