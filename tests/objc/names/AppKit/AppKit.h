// SPDX-License-Identifier: MIT
// All that the public header needs of AppKit. It stands in for AppKit's own headers where the
// compiler cannot read them, as GCC's runtime headers with ARC.
#include <objc/objc.h>

typedef long NSInteger;
typedef unsigned long NSUInteger;
typedef struct {
  double x, y, width, height;
} NSRect;
#define IBAction void

@protocol NSObject
@end
__attribute__((objc_root_class))
@interface NSObject<NSObject>
@end
@protocol NSWindowDelegate <NSObject>
@end
@class NSArray, NSDictionary, NSError, NSMutableArray, NSMutableDictionary, NSNumber, NSString,
    NSTimer, NSWindow;
