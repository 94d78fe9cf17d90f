// SPDX-License-Identifier: MIT
// KeepAlive: keeps an object alive until the end of its own operation, even if foreign code
// releases it.
#pragma once

#include <memory>

namespace qz {

/// Keeps `object` alive while the guard exists. Foreign code, such as the log's sink, may release
/// the last reference to the object during an operation. Only the outermost operation counts a
/// reference: `isKept`, a field of the object, spares the nested ones, such as every command of a
/// list, the cost.
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
  std::shared_ptr<void> object_;  // null in a nested operation
};

}  // namespace qz
