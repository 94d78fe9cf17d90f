// SPDX-License-Identifier: MIT
// A host's sheet delegate, to which the end of a sheet is sent.
#pragma once

#import <Foundation/Foundation.h>

#include <memory>

#include "hosts/appkit/platform.hpp"

namespace qz::hosts::appkit {

/// Returns a delegate that sends `sheetDidEnd:returnCode:contextInfo:` to `object`, if that
/// implements it. The object is not retained. Null for nil.
std::shared_ptr<toolkit::SheetDelegate> sheetDelegateFor(id object, Platform& platform);

}  // namespace qz::hosts::appkit
