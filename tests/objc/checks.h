// SPDX-License-Identifier: MIT
// Checks for test programs in Objective-C, and the window in which they play.
#import <AppKit/AppKit.h>

#ifdef __cplusplus
extern "C" {
#endif

/// Counts a failure, with its place, unless the condition holds.
#define CHECK(condition) checkThat((condition) ? YES : NO, #condition, __FILE__, __LINE__)
/// Compares two objects, which may be nil.
#define CHECK_EQUAL(object, expected) checkEqual((object), (expected), #object, __FILE__, __LINE__)
/// Checks that the statement raises an exception with this name whose reason contains the text.
#define CHECK_RAISES(name, text, statement)                               \
  do {                                                                    \
    NSException* raised_ = nil;                                           \
    @try {                                                                \
      statement;                                                          \
    } @catch (NSException * exception_) {                                 \
      raised_ = exception_;                                               \
    }                                                                     \
    checkRaised(raised_, (name), (text), #statement, __FILE__, __LINE__); \
  } while (0)

void checkThat(BOOL holds, const char* what, const char* file, int line);
void checkEqual(id object, id expected, const char* what, const char* file, int line);
void checkRaised(NSException* raised, NSString* name, NSString* text, const char* what,
                 const char* file, int line);

/// Runs a test in its own pool and prints its name.
void runTest(const char* name, void (*test)(void));
/// Returns the program's exit code.
int testResult(void);

enum { nextTag = 2, switchTag = 3, textTag = 5, imageTag = 6 };

/// Returns a window with a button, a switch, a text field, an image view and a text view, which has
/// no tag, autoreleased.
NSWindow* windowWithControls(void);
/// Returns the control of a window with the tag.
id controlIn(NSWindow* window, NSInteger tag);
/// Writes a script and returns its path.
NSString* scriptFile(NSDictionary* script);
/// Returns a list with one command.
NSArray* command(NSString* name, id parameter0, id parameter1);
/// Lets timers fire, for some seconds.
void letTimePass(NSTimeInterval seconds);
/// Lets timers fire until the condition holds, for at most 10 seconds.
#define WAIT_UNTIL(condition) \
  for (int turn_ = 0; turn_ < 200 && !(condition); ++turn_) letTimePass(0.05)
NSNumber* number(NSInteger value);

#ifdef __cplusplus
}
#endif
