// SPDX-License-Identifier: MIT
// Sends every message that the engine understands, also with absent arguments.

#import "QZ_Plist_State_Parser.h"
#import "checks.h"

static NSWindow* window = nil;
static QZ_Plist_State_Parser* engine = nil;

static void setUp(void) {
  window = [windowWithControls() retain];
  engine = [[QZ_Plist_State_Parser alloc] initWithWindow:nil];
  CHECK([engine getGuiAssetsFromWindow:window]);
}

static void tearDown(void) {
  [engine terminateParser];
  [engine release];
  engine = nil;
  [window release];
  window = nil;
}

static void load(NSDictionary* script) {
  CHECK([engine loadPlist:scriptFile(script) runFromKey:nil withDelegate:nil runAsSheet:NO]);
}

static NSString* textOfField(void) { return [controlIn(window, textTag) stringValue]; }

// --- construction, state and end ---

static void aFreshEngineHasTablesAndAFlasher(void) {
  NSWindow* host = windowWithControls();
  QZ_Plist_State_Parser* fresh = [[QZ_Plist_State_Parser alloc] initWithWindow:host];
  CHECK([fresh window] == host);
  CHECK(![fresh flashing] && ![fresh runningAsSheet]);
  CHECK(![fresh terminating] && ![fresh hasTerminated]);
  CHECK([fresh commandArray] == nil && [fresh objectId] == nil);
  CHECK([fresh tutorialWindow] == nil && [fresh lastTagId] == nil);
  CHECK([[fresh plistDictionary] count] == 0 && [fresh plistDictionary] != nil);
  CHECK([[fresh flashingTagIds] count] == 0 && [fresh flashingTagIds] != nil);
  CHECK([[fresh addedObjectToTutorial] count] == 0 && [fresh addedObjectToTutorial] != nil);
  CHECK([[fresh guiAssets] count] == 0 && [fresh guiAssets] != nil);
  CHECK([[fresh objectIdTimers] count] == 0 && [fresh objectIdTimers] != nil);
  CHECK([[fresh originalTagValues] count] == 0 && [fresh originalTagValues] != nil);
  CHECK([[fresh buttonStates] count] == 0 && [fresh buttonStates] != nil);
  CHECK([[fresh flashingTimer] isKindOfClass:[NSTimer class]]);
  CHECK([[fresh flashingTimer] isValid]);
  CHECK([[fresh flashingTimer] timeInterval] == 0.5);
  CHECK([[fresh flashingTimer] userInfo] == nil);
  CHECK_EQUAL([fresh currentCommandState], @"0");
  CHECK([fresh conformsToProtocol:@protocol(NSWindowDelegate)]);
  [fresh terminateParser];
  [fresh release];
}

static void plainInitMakesNoTables(void) {
  QZ_Plist_State_Parser* bare = [[[QZ_Plist_State_Parser alloc] init] autorelease];
  CHECK([bare plistDictionary] == nil && [bare flashingTagIds] == nil);
  CHECK([bare addedObjectToTutorial] == nil && [bare guiAssets] == nil);
  CHECK([bare objectIdTimers] == nil && [bare originalTagValues] == nil);
  CHECK([bare flashingTimer] == nil && [bare buttonStates] == nil && [bare window] == nil);
  CHECK_EQUAL([bare currentCommandState], @"0");
}

static void terminationEmptiesAndDropsTheTables(void) {
  setUp();
  load([NSDictionary dictionaryWithObject:[NSArray array] forKey:@"1"]);
  NSMutableDictionary* script = [engine plistDictionary];
  NSMutableDictionary* records = [engine guiAssets];
  NSTimer* flasher = [engine flashingTimer];
  CHECK([script count] == 1 && [records count] == 4);
  [controlIn(window, nextTag) setTag:20];
  [engine setCommandArray:[NSArray arrayWithObject:@"a"]];
  [engine terminateParser];
  CHECK([script count] == 0 && [records count] == 0 && ![flasher isValid]);
  CHECK([engine plistDictionary] == nil && [engine guiAssets] == nil);
  CHECK([engine flashingTimer] == nil && [engine commandArray] == nil);
  CHECK([engine terminating] && [engine hasTerminated]);
  CHECK([engine tutorialWindow] == window);
  CHECK([engine objectIdTimers] != nil && [engine originalTagValues] != nil);
  CHECK(controlIn(window, nextTag) != nil);  // the tag is back
  [engine setHasTerminated:NO];
  tearDown();
}

// --- scripts and lists ---

static void loadPlistRunsAList(void) {
  setUp();
  NSString* path = scriptFile([NSDictionary
      dictionaryWithObjectsAndKeys:command(@"SET_TEXT_FOR_OBJECT_ID", @"from 12", number(textTag)),
                                   @"12",
                                   command(@"SET_TEXT_FOR_OBJECT_ID", @"from -1", number(textTag)),
                                   @"-1", nil]);
  CHECK([engine loadPlist:path runFromKey:@"12" withDelegate:nil runAsSheet:NO]);
  CHECK_EQUAL(textOfField(), @"from 12");
  CHECK_EQUAL([engine currentCommandState], @"12");
  CHECK_EQUAL([engine lastTagId], number(12));
  CHECK([engine loadPlist:path runFromKey:@"" withDelegate:nil runAsSheet:NO]);
  CHECK_EQUAL(textOfField(), @"from -1");
  CHECK([engine loadPlist:path runFromKey:nil withDelegate:nil runAsSheet:NO]);
  CHECK([engine loadPlist:nil runFromKey:nil withDelegate:nil runAsSheet:NO]);
  CHECK([[engine plistDictionary] count] == 2);
  CHECK(![engine loadPlist:@"/no/such/file" runFromKey:@"5" withDelegate:nil runAsSheet:NO]);
  CHECK_EQUAL([engine currentCommandState], @"5");
  CHECK(![engine loadPlist:@"/etc/hostname" runFromKey:@"5" withDelegate:nil runAsSheet:NO]);
  CHECK([engine plistDictionary] == nil);
  tearDown();
}

static void listsAndCommandsRun(void) {
  setUp();
  NSArray* list = command(@"set_text_for_object_id", @"lower case", number(textTag));
  CHECK([engine processCommandArray:list ForObject:number(1)]);
  CHECK_EQUAL(textOfField(), @"lower case");
  CHECK(![engine processCommandArray:nil ForObject:number(9)]);
  CHECK_EQUAL([engine currentCommandState], @"9");
  CHECK(![engine processCommandArray:nil ForObject:nil]);
  CHECK([engine lastTagId] == nil);
  CHECK_RAISES(NSInvalidArgumentException, @"count",
               [engine processCommandArray:(NSArray*)@"text" ForObject:number(1)]);

  CHECK([engine doSimpleCommand:@"IDLE_LOOP" withParams:nil usingObject:nil]);
  CHECK(![engine doSimpleCommand:nil withParams:nil usingObject:nil]);
  CHECK(![engine doSimpleCommand:@"HIDE_OBJECT_WITH_ID"
                      withParams:[NSMutableArray array]
                     usingObject:number(nextTag)]);
  CHECK([controlIn(window, nextTag) isHidden]);

  NSMutableArray* parameters = [NSMutableArray arrayWithObject:number(nextTag)];
  CHECK([engine doCompoundCommand:@"SHOW_OBJECT_WITH_ID"
                   withParameters:parameters
                      usingObject:number(1)]);
  CHECK(![controlIn(window, nextTag) isHidden]);
  CHECK(![engine doCompoundCommand:nil withParameters:nil usingObject:nil]);
  CHECK_RAISES(NSRangeException, @"",
               [engine doCompoundCommand:@"SET_TITLE_FOR_OBJECT_ID"
                          withParameters:[NSMutableArray array]
                             usingObject:number(1)]);
  CHECK_RAISES(NSInvalidArgumentException, @"NSNumber",
               [engine processCommandArray:list ForObject:(NSNumber*)@"1"]);
  tearDown();
}

static void pressesRunLists(void) {
  setUp();
  load([NSDictionary
      dictionaryWithObject:command(@"SET_TEXT_FOR_OBJECT_ID", @"pressed", number(textTag))
                    forKey:@"3"]);
  NSButton* onOff = controlIn(window, switchTag);
  CHECK([onOff target] == engine);
  CHECK([onOff action] == @selector(buttonPushed:));
  [onOff performClick:nil];
  CHECK_EQUAL(textOfField(), @"pressed");
  CHECK_EQUAL([[engine buttonStates] objectForKey:@"3"], [NSNumber numberWithBool:YES]);
  [engine buttonPushed:controlIn(window, textTag)];
  [engine buttonPushed:nil];
  CHECK([[engine buttonStates] count] == 3);
  CHECK_EQUAL([[engine buttonStates] objectForKey:@"0"], [NSNumber numberWithBool:NO]);
  CHECK_EQUAL([engine currentCommandState], @"3");
  tearDown();
}

// --- adoption, building, states and tags ---

static void windowsAreAdopted(void) {
  setUp();
  CHECK([window delegate] == (id)engine);
  CHECK([engine tutorialWindow] == window);
  NSArray* record = [[engine guiAssets] objectForKey:@"2"];
  CHECK([record count] == 3 && [record objectAtIndex:2] == controlIn(window, nextTag));
  CHECK_EQUAL([[record objectAtIndex:0] objectAtIndex:0], @"NSButton");
  CHECK_EQUAL([[record objectAtIndex:1] objectAtIndex:2], [NSNumber numberWithFloat:80]);
  CHECK_EQUAL([[engine originalTagValues] objectForKey:@"5"], number(5));
  CHECK(![engine getGuiAssetsFromWindow:nil]);
  CHECK([engine tutorialWindow] == window);
  CHECK([engine findObjectWithTag:textTag] == controlIn(window, textTag));
  CHECK([engine findObjectWithTag:99] == nil);

  NSButton* own = [[[NSButton alloc] initWithFrame:NSMakeRect(0, 0, 9, 9)] autorelease];
  CHECK([engine forceButtonPushedToBeActionForGuiAttribute:own]);
  CHECK([own action] == @selector(buttonPushed:) && [own target] == nil);
  CHECK(![engine forceButtonPushedToBeActionForGuiAttribute:controlIn(window, textTag)]);
  CHECK(![engine forceButtonPushedToBeActionForGuiAttribute:nil]);
  CHECK_RAISES(NSInvalidArgumentException, @"NSWindow",
               [engine getGuiAssetsFromWindow:(NSWindow*)@"window"]);
  tearDown();
}

static void windowsAreBuilt(void) {
  QZ_Plist_State_Parser* builder = [[QZ_Plist_State_Parser alloc] initWithWindow:nil];
  NSMutableDictionary* assets = [NSMutableDictionary dictionary];
  CHECK([builder createNextGuiAssetEntry:&assets
                               forObject:@"NSButton"
                              usingFrame:NSMakeRect(10, 20, 80, 30)
                               withTagId:4]);
  CHECK_EQUAL([[assets objectForKey:@"4"] objectAtIndex:0], @"NSButton");
  CHECK_EQUAL([[assets objectForKey:@"4"] objectAtIndex:3], [NSNumber numberWithFloat:80]);
  CHECK([builder createNextGuiAssetEntry:&assets
                               forObject:@"NSTextField"
                              usingFrame:NSMakeRect(10, 60, 80, 30)
                               withTagId:5]);
  CHECK(![builder createNextGuiAssetEntry:&assets
                                forObject:@"NSSlider"
                               usingFrame:NSZeroRect
                                withTagId:6]);
  CHECK(![builder createNextGuiAssetEntry:&assets forObject:nil usingFrame:NSZeroRect withTagId:6]);
  CHECK(![builder createNextGuiAssetEntry:NULL
                                forObject:@"NSButton"
                               usingFrame:NSZeroRect
                                withTagId:6]);
  NSMutableDictionary* none = nil;
  NSMutableDictionary* fixed = (NSMutableDictionary*)[NSDictionary dictionary];
  CHECK(![builder createNextGuiAssetEntry:&none
                                forObject:@"NSButton"
                               usingFrame:NSZeroRect
                                withTagId:6]);
  CHECK(![builder createNextGuiAssetEntry:&fixed
                                forObject:@"NSButton"
                               usingFrame:NSZeroRect
                                withTagId:6]);
  CHECK([assets count] == 2);

  NSError* error = nil;
  CHECK(![builder loadGuiAssets:nil error:NULL]);
  CHECK([builder loadGuiAssets:assets error:&error]);
  CHECK(error == nil);
  CHECK([[builder tutorialWindow] isVisible]);
  CHECK([[builder addedObjectToTutorial] count] == 2);
  NSButton* built = [builder findObjectWithTag:4];
  CHECK([built isKindOfClass:[NSButton class]]);
  CHECK([[builder addedObjectToTutorial] containsObject:built]);
  CHECK([[builder tutorialWindow] delegate] == (id)builder);
  [[builder tutorialWindow] makeKeyWindow];  // where AppKit looks for a receiver
  [built performClick:nil];
  CHECK([[builder buttonStates] objectForKey:@"4"] != nil);
  CHECK_RAISES(NSRangeException, @"",
               [builder loadGuiAssets:[NSDictionary dictionaryWithObject:[NSArray array]
                                                                  forKey:@"1"]
                                error:NULL]);
  [builder terminateParser];
  [builder release];
}

static void buttonStatesAreCarriedOver(void) {
  setUp();
  NSDictionary* states = [NSDictionary dictionaryWithObject:[NSNumber numberWithBool:YES]
                                                     forKey:@"3"];
  CHECK([engine setButtonSates:states]);
  CHECK([controlIn(window, switchTag) state] == NSOnState);
  CHECK(![engine setButtonSates:nil]);
  CHECK(![engine setButtonSates:[NSDictionary dictionary]]);
  [controlIn(window, nextTag) setTag:22];
  [engine restoreOriginalTagValues];
  CHECK(controlIn(window, nextTag) != nil && controlIn(window, 22) == nil);
  tearDown();
}

// --- the processors ---

static void textsAreShown(void) {
  setUp();
  CHECK([engine QZ_Plist_State_Processor_SET_TEXT:@"Größe" forId:number(textTag)]);
  CHECK_EQUAL(textOfField(), @"Größe");
  CHECK(![engine QZ_Plist_State_Processor_SET_TEXT:nil forId:number(textTag)]);
  CHECK(![engine QZ_Plist_State_Processor_SET_TEXT:@"a" forId:number(99)]);
  CHECK(![engine QZ_Plist_State_Processor_SET_TEXT:nil forId:nil]);

  CHECK([engine QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML:@"<b>bold</b>"
                                                        WITH_FONT_NAME:@"Helvetica"
                                                             WITH_SIZE:number(14)
                                                         FOR_OBJECT_ID:number(textTag)]);
  CHECK_EQUAL(textOfField(), @"bold");
  CHECK([engine QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER:@"left"
                                                                  WITH_FONT_NAME:@"Helvetica"
                                                                       WITH_SIZE:@"14"
                                                                   FOR_OBJECT_ID:number(textTag)]);
  CHECK_EQUAL(textOfField(), @"left");
  CHECK([engine QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_IS:YES
                                                           WITH_HTML:@"as is"
                                                      WITH_FONT_NAME:nil
                                                           WITH_SIZE:nil
                                                       FOR_OBJECT_ID:number(textTag)]);
  CHECK_EQUAL(textOfField(), @"as is");
  CHECK([engine QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML:nil
                                                        WITH_FONT_NAME:@"Helvetica"
                                                             WITH_SIZE:nil
                                                         FOR_OBJECT_ID:number(textTag)]);
  CHECK_EQUAL(textOfField(), @"(null)");
  CHECK([engine QZ_Plist_State_Processor_SET_ATTRIBUTED_STRING_AS_HTML_NO_CENTER:@"a"
                                                                  WITH_FONT_NAME:@"Helvetica"
                                                                       WITH_SIZE:nil
                                                                   FOR_OBJECT_ID:nil]);
  tearDown();
}

static void looksAreSet(void) {
  setUp();
  NSButton* next = controlIn(window, nextTag);
  CHECK([engine QZ_Plist_State_Processor_SET_TITLE:@"Go" forId:number(nextTag)]);
  CHECK_EQUAL([next title], @"Go");
  CHECK(![engine QZ_Plist_State_Processor_SET_TITLE:@"Go" forId:number(textTag)]);
  CHECK(![engine QZ_Plist_State_Processor_SET_TITLE:nil forId:nil]);
  CHECK([engine QZ_Plist_State_Processor_SET_BACKGROUND_COLOR:7 forId:number(nextTag)]);
  CHECK_EQUAL([[next cell] backgroundColor], [NSColor redColor]);
  CHECK(![engine QZ_Plist_State_Processor_SET_BACKGROUND_COLOR:7 forId:nil]);
  CHECK([engine QZ_Plist_State_Processor_SET_FOREGROUND_COLOR:@"blue"
                                                FOR_OBJECT_ID:number(nextTag)]);
  CHECK_EQUAL([[next attributedTitle] attribute:NSForegroundColorAttributeName
                                        atIndex:0
                                 effectiveRange:NULL],
              [NSColor blueColor]);
  CHECK(![engine QZ_Plist_State_Processor_SET_FOREGROUND_COLOR:nil FOR_OBJECT_ID:nil]);
  CHECK([engine QZ_Plist_State_Processor_SET_STATE_ON:number(switchTag)]);
  CHECK([controlIn(window, switchTag) state] == NSOnState);
  CHECK([engine QZ_Plist_State_Processor_SET_STATE_OFF:number(switchTag)]);
  CHECK([controlIn(window, switchTag) state] == NSOffState);
  CHECK(![engine QZ_Plist_State_Processor_SET_STATE_ON:nil]);
  CHECK(![engine QZ_Plist_State_Processor_SET_STATE_OFF:nil]);
  NSArray* tip = [NSArray arrayWithObjects:@"a tip", number(textTag), nil];
  CHECK([engine QZ_Plist_State_Processor_SET_TOOL_TIP:tip forObject:number(nextTag)]);
  CHECK_EQUAL([controlIn(window, textTag) toolTip], @"a tip");
  CHECK(![engine QZ_Plist_State_Processor_SET_TOOL_TIP:nil forObject:nil]);
  NSImage* picture = [[[NSImage alloc] initWithSize:NSMakeSize(9, 9)] autorelease];
  CHECK([picture setName:@"every-selector"]);
  NSArray* image = [NSArray arrayWithObjects:@"every-selector", number(imageTag), nil];
  CHECK([engine QZ_Plist_State_Processor_LOAD_GRAPHIC_OBJECT_WITH_PATH:image forObject:nil]);
  CHECK([controlIn(window, imageTag) image] == picture);
  CHECK(![engine QZ_Plist_State_Processor_LOAD_GRAPHIC_OBJECT_WITH_PATH:nil forObject:nil]);
  tearDown();
}

static void runsAreControlled(void) {
  setUp();
  load([NSDictionary
      dictionaryWithObject:command(@"SET_TEXT_FOR_OBJECT_ID", @"chained", number(textTag))
                    forKey:@"8"]);
  CHECK([engine QZ_Plist_State_Processor_PROCESS_COMMANDS_FOR_ID:number(8)]);
  CHECK_EQUAL(textOfField(), @"chained");
  CHECK(![engine QZ_Plist_State_Processor_PROCESS_COMMANDS_FOR_ID:nil]);
  [engine QZ_Plist_State_Processor_RETURN_TO_IDLE_LOOP];
  CHECK(![engine terminating]);
  [engine QZ_Plist_State_Processor_TERMINATE_PARSER];
  CHECK([engine terminating] && [engine hasTerminated]);
  tearDown();
}

// --- timers and flashing ---

static void tagsAreChanged(void) {
  setUp();
  CHECK([engine QZ_Plist_State_Processor_SET_TAG:number(40) forId:number(nextTag)]);
  CHECK(controlIn(window, 40) != nil);
  CHECK(![engine QZ_Plist_State_Processor_SET_TAG:number(41) forId:number(nextTag)]);
  CHECK(![engine QZ_Plist_State_Processor_SET_TAG:nil forId:nil]);
  CHECK([engine QZ_Plist_State_Processor_SET_TAG:number(41) forId:number(40) withTimerValue:nil]);
  CHECK([[engine objectIdTimers] count] == 0);
  CHECK([engine QZ_Plist_State_Processor_SET_TAG:number(42)
                                           forId:number(41)
                                  withTimerValue:number(1)]);
  CHECK([[[engine objectIdTimers] objectForKey:@"42"] timeInterval] > 1000000);
  tearDown();
}

static void timersAreKept(void) {
  setUp();
  [engine startTimerWithValue:0 forKey:@"8"];
  [engine startTimerWithValue:3 forKey:nil];
  [engine startTimerWithValue:3 forKey:@""];
  CHECK([[engine objectIdTimers] count] == 0);
  [engine startTimerWithValue:3 forKey:@"8"];
  NSMutableDictionary* timers = [engine objectIdTimers];
  NSTimer* timer = [timers objectForKey:@"8"];
  CHECK([timer isKindOfClass:[NSTimer class]] && [timer isValid] && [timer timeInterval] == 3);
  CHECK(timer == [timers objectForKey:@"8"]);
  NSTimeInterval wait = [[timer fireDate] timeIntervalSinceNow];
  CHECK(wait > 1 && wait <= 3);
  CHECK(![engine QZ_Plist_State_Processor_SET_TIMER:2 forId:number(nextTag)]);
  CHECK([[timers objectForKey:@"2"] timeInterval] == 2);
  CHECK(![engine QZ_Plist_State_Processor_SET_TIMER:0 forId:number(nextTag)]);
  CHECK([timers count] == 1);
  CHECK(![engine QZ_Plist_State_Processor_SET_TIMER:1 forId:nil]);
  [engine killAllTimers];
  CHECK(![timer isValid] && [timers count] == 0 && timers == [engine objectIdTimers]);
  tearDown();
}

static void timersFire(void) {
  setUp();
  load([NSDictionary
      dictionaryWithObject:command(@"SET_TEXT_FOR_OBJECT_ID", @"later", number(textTag))
                    forKey:@"8"]);
  [engine startTimerWithValue:1 forKey:@"8"];
  WAIT_UNTIL([textOfField() length] > 0);
  CHECK_EQUAL(textOfField(), @"later");
  CHECK([[engine objectIdTimers] count] == 0);
  [controlIn(window, textTag) setStringValue:@""];
  [engine startTimerWithValue:100 forKey:@"8"];
  [engine pseudoButtonPush:nil];
  CHECK([[engine objectIdTimers] count] == 1);
  [engine pseudoButtonPush:[[engine objectIdTimers] objectForKey:@"8"]];
  CHECK_EQUAL(textOfField(), @"later");
  CHECK([[engine objectIdTimers] count] == 0);
  tearDown();
}

static void buttonsFlash(void) {
  setUp();
  NSButton* next = controlIn(window, nextTag);
  CHECK([engine QZ_Plist_State_Processor_FLASH_ID:number(nextTag) flashOn:YES]);
  CHECK(![engine QZ_Plist_State_Processor_FLASH_ID:number(nextTag) flashOn:NO]);
  CHECK([engine QZ_Plist_State_Processor_FLASH_ID:nil flashOn:YES]);
  CHECK_EQUAL([[engine flashingTagIds] objectForKey:@"2"], [NSNumber numberWithBool:YES]);
  [engine flasherFired:nil];
  CHECK(![[next cell] isHighlighted]);
  CHECK([engine QZ_Plist_State_Processor_ALLOW_FLASHING:YES]);
  CHECK([engine flashing]);
  [engine flasherFired:[engine flashingTimer]];
  CHECK([[next cell] isHighlighted]);
  WAIT_UNTIL(![[next cell] isHighlighted]);  // the next tick
  CHECK(![[next cell] isHighlighted]);
  [next highlight:YES];
  load([NSDictionary dictionaryWithObject:[NSArray array] forKey:@"2"]);
  CHECK([engine QZ_Plist_State_Processor_ALLOW_FLASHING:NO]);
  CHECK(![[next cell] isHighlighted] && ![engine flashing]);
  CHECK(![engine QZ_Plist_State_Processor_HIGHLIGHT_ID:number(nextTag)]);
  CHECK(![engine QZ_Plist_State_Processor_HIGHLIGHT_ID:nil]);
  tearDown();
}

// --- properties ---

static void propertiesGiveBackWhatWasSet(void) {
  setUp();
  NSMutableDictionary* table = [NSMutableDictionary dictionary];
  NSMutableArray* list = [NSMutableArray array];
  NSNumber* large = number(4711);
  NSTimer* timer = [NSTimer timerWithTimeInterval:9
                                           target:engine
                                         selector:@selector(flasherFired:)
                                         userInfo:nil
                                          repeats:NO];
  NSWindow* other = windowWithControls();
  NSTimer* flasher = [[[engine flashingTimer] retain] autorelease];
#define CHECK_PROPERTY(getter, setter, value) \
  [engine setter:value];                      \
  CHECK([engine getter] == value);            \
  [engine setter:nil];                        \
  CHECK([engine getter] == nil)
  CHECK_PROPERTY(window, setWindow, other);
  CHECK_PROPERTY(plistDictionary, setPlistDictionary, table);
  CHECK_PROPERTY(commandArray, setCommandArray, list);
  CHECK_PROPERTY(objectId, setObjectId, large);
  CHECK_PROPERTY(flashingTagIds, setFlashingTagIds, table);
  CHECK_PROPERTY(tutorialWindow, setTutorialWindow, other);
  CHECK_PROPERTY(addedObjectToTutorial, setAddedObjectToTutorial, list);
  CHECK_PROPERTY(guiAssets, setGuiAssets, table);
  CHECK_PROPERTY(lastTagId, setLastTagId, large);
  CHECK_PROPERTY(objectIdTimers, setObjectIdTimers, table);
  CHECK_PROPERTY(originalTagValues, setOriginalTagValues, table);
  CHECK_PROPERTY(flashingTimer, setFlashingTimer, timer);
#undef CHECK_PROPERTY
  [engine setFlashingTimer:flasher];
  CHECK([engine flashingTimer] == flasher);
  [engine setFlashing:YES];
  [engine setRunningAsSheet:YES];
  [engine setTerminating:YES];
  [engine setHasTerminated:YES];
  CHECK([engine flashing] && [engine runningAsSheet]);
  CHECK([engine terminating] && [engine hasTerminated]);
  [engine setRunningAsSheet:NO];
  CHECK_RAISES(NSInvalidArgumentException, @"NSDictionary",
               [engine setPlistDictionary:(NSMutableDictionary*)@"script"]);
  CHECK_RAISES(NSInvalidArgumentException, @"NSDictionary",
               [engine setGuiAssets:(NSMutableDictionary*)@"records"]);
  CHECK_RAISES(NSInvalidArgumentException, @"NSTimer", [engine setFlashingTimer:(NSTimer*)@"t"]);
  tearDown();
}

static void bothSidesSeeChangesOfATable(void) {
  setUp();
  NSMutableDictionary* script = [engine plistDictionary];
  CHECK(script == [engine plistDictionary]);
  [script setObject:command(@"SET_TEXT_FOR_OBJECT_ID", @"mine", number(textTag)) forKey:@"2"];
  [controlIn(window, nextTag) performClick:nil];
  CHECK_EQUAL(textOfField(), @"mine");

  NSMutableDictionary* own = [NSMutableDictionary dictionary];
  [engine setPlistDictionary:own];
  [own setObject:command(@"SET_TEXT_FOR_OBJECT_ID", @"own", number(textTag)) forKey:@"2"];
  [controlIn(window, nextTag) performClick:nil];
  CHECK_EQUAL(textOfField(), @"own");

  NSMutableDictionary* timers = [NSMutableDictionary dictionary];
  [engine setObjectIdTimers:timers];
  [engine startTimerWithValue:50 forKey:@"8"];
  CHECK([[timers objectForKey:@"8"] isValid]);
  [timers removeAllObjects];
  [engine startTimerWithValue:50 forKey:@"9"];
  CHECK([timers count] == 1 && [timers objectForKey:@"9"] != nil);

  NSMutableDictionary* records = [engine guiAssets];
  NSArray* record = [[[records objectForKey:@"2"] retain] autorelease];
  [records removeObjectForKey:@"2"];
  CHECK([records objectForKey:@"2"] == nil && [records count] == 3);
  CHECK([[records allValues] count] == 3 && ![[records allValues] containsObject:record]);
  [records setObject:record forKey:@"77"];
  CHECK_EQUAL([records objectForKey:@"77"], record);
  CHECK_RAISES(NSInvalidArgumentException, @"a list of its class name",
               [records setObject:[NSArray arrayWithObject:@"NSButton"] forKey:@"78"]);
  CHECK_RAISES(NSInvalidArgumentException, @"NSArray", [records setObject:window forKey:@"78"]);

  NSMutableArray* added = [engine addedObjectToTutorial];
  [added addObject:controlIn(window, nextTag)];
  [added insertObject:controlIn(window, textTag) atIndex:0];
  [added replaceObjectAtIndex:1 withObject:controlIn(window, imageTag)];
  CHECK([added count] == 2 && [added objectAtIndex:1] == controlIn(window, imageTag));
  [added removeLastObject];
  CHECK([added lastObject] == controlIn(window, textTag));
  CHECK_RAISES(NSRangeException, @"beyond", [added objectAtIndex:1]);
  [engine terminateParser];
  CHECK([added count] == 0 && [own count] == 0 && [records count] == 0);
  tearDown();
}

int main(void) {
  NSAutoreleasePool* pool = [[NSAutoreleasePool alloc] init];
  [[NSApplication sharedApplication] finishLaunching];
#define RUN(test) runTest(#test, test)
  RUN(aFreshEngineHasTablesAndAFlasher);
  RUN(plainInitMakesNoTables);
  RUN(terminationEmptiesAndDropsTheTables);
  RUN(loadPlistRunsAList);
  RUN(listsAndCommandsRun);
  RUN(pressesRunLists);
  RUN(windowsAreAdopted);
  RUN(windowsAreBuilt);
  RUN(buttonStatesAreCarriedOver);
  RUN(textsAreShown);
  RUN(looksAreSet);
  RUN(runsAreControlled);
  RUN(tagsAreChanged);
  RUN(timersAreKept);
  RUN(timersFire);
  RUN(buttonsFlash);
  RUN(propertiesGiveBackWhatWasSet);
  RUN(bothSidesSeeChangesOfATable);
  [pool release];
  return testResult();
}
