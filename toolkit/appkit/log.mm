// SPDX-License-Identifier: MIT
// Writes log lines with `NSLog`.

#include "qz/toolkit/appkit/log.hpp"

#import "toolkit/foundation/strings.hpp"

namespace qz::toolkit::appkit {

void AppKitLog::write(std::string_view line) {
  const Sink sink = sink_;  // a copy: the sink may replace itself
  if (sink) {
    sink(line);
  } else {
    NSLog(@"%@", foundation::nsString(line));
  }
}

}  // namespace qz::toolkit::appkit
