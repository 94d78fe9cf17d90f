// SPDX-License-Identifier: MIT
// What the sources use of QuartzCore; the rules are in Foundation/Foundation.h.
#pragma once

#import <Foundation/Foundation.h>

@interface CALayer : NSObject
@property(nullable, strong) id contents;
@end
