// SPDX-License-Identifier: MIT
// The views of arrays and dictionaries that Objective-C code gets.
#pragma once

#import <Foundation/Foundation.h>

#include "qz/property_list/collections.hpp"

/// Shows an array of the engine.
@interface QZArrayView : NSMutableArray {
 @private
  qz::toolkit::Array* array_;  // counted
}
- (id)initWithArrayValue:(qz::toolkit::Array*)array;
- (qz::toolkit::Array*)arrayValue;
@end

/// What views of dictionaries share.
@interface QZKeyedView : NSMutableDictionary
@end

/// Shows a dictionary of the engine.
@interface QZDictionaryView : QZKeyedView {
 @private
  qz::toolkit::Dictionary* dictionary_;  // counted
}
- (id)initWithDictionaryValue:(qz::toolkit::Dictionary*)dictionary;
- (qz::toolkit::Dictionary*)dictionaryValue;
@end

namespace qz::toolkit::foundation {

/// Return the view of the value, autoreleased; always the same while somebody holds it.
QZArrayView* viewOf(Array& array);
QZDictionaryView* viewOf(Dictionary& dictionary);

}  // namespace qz::toolkit::foundation
