// SPDX-License-Identifier: MIT
// SheetSession: whom to tell about the end of a sheet.
#pragma once

#include <memory>
#include <optional>
#include <vector>

#include "qz/toolkit/application.hpp"
#include "qz/toolkit/ref.hpp"
#include "qz/toolkit/window.hpp"

namespace qz::toolkit {

/// Belongs to a window, which may be a sheet several times, one after the other.
class SheetSession {
 public:
  /// The window has become a sheet. If it has not ended since it began before, only the new
  /// delegate learns of the end.
  void begin(const std::shared_ptr<SheetDelegate>& delegate, void* contextInfo);
  /// Tells the delegate that `sheet`, the window of this session, has ended, unless it knows
  /// already.
  void end(const Ref<Window>& sheet, long returnCode);

  /// Returns the return codes of all requests to end the sheet, in order.
  const std::vector<long>& ends() const { return ends_; }

 private:
  struct Begun {
    std::weak_ptr<SheetDelegate> delegate;  // kept alive by its owner
    void* contextInfo;
  };

  std::optional<Begun> begun_;  // from the beginning of a sheet to its end
  std::vector<long> ends_;
};

/// Whether `window` is `parent` or one to which `parent` is attached, directly or through others. A
/// window that is attached to itself could never accept input again.
template <class BackendWindow>
bool isAttachedTo(const BackendWindow& window, std::shared_ptr<BackendWindow> parent) {
  for (; parent; parent = parent->sheetParent()) {
    if (parent.get() == &window) return true;
  }
  return false;
}

}  // namespace qz::toolkit
