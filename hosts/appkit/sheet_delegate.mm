// SPDX-License-Identifier: MIT
#import "hosts/appkit/sheet_delegate.hpp"

#import "QZ_Plist_State_Parser.h"
#include "qz/toolkit/application.hpp"
#import "toolkit/foundation/exceptions.hpp"

namespace qz::hosts::appkit {

namespace {

class ObjectiveCSheetDelegate final : public toolkit::SheetDelegate {
 public:
  ObjectiveCSheetDelegate(id object, Platform& platform) : object_(object), platform_(platform) {}

  void sheetDidEnd(const toolkit::Ref<toolkit::Window>& sheet, long returnCode,
                   void* contextInfo) override {
    const id<QZ_Plist_State_Parser_SheetDelegate> object = object_;
    const id window = platform_.object(sheet);
    toolkit::foundation::sending([&] {
      if (![object respondsToSelector:@selector(sheetDidEnd:returnCode:contextInfo:)]) return;
      [object sheetDidEnd:window returnCode:returnCode contextInfo:contextInfo];
    });
  }

 private:
  id object_;  // kept alive by its owner
  Platform& platform_;
};

}  // namespace

std::shared_ptr<toolkit::SheetDelegate> sheetDelegateFor(id object, Platform& platform) {
  return object ? std::make_shared<ObjectiveCSheetDelegate>(object, platform) : nullptr;
}

}  // namespace qz::hosts::appkit
