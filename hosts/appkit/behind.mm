// SPDX-License-Identifier: MIT
// A host may change its own collections between two calls, and the engine during one. So changes
// are copied when the outermost call begins and ends.

#import "hosts/appkit/behind.hpp"

#import "hosts/appkit/command_names.hpp"

namespace qz::hosts::appkit {

Behind::Behind(id object, Class baseClass)
    : platform(Platform::shared()),
      derived(std::make_shared<DerivedClass>(object, baseClass, platform)),
      object_(object) {
  engine = Engine::init(platform.toolkit(), derived);
  present();
}

// Buttons and windows may outlive the engine; AppKit would send to an object that has ended.
Behind::~Behind() {
  derived->forgetObject();
  platform.withdraw(engine, object_, engine->tutorialWindow());
}

void Behind::initWithWindow(id window) {
  platform.withdraw(engine, object_, {});
  engine = Engine::initWithWindow(platform.toolkit(), keep(hostWindow, window), derived);
  present();
}

void Behind::present() { platform.present(engine, object_); }

const toolkit::Ref<toolkit::Window>& Behind::keep(toolkit::Ref<toolkit::Window>& place, id window) {
  place = platform.window(window);
  return place;
}

template <class Visit>
void Behind::visitTwins(const Visit& visit) {
  const std::lock_guard<std::recursive_mutex> lock(mutex);
  for (Twin* twin : {&plistDictionary, &commandArray, &objectId, &flashingTagIds, &lastTagId,
                     &originalTagValues}) {
    visit(*twin);
  }
  visit(addedObjectToTutorial);
  visit(guiAssets);
  visit(objectIdTimers);
}

void Behind::begin(SEL operation) {
  readCommandNames();
  if (depth_++ == 0) visitTwins([](auto& twin) { twin.pull(); });
  derived->willCallOwn(operation);
}

void Behind::end() {
  if (--depth_ == 0) visitTwins([](auto& twin) { twin.push(); });
}

}  // namespace qz::hosts::appkit
