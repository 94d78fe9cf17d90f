// What a view answers to messages that only some kinds understand, and references to kinds of view.

#include "toolkit/view.hpp"

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

// `kind` is `view` itself seen as a T, or null; the reference shares the view's ownership.
template <class T>
Ref<T> sharing(const Ref<View>& view, T* kind) {
  if (!kind) return {};
  return std::shared_ptr<T>(view.pointer(), kind);
}

}  // namespace

Ref<Button> asButton(const Ref<View>& view) { return sharing(view, view->asButton()); }
Ref<TextField> asTextField(const Ref<View>& view) { return sharing(view, view->asTextField()); }
Ref<ImageView> asImageView(const Ref<View>& view) { return sharing(view, view->asImageView()); }

}  // namespace toolkit
