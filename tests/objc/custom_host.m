// SPDX-License-Identifier: MIT
// What a host does with the engine beyond sending messages: it renames commands, derives classes,
// uses key-value coding, shows sheets, and lets the engine go at any moment.

#import "QZ_Plist_State_Parser.h"
#import "checks.h"

static NSMutableArray* journal = nil;  // what happened, in order
static NSInteger engines = 0;          // that exist

/// An engine that writes down what it is sent.
@interface WatchedEngine : QZ_Plist_State_Parser {
  BOOL releasesItself_;
}
- (void)setReleasesItself:(BOOL)releases;
@end

@implementation WatchedEngine

- (id)initWithWindow:(NSWindow*)window {
  self = [super initWithWindow:window];
  ++engines;
  return self;
}

- (void)dealloc {
  --engines;
  [super dealloc];
}

- (void)setReleasesItself:(BOOL)releases {
  releasesItself_ = releases;
}

- (void)buttonPushed:(id)sender {
  [journal addObject:@"buttonPushed:"];
  [super buttonPushed:sender];
  if (releasesItself_) {
    [self terminateParser];
    [self release];
  }
}

- (BOOL)processCommandArray:(NSArray*)list ForObject:(NSNumber*)objectId {
  [journal addObject:[NSString stringWithFormat:@"list %@ of %d", objectId, (int)[list count]]];
  return [super processCommandArray:list ForObject:objectId];
}

- (BOOL)doCompoundCommand:(NSString*)name
           withParameters:(NSMutableArray*)parameters
              usingObject:(NSNumber*)objectId {
  [journal addObject:[NSString stringWithFormat:@"%@ %d", name, (int)[parameters count]]];
  if ([name isEqual:@"GREET"]) {  // a command of the host's own
    NSArray* greeting = [NSArray arrayWithObjects:@"Hello", [parameters objectAtIndex:0], nil];
    return [super doCompoundCommand:@"SET_TEXT_FOR_OBJECT_ID"
                     withParameters:[NSMutableArray arrayWithArray:greeting]
                        usingObject:objectId];
  }
  if ([name isEqual:@"RAISE"]) [NSException raise:@"OwnException" format:@"own reason"];
  return [super doCompoundCommand:name withParameters:parameters usingObject:objectId];
}

- (BOOL)doSimpleCommand:(NSString*)name
             withParams:(NSMutableArray*)parameters
            usingObject:(NSNumber*)objectId {
  [journal addObject:name];
  return [super doSimpleCommand:name withParams:parameters usingObject:objectId];
}

- (BOOL)QZ_Plist_State_Processor_SET_TEXT:(NSString*)text forId:(NSNumber*)objectId {
  return [super QZ_Plist_State_Processor_SET_TEXT:[text uppercaseString] forId:objectId];
}

- (BOOL)QZ_Plist_State_Processor_SET_TOOL_TIP:(NSArray*)parameters forObject:(NSNumber*)objectId {
  [journal addObject:[NSString stringWithFormat:@"tip of %d", (int)[parameters count]]];
  return [super QZ_Plist_State_Processor_SET_TOOL_TIP:parameters forObject:objectId];
}

- (id)findObjectWithTag:(NSInteger)tag {
  return [super findObjectWithTag:tag == 1005 ? textTag : tag];
}

- (void)pseudoButtonPush:(NSTimer*)timer {
  [journal addObject:[timer isKindOfClass:[NSTimer class]] ? @"timer" : @"no timer"];
  [super pseudoButtonPush:timer];
}

- (void)flasherFired:(NSTimer*)timer {
  if (timer == [self flashingTimer]) [journal addObject:@"tick"];
  [super flasherFired:timer];
}

- (void)killAllTimers {
  [journal addObject:@"killAllTimers"];
  [super killAllTimers];
}

- (void)terminateParser {
  [journal addObject:@"terminateParser"];
  [super terminateParser];
}

@end

/// Learns of the end of a sheet.
@interface Delegate : NSObject {
 @public
  NSWindow* sheet_;
  NSInteger code_;
  int ends_;
}
@end

@implementation Delegate
- (void)sheetDidEnd:(NSWindow*)sheet
         returnCode:(NSInteger)returnCode
        contextInfo:(void*)contextInfo {
  CHECK(contextInfo == NULL);
  sheet_ = sheet;
  code_ = returnCode;
  ++ends_;
  [sheet orderOut:nil];
}
@end

static NSWindow* window = nil;
static WatchedEngine* engine = nil;

static void setUp(void) {
  journal = [[NSMutableArray alloc] init];
  window = [windowWithControls() retain];
  engine = [[WatchedEngine alloc] initWithWindow:nil];
  CHECK([engine getGuiAssetsFromWindow:window]);
}

static void tearDown(void) {
  [engine terminateParser];
  [engine release];
  engine = nil;
  [window release];
  window = nil;
  [journal release];
  journal = nil;
}

static NSString* said(void) {
  NSString* all = [journal componentsJoinedByString:@", "];
  [journal removeAllObjects];
  return all;
}

static NSString* textOfField(void) { return [controlIn(window, textTag) stringValue]; }

static void commandsAreRenamed(void) {
  setUp();
  NSArray* say = command(@"say", @"a", number(textTag));
  NSString* before = QZ_PLIST_STATE_PARSER_SET_TEXT_FOR_OBJECT_ID;
  CHECK_EQUAL(before, @"SET_TEXT_FOR_OBJECT_ID");
  CHECK_EQUAL(QZ_PLIST_STATE_PARSER_RETURN_TO_IDLE_LOOP, @"IDLE_LOOP");
  CHECK(![engine processCommandArray:say ForObject:number(1)]);
  QZ_PLIST_STATE_PARSER_SET_TEXT_FOR_OBJECT_ID = @"SAY";
  CHECK([engine processCommandArray:say ForObject:number(1)]);
  CHECK_EQUAL(textOfField(), @"A");
  QZ_PLIST_STATE_PARSER_SET_TEXT_FOR_OBJECT_ID = nil;
  CHECK(![engine processCommandArray:say ForObject:number(1)]);
  CHECK(![engine processCommandArray:command(@"", @"b", number(textTag)) ForObject:number(1)]);
  QZ_PLIST_STATE_PARSER_SET_TEXT_FOR_OBJECT_ID = before;
  CHECK([engine processCommandArray:command(before, @"c", number(textTag)) ForObject:number(1)]);
  CHECK_EQUAL(textOfField(), @"C");
  tearDown();
}

static void theEngineSendsItselfMessages(void) {
  setUp();
  NSMutableArray* list = [NSMutableArray array];
  [list addObjectsFromArray:command(@"greet", number(1005), nil)];
  [list addObjectsFromArray:command(@"SET_TOOL_TIP_FOR_ID", @"tip", number(textTag))];
  [list addObject:@"IDLE_LOOP"];
  [[engine plistDictionary] setObject:list forKey:@"2"];
  [controlIn(window, nextTag) performClick:nil];
  CHECK_EQUAL(said(), @"buttonPushed:, killAllTimers, list 2 of 3, GREET 1, "
                      @"SET_TOOL_TIP_FOR_ID 2, tip of 2, IDLE_LOOP");
  CHECK_EQUAL(textOfField(), @"HELLO");
  CHECK_EQUAL([controlIn(window, textTag) toolTip], @"tip");
  [[engine plistDictionary] setObject:[NSArray arrayWithObject:@"TERMINATE_PARSER"] forKey:@"2"];
  [controlIn(window, nextTag) performClick:nil];
  CHECK_EQUAL(said(), @"buttonPushed:, killAllTimers, list 2 of 1, TERMINATE_PARSER, "
                      @"terminateParser");
  tearDown();
}

static void timersSendMessages(void) {
  setUp();
  [engine setFlashing:YES];
  [engine startTimerWithValue:1 forKey:@"8"];
  WAIT_UNTIL([journal containsObject:@"list 8 of 0"]);
  NSString* all = said();
  CHECK([all hasPrefix:@"tick, "]);
  CHECK([all rangeOfString:@"timer, killAllTimers, list 8 of 0"].length > 0);
  tearDown();
}

static void exceptionsKeepNameAndReason(void) {
  setUp();
  CHECK_RAISES(@"OwnException", @"own reason",
               [engine doCompoundCommand:@"RAISE" withParameters:nil usingObject:nil]);
  CHECK([engine processCommandArray:[command(@"raise", nil, nil) arrayByAddingObject:@"IDLE_LOOP"]
                          ForObject:number(1)]);
  CHECK_EQUAL(said(), @"RAISE 0, list 1 of 2, RAISE 0, IDLE_LOOP");
  tearDown();
}

static void propertiesHaveKeyValueCoding(void) {
  setUp();
  [engine setValue:[NSNumber numberWithBool:YES] forKey:@"flashing"];
  CHECK([engine flashing]);
  CHECK_EQUAL([engine valueForKey:@"flashing"], [NSNumber numberWithBool:YES]);
  [engine setValue:number(9) forKey:@"lastTagId"];
  CHECK_EQUAL([engine valueForKey:@"lastTagId"], number(9));
  CHECK_EQUAL([engine currentCommandState], @"9");
  [engine setValue:@"list" forKeyPath:@"plistDictionary.7"];
  CHECK_EQUAL([[engine plistDictionary] objectForKey:@"7"], @"list");
  CHECK_EQUAL([engine valueForKeyPath:@"originalTagValues.5"], number(5));
  CHECK([engine valueForKey:@"tutorialWindow"] == window);
  CHECK([engine valueForKey:@"commandArray"] == nil);
  CHECK_EQUAL([engine valueForKeyPath:@"flashingTimer.isValid"], [NSNumber numberWithBool:YES]);
  tearDown();
}

// A nib makes the object with `init` and then connects its outlets.
static void aNibCanMakeIt(void) {
  NSWindow* host = windowWithControls();
  id made = [[[NSClassFromString(@"QZ_Plist_State_Parser") alloc] init] autorelease];
  [made setValue:host forKey:@"window"];
  CHECK([made window] == host);
  CHECK([made getGuiAssetsFromWindow:host]);
  [made setValue:[NSMutableDictionary
                     dictionaryWithObject:command(@"SET_TEXT_FOR_OBJECT_ID", @"a", number(textTag))
                                   forKey:@"2"]
          forKey:@"plistDictionary"];
  [controlIn(host, nextTag) performClick:nil];
  CHECK_EQUAL([controlIn(host, textTag) stringValue], @"a");
}

static void theFlasherKeepsTheEngineAlive(void) {
  NSAutoreleasePool* pool = [[NSAutoreleasePool alloc] init];
  WatchedEngine* alone = [[WatchedEngine alloc] initWithWindow:nil];
  [alone release];
  CHECK(engines == 1);
  [alone terminateParser];
  [pool release];
  CHECK(engines == 0);
}

static void anEngineLetsGoInItsOwnAction(void) {
  setUp();
  [[engine plistDictionary] setObject:[NSArray arrayWithObject:@"IDLE_LOOP"] forKey:@"2"];
  [engine setReleasesItself:YES];
  NSButton* button = controlIn(window, nextTag);
  NSAutoreleasePool* pool = [[NSAutoreleasePool alloc] init];
  [button performClick:nil];
  [pool release];
  engine = nil;
  CHECK(engines == 0);
  CHECK([button target] == nil && [window delegate] == nil);
  [button performClick:nil];  // reaches nobody
  tearDown();
}

static void aListLetsTheEngineGo(void) {
  setUp();
  [[engine plistDictionary]
      setObject:[NSArray arrayWithObjects:@"TERMINATE_PARSER", @"HIDE_OBJECT_WITH_ID", nil]
         forKey:@"2"];
  NSAutoreleasePool* pool = [[NSAutoreleasePool alloc] init];
  [engine release];  // now only the flasher holds it
  CHECK(engines == 1);
  [controlIn(window, nextTag) performClick:nil];
  [pool release];
  CHECK(engines == 0);
  CHECK([controlIn(window, nextTag) isHidden]);  // the rest of the list has run
  engine = nil;
  tearDown();
}

static void controlsMayGoInTheMiddle(void) {
  setUp();
  NSMutableDictionary* records = [engine guiAssets];
  NSAutoreleasePool* pool = [[NSAutoreleasePool alloc] init];
  [controlIn(window, textTag) removeFromSuperview];
  CHECK(![engine QZ_Plist_State_Processor_SET_TEXT:@"a" forId:number(textTag)]);
  [window close];
  [pool release];
  CHECK([records count] == 4);
  CHECK([[records objectForKey:@"5"] objectAtIndex:2] != nil);
  tearDown();
}

static void aSheetTellsItsDelegate(void) {
  setUp();
  Delegate* delegate = [[Delegate alloc] init];
  NSUInteger holders = [delegate retainCount];
  NSWindow* host = windowWithControls();
  [host makeKeyAndOrderFront:nil];
  [engine setWindow:host];
  CHECK([engine loadPlist:nil runFromKey:nil withDelegate:delegate runAsSheet:YES]);
  CHECK([delegate retainCount] == holders);
  CHECK([engine runningAsSheet] && [window isVisible]);
  [engine terminateParser];
  CHECK(delegate->ends_ == 1 && delegate->sheet_ == window && delegate->code_ == 0);
  CHECK(![window isVisible]);
  [engine terminateParser];
  CHECK(delegate->ends_ == 1);
  tearDown();
  [delegate release];
}

static void aDelegateNeedNotListen(void) {
  setUp();
  CHECK([engine loadPlist:nil runFromKey:nil withDelegate:@"anybody" runAsSheet:YES]);
  [engine terminateParser];
  CHECK([engine loadPlist:nil runFromKey:nil withDelegate:nil runAsSheet:YES]);
  [engine terminateParser];
  [window orderOut:nil];
  tearDown();
}

int main(void) {
  NSAutoreleasePool* pool = [[NSAutoreleasePool alloc] init];
  [[NSApplication sharedApplication] finishLaunching];
#define RUN(test) runTest(#test, test)
  RUN(commandsAreRenamed);
  RUN(theEngineSendsItselfMessages);
  RUN(timersSendMessages);
  RUN(exceptionsKeepNameAndReason);
  RUN(propertiesHaveKeyValueCoding);
  RUN(aNibCanMakeIt);
  RUN(theFlasherKeepsTheEngineAlive);
  RUN(anEngineLetsGoInItsOwnAction);
  RUN(aListLetsTheEngineGo);
  RUN(controlsMayGoInTheMiddle);
  RUN(aSheetTellsItsDelegate);
  RUN(aDelegateNeedNotListen);
  [pool release];
  return testResult();
}
