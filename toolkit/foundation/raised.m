// SPDX-License-Identifier: MIT
#import "toolkit/foundation/raised.h"

NSException* qzRaisedBy(void (*body)(void* context), void* context) {
  @try {
    body(context);
  } @catch (NSException* exception) {
    return exception;
  }
  return nil;
}
