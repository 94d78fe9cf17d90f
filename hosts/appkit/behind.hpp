// SPDX-License-Identifier: MIT
// What is behind an Objective-C engine: the C++ engine, and what the two share.
#pragma once

#import <Foundation/Foundation.h>

#include <memory>
#include <mutex>

#import "hosts/appkit/derived_class.hpp"
#include "hosts/appkit/platform.hpp"
#import "hosts/appkit/table_views.hpp"
#include "qz/engine.hpp"
#import "toolkit/foundation/exceptions.hpp"
#import "toolkit/foundation/kept.hpp"
#import "toolkit/foundation/twin.hpp"

namespace qz::hosts::appkit {

using toolkit::foundation::Twin;

class Behind {
 public:
  /// Makes an engine without tables.
  Behind(id object, Class baseClass);
  ~Behind();
  Behind(const Behind&) = delete;
  Behind& operator=(const Behind&) = delete;

  /// Makes an engine with its tables, instead of the one without.
  void initWithWindow(id window);

  /// Keeps the window of an object while the engine refers to it.
  const toolkit::Ref<toolkit::Window>& keep(toolkit::Ref<toolkit::Window>& place, id window);

  // Every call of an operation is between these two.
  void begin(SEL operation);
  void end();

  Platform& platform;
  std::shared_ptr<DerivedClass> derived;
  std::shared_ptr<Engine> engine;
  toolkit::Ref<toolkit::Window> hostWindow;     // kept alive: the engine only refers to it
  toolkit::Ref<toolkit::Window> adoptedWindow;  // the same
  std::shared_ptr<toolkit::SheetDelegate> sheetDelegate;  // the same

  // The objects of the properties. Getters and setters may run on any thread.
  std::recursive_mutex mutex;
  Twin plistDictionary, commandArray, objectId, flashingTagIds, lastTagId, originalTagValues;
  TableTwin<Engine::Controls> addedObjectToTutorial;
  TableTwin<Engine::GuiAssets> guiAssets;
  TableTwin<Engine::Timers> objectIdTimers;

 private:
  void present();
  template <class Visit>
  void visitTwins(const Visit& visit);

  id object_;  // its owner
  int depth_ = 0;
};

/// Calls `body` with what is behind `object`, as its method `operation`: it sees what the host has
/// changed, and exceptions leave it as those of Foundation. `object` lives until the end.
template <class Body>
auto perform(id object, Behind& behind, SEL operation, const Body& body) {
  const toolkit::foundation::Kept<id> kept(object);
  return toolkit::foundation::answering([&] {
    struct Call {
      Behind& behind;
      Call(Behind& called, SEL name) : behind(called) { behind.begin(name); }
      ~Call() { behind.end(); }
    };
    const Call call(behind, operation);
    return body(*behind.engine);
  });
}

}  // namespace qz::hosts::appkit
