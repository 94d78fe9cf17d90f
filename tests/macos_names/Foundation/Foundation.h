// SPDX-License-Identifier: MIT
// What the sources use of Foundation, declared as Apple documents it for macOS.
// scripts/check-appkit compiles all sources against these headers alone, so that a name that is not
// here is an error.
//
// Before you add a name: look it up at developer.apple.com/documentation, and copy its types from
// there. A name that only GNUstep has does not belong here, but behind `#ifdef GNUSTEP`.
#pragma once

#include <stddef.h>

#pragma clang assume_nonnull begin

#ifdef __cplusplus
#define FOUNDATION_EXPORT extern "C"
#define NS_OPTIONS(type, name) \
  type name;                   \
  enum : type
#else
#define FOUNDATION_EXPORT extern
#define NS_OPTIONS NS_ENUM
#endif
#define NS_ENUM(type, name) \
  enum name : type name;    \
  enum name : type

// --- the runtime ---

typedef signed char BOOL;  // of Intel's processors; Apple's own have a bool
#define YES __objc_yes
#define NO __objc_no
#ifdef __cplusplus
#define nil nullptr
#else
#define nil ((void*)0)
#endif
typedef void (*IMP)(void);
FOUNDATION_EXPORT const char* sel_getName(SEL selector);

typedef long NSInteger;
typedef unsigned long NSUInteger;
typedef double NSTimeInterval;
typedef unsigned short unichar;

@class NSArray, NSData, NSDate, NSDictionary, NSEnumerator, NSError, NSInvocation,
    NSMethodSignature, NSMutableDictionary, NSString;

@protocol NSObject
- (BOOL)isEqual:(nullable id)object;
- (Class)class;
- (instancetype)self;
- (nullable id)performSelector:(SEL)selector withObject:(nullable id)object;
- (BOOL)isKindOfClass:(Class)wanted;
- (BOOL)conformsToProtocol:(Protocol*)protocol;
- (BOOL)respondsToSelector:(SEL)selector;
- (instancetype)retain;
- (oneway void)release;
- (instancetype)autorelease;
- (NSUInteger)retainCount;
@property(readonly, copy) NSString* description;
@end

@protocol NSCopying
@end

__attribute__((objc_root_class))
@interface NSObject<NSObject>
- (instancetype)init;
+ (instancetype)alloc;
- (void)dealloc;
- (id)copy;
- (id)mutableCopy;
+ (Class)class;
- (IMP)methodForSelector:(SEL)selector;
+ (IMP)instanceMethodForSelector:(SEL)selector;
- (NSMethodSignature*)methodSignatureForSelector:(SEL)selector;
- (void)forwardInvocation:(NSInvocation*)invocation;
- (nullable id)valueForKey:(NSString*)key;
- (void)setValue:(nullable id)value forKey:(NSString*)key;
- (nullable id)valueForKeyPath:(NSString*)path;
- (void)setValue:(nullable id)value forKeyPath:(NSString*)path;
@end

@interface NSAutoreleasePool : NSObject
@end

FOUNDATION_EXPORT void NSLog(NSString* format, ...);
FOUNDATION_EXPORT NSString* NSStringFromSelector(SEL selector);
FOUNDATION_EXPORT SEL NSSelectorFromString(NSString* name);
FOUNDATION_EXPORT NSString* NSStringFromClass(Class shown);
FOUNDATION_EXPORT Class _Nullable NSClassFromString(NSString* name);
FOUNDATION_EXPORT NSString* NSTemporaryDirectory(void);

// --- geometry ---

typedef double CGFloat;
typedef struct CGPoint {
  CGFloat x, y;
} CGPoint;
typedef struct CGSize {
  CGFloat width, height;
} CGSize;
typedef struct CGRect {
  CGPoint origin;
  CGSize size;
} CGRect;
typedef CGPoint NSPoint;
typedef CGSize NSSize;
typedef CGRect NSRect;
typedef struct _NSRange {
  NSUInteger location, length;
} NSRange;
typedef NSRange* NSRangePointer;

FOUNDATION_EXPORT const NSRect NSZeroRect;
FOUNDATION_EXPORT NSPoint NSMakePoint(CGFloat x, CGFloat y);
FOUNDATION_EXPORT NSSize NSMakeSize(CGFloat width, CGFloat height);
FOUNDATION_EXPORT NSRect NSMakeRect(CGFloat x, CGFloat y, CGFloat width, CGFloat height);
FOUNDATION_EXPORT CGFloat NSMidX(NSRect rect);
FOUNDATION_EXPORT CGFloat NSMidY(NSRect rect);
FOUNDATION_EXPORT CGFloat NSMaxY(NSRect rect);
FOUNDATION_EXPORT BOOL NSEqualRects(NSRect one, NSRect other);
FOUNDATION_EXPORT NSRect NSUnionRect(NSRect one, NSRect other);
FOUNDATION_EXPORT NSRange NSMakeRange(NSUInteger location, NSUInteger length);
FOUNDATION_EXPORT NSUInteger NSMaxRange(NSRange range);

// --- values ---

typedef NSUInteger NSStringEncoding;
enum : NSStringEncoding { NSASCIIStringEncoding = 1 };

@interface NSString : NSObject <NSCopying>
@property(readonly) NSUInteger length;
@property(nullable, readonly) const char* UTF8String;
@property(readonly, copy) NSString* uppercaseString;
@property(readonly, getter=isAbsolutePath) BOOL absolutePath;
@property(readonly, copy) NSString* stringByResolvingSymlinksInPath;
+ (instancetype)stringWithFormat:(NSString*)format, ...;
+ (instancetype)stringWithCharacters:(const unichar*)characters length:(NSUInteger)length;
- (nullable instancetype)initWithBytes:(const void*)bytes
                                length:(NSUInteger)length
                              encoding:(NSStringEncoding)encoding;
- (void)getCharacters:(unichar*)buffer range:(NSRange)range;
- (NSString*)substringWithRange:(NSRange)range;
- (NSRange)rangeOfString:(NSString*)text;
- (BOOL)hasPrefix:(NSString*)text;
- (NSString*)stringByAppendingString:(NSString*)text;
- (NSString*)stringByAppendingPathComponent:(NSString*)component;
@end

@interface NSConstantString : NSString
@end

@interface NSValue : NSObject <NSCopying>
@property(readonly) const char* objCType;
@end

@interface NSNumber : NSValue
@property(readonly) int intValue;
@property(readonly) long long longLongValue;
@property(readonly) unsigned long long unsignedLongLongValue;
@property(readonly) float floatValue;
@property(readonly) double doubleValue;
@property(readonly) BOOL boolValue;
+ (NSNumber*)numberWithChar:(char)value;
+ (NSNumber*)numberWithUnsignedShort:(unsigned short)value;
+ (NSNumber*)numberWithInt:(int)value;
+ (NSNumber*)numberWithUnsignedInt:(unsigned int)value;
+ (NSNumber*)numberWithLongLong:(long long)value;
+ (NSNumber*)numberWithUnsignedLongLong:(unsigned long long)value;
+ (NSNumber*)numberWithFloat:(float)value;
+ (NSNumber*)numberWithDouble:(double)value;
+ (NSNumber*)numberWithBool:(BOOL)value;
+ (NSNumber*)numberWithInteger:(NSInteger)value;
@end

@interface NSDecimalNumber : NSNumber
+ (NSDecimalNumber*)decimalNumberWithString:(nullable NSString*)text;
@end

@interface NSNull : NSObject <NSCopying>
+ (NSNull*)null;
@end

@interface NSData : NSObject <NSCopying>
@property(readonly) NSUInteger length;
@property(readonly) const void* bytes;
+ (instancetype)dataWithBytes:(nullable const void*)bytes length:(NSUInteger)length;
+ (nullable instancetype)dataWithContentsOfFile:(NSString*)path;
- (BOOL)writeToFile:(NSString*)path atomically:(BOOL)atomically;
@end

@interface NSDate : NSObject <NSCopying>
@property(class, readonly, copy) NSDate* distantPast;
@property(readonly) NSTimeInterval timeIntervalSinceReferenceDate;
@property(readonly) NSTimeInterval timeIntervalSinceNow;
+ (instancetype)date;
+ (instancetype)dateWithTimeIntervalSinceNow:(NSTimeInterval)seconds;
+ (instancetype)dateWithTimeIntervalSinceReferenceDate:(NSTimeInterval)seconds;
@end

@interface NSURL : NSObject <NSCopying>
@property(nullable, readonly, copy) NSString* absoluteString;
@end

// --- collections ---

@interface NSEnumerator : NSObject
- (nullable id)nextObject;
@end

@interface NSArray : NSObject <NSCopying>
@property(readonly) NSUInteger count;
@property(nullable, readonly, nonatomic) id lastObject;
+ (instancetype)array;
+ (instancetype)arrayWithObject:(id)object;
+ (instancetype)arrayWithObjects:(id)first, ... __attribute__((sentinel(0, 1)));
+ (instancetype)arrayWithArray:(NSArray*)array;
- (id)objectAtIndex:(NSUInteger)index;
- (BOOL)containsObject:(id)object;
- (NSEnumerator*)objectEnumerator;
- (NSArray*)arrayByAddingObject:(id)object;
- (NSString*)componentsJoinedByString:(NSString*)separator;
- (void)makeObjectsPerformSelector:(SEL)selector;
- (BOOL)writeToFile:(NSString*)path atomically:(BOOL)atomically;
@end

@interface NSMutableArray : NSArray
+ (instancetype)arrayWithCapacity:(NSUInteger)capacity;
- (void)addObject:(id)object;
- (void)insertObject:(id)object atIndex:(NSUInteger)index;
- (void)removeLastObject;
- (void)removeObjectAtIndex:(NSUInteger)index;
- (void)replaceObjectAtIndex:(NSUInteger)index withObject:(id)object;
- (void)addObjectsFromArray:(NSArray*)other;
- (void)removeAllObjects;
- (void)setArray:(NSArray*)other;
@end

@interface NSDictionary : NSObject <NSCopying>
@property(readonly) NSUInteger count;
@property(readonly, copy) NSArray* allKeys;
@property(readonly, copy) NSArray* allValues;
+ (instancetype)dictionary;
+ (instancetype)dictionaryWithObject:(id)object forKey:(id<NSCopying>)key;
+ (instancetype)dictionaryWithObjectsAndKeys:(id)first, ... __attribute__((sentinel(0, 1)));
+ (instancetype)dictionaryWithDictionary:(NSDictionary*)other;
- (nullable id)objectForKey:(id)key;
- (NSEnumerator*)keyEnumerator;
- (NSEnumerator*)objectEnumerator;
- (NSArray*)allKeysForObject:(id)object;
- (NSArray*)objectsForKeys:(NSArray*)keys notFoundMarker:(id)marker;
- (nullable NSString*)fileType;
@end

@interface NSMutableDictionary : NSDictionary
- (void)setObject:(id)object forKey:(id<NSCopying>)key;
- (void)removeObjectForKey:(id)key;
- (void)removeAllObjects;
- (void)addEntriesFromDictionary:(NSDictionary*)other;
- (void)setDictionary:(NSDictionary*)other;
@end

@interface NSSet : NSObject <NSCopying>
@property(readonly) NSUInteger count;
- (NSEnumerator*)objectEnumerator;
- (BOOL)containsObject:(id)object;
@end

@interface NSMutableSet : NSSet
+ (instancetype)setWithCapacity:(NSUInteger)capacity;
- (void)addObject:(id)object;
@end

// --- exceptions and messages ---

FOUNDATION_EXPORT NSString* const NSGenericException;
FOUNDATION_EXPORT NSString* const NSInvalidArgumentException;
FOUNDATION_EXPORT NSString* const NSMallocException;
FOUNDATION_EXPORT NSString* const NSRangeException;

@interface NSException : NSObject <NSCopying>
@property(readonly, copy) NSString* name;
@property(nullable, readonly, copy) NSString* reason;
+ (NSException*)exceptionWithName:(NSString*)name
                           reason:(nullable NSString*)reason
                         userInfo:(nullable NSDictionary*)userInfo;
+ (void)raise:(NSString*)name format:(NSString*)format, ...;
- (void)raise;
@end

@interface NSMethodSignature : NSObject
@property(readonly) const char* methodReturnType;
+ (nullable NSMethodSignature*)signatureWithObjCTypes:(const char*)types;
@end

@interface NSInvocation : NSObject
@property(readonly, retain) NSMethodSignature* methodSignature;
@property SEL selector;
+ (NSInvocation*)invocationWithMethodSignature:(NSMethodSignature*)signature;
- (void)getReturnValue:(void*)place;
- (void)getArgument:(void*)place atIndex:(NSInteger)index;
- (void)setArgument:(void*)place atIndex:(NSInteger)index;
- (void)invokeWithTarget:(id)target;
@end

// --- the run loop ---

FOUNDATION_EXPORT NSString* const NSDefaultRunLoopMode;

@interface NSTimer : NSObject
@property(copy) NSDate* fireDate;
@property(readonly) NSTimeInterval timeInterval;
@property(readonly, getter=isValid) BOOL valid;
@property(nullable, readonly, retain) id userInfo;
+ (NSTimer*)timerWithTimeInterval:(NSTimeInterval)interval
                           target:(id)target
                         selector:(SEL)selector
                         userInfo:(nullable id)userInfo
                          repeats:(BOOL)repeats;
- (void)fire;
- (void)invalidate;
@end

@interface NSRunLoop : NSObject
@property(class, readonly, strong) NSRunLoop* currentRunLoop;
- (void)addTimer:(NSTimer*)timer forMode:(NSString*)mode;
- (BOOL)runMode:(NSString*)mode beforeDate:(NSDate*)limit;
@end

@interface NSNotification : NSObject
@end

@interface NSNotificationCenter : NSObject
@property(class, readonly, strong) NSNotificationCenter* defaultCenter;
- (void)addObserver:(id)observer
           selector:(SEL)selector
               name:(nullable NSString*)name
             object:(nullable id)object;
- (void)removeObserver:(id)observer;
@end

// --- files and the process ---

FOUNDATION_EXPORT NSString* const NSFileModificationDate;
FOUNDATION_EXPORT NSString* const NSFileTypeRegular;

@interface NSFileManager : NSObject
@property(class, readonly, strong) NSFileManager* defaultManager;
@property(readonly, copy) NSString* currentDirectoryPath;
- (BOOL)fileExistsAtPath:(NSString*)path;
- (nullable NSDictionary*)attributesOfItemAtPath:(NSString*)path
                                           error:(NSError* _Nullable* _Nullable)error;
@end

@interface NSBundle : NSObject
@property(class, readonly, strong) NSBundle* mainBundle;
@property(nullable, readonly, copy) NSString* resourcePath;
@end

@interface NSProcessInfo : NSObject
@property(class, readonly, strong) NSProcessInfo* processInfo;
@property(readonly, copy) NSDictionary* environment;
@property(readonly) int processIdentifier;
@end

typedef NS_ENUM(NSUInteger, NSPropertyListFormat) { NSPropertyListXMLFormat_v1_0 = 100 };

@interface NSPropertyListSerialization : NSObject
// Deprecated since macOS 10.10, with a successor of the same meaning.
+ (nullable NSData*)dataFromPropertyList:(id)list
                                  format:(NSPropertyListFormat)format
                        errorDescription:(NSString* _Nullable* _Nullable)error;
@end

// --- text with attributes ---

@interface NSAttributedString : NSObject <NSCopying>
@property(readonly, copy) NSString* string;
@property(readonly) NSUInteger length;
- (instancetype)initWithString:(NSString*)text attributes:(nullable NSDictionary*)attributes;
- (NSDictionary*)attributesAtIndex:(NSUInteger)index effectiveRange:(nullable NSRangePointer)range;
- (nullable id)attribute:(NSString*)name
                 atIndex:(NSUInteger)index
          effectiveRange:(nullable NSRangePointer)range;
@end

@interface NSMutableAttributedString : NSAttributedString
- (void)appendAttributedString:(NSAttributedString*)text;
@end

#pragma clang assume_nonnull end
