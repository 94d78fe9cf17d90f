// SPDX-License-Identifier: MIT
// KeepAlive: what keeps an object to the end of its own operation, whatever that calls out to.
#pragma once

#include <memory>

/// Keeps `object` as long as the guard is there. Code of others, such as the log's sink, may let go
/// of the object's last reference in the middle of an operation. Only the outermost operation
/// counts a reference: `isKept`, a field of the object, tells the ones within it that they need
/// not, and every command of a list is one of those.
class KeepAlive {
 public:
  template <class Object>
  KeepAlive(Object& object, bool& isKept)
      : isKept_(isKept), object_(isKept ? nullptr : object.shared_from_this()) {
    isKept = true;
  }
  KeepAlive(const KeepAlive&) = delete;
  KeepAlive& operator=(const KeepAlive&) = delete;
  ~KeepAlive() {
    if (object_) isKept_ = false;
  }

 private:
  bool& isKept_;
  std::shared_ptr<void> object_;  // null in an operation within another
};
