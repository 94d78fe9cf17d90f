// SPDX-License-Identifier: MIT
// Compares before it copies: a comparison leaves the identity of the elements as it is.

#import "toolkit/foundation/twin.hpp"

#include <string>

#include "qz/property_list/collections.hpp"
#import "toolkit/foundation/strings.hpp"
#import "toolkit/foundation/values.hpp"

namespace qz::toolkit::foundation {

ValueRef<> Twin::valueFor(id object) {
  if (object != object_ || !value_) {
    value_ = valueOf(object);  // first, because it may raise
    [object_ autorelease];
    object_ = [object retain];
  } else {
    pull();
  }
  return value_;
}

id Twin::objectFor(const ValueRef<>& value) {
  if (!object_ || value != value_) return objectOf(value);
  push();
  return [[object_ retain] autorelease];
}

bool Twin::differs() const {
  const id seen = objectOf(value_);
  return seen != object_ && ![seen isEqual:object_];
}

void Twin::pull() {
  if (!differs()) return;
  const ValueRef<> fresh = valueOf(object_);
  if (value_->kind() == Value::Kind::array) {
    static_cast<Array&>(*value_).setElements(static_cast<const Array&>(*fresh).elements());
  } else if (value_->kind() == Value::Kind::dictionary) {
    auto& dictionary = static_cast<Dictionary&>(*value_);
    dictionary.removeAllObjects();
    for (const auto& entry : static_cast<const Dictionary&>(*fresh).entries()) {
      dictionary.setObject(entry.value, entry.key->description());
    }
  }
}

void Twin::push() {
  if (!differs()) return;
  const id seen = objectOf(value_);
  if ([object_ isKindOfClass:[NSMutableArray class]]) {
    [static_cast<NSMutableArray*>(object_) setArray:seen];
  } else if ([object_ isKindOfClass:[NSMutableDictionary class]]) {
    [static_cast<NSMutableDictionary*>(object_) setDictionary:seen];
  }
}

}  // namespace qz::toolkit::foundation
