// SPDX-License-Identifier: MIT
// The beginning and the end of a sheet.

#include "toolkit/backend/sheet_session.hpp"

#include <utility>

namespace qz::toolkit {

void SheetSession::begin(const std::shared_ptr<SheetDelegate>& delegate, void* contextInfo) {
  begun_ = Begun{delegate, contextInfo};
}

void SheetSession::end(const Ref<Window>& sheet, long returnCode) {
  ends_.push_back(returnCode);
  const auto begun = std::exchange(begun_, std::nullopt);
  if (!begun) return;
  if (const auto delegate = begun->delegate.lock()) {
    delegate->sheetDidEnd(sheet, returnCode, begun->contextInfo);
  }
}

}  // namespace qz::toolkit
