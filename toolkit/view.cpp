// What a view answers to messages that only some kinds understand, and references to kinds of view.

#include "toolkit/view.hpp"

#include <utility>

#include "toolkit/exception.hpp"

namespace toolkit {

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

// `kind` is `view` itself seen as a T, or null; the reference takes over the view's.
template <class T>
Ref<T> sharing(Ref<View>&& view, T* kind) {
  if (!kind) return {};
  return std::shared_ptr<T>(std::move(view).pointer(), kind);
}

}  // namespace

Ref<Button> asButton(Ref<View> view) {
  auto* const button = view->asButton();
  return sharing(std::move(view), button);
}

Ref<TextField> asTextField(Ref<View> view) {
  auto* const field = view->asTextField();
  return sharing(std::move(view), field);
}

Ref<ImageView> asImageView(Ref<View> view) {
  auto* const imageView = view->asImageView();
  return sharing(std::move(view), imageView);
}

}  // namespace toolkit
