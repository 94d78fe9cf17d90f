// SPDX-License-Identifier: MIT
// DerivedClass: performs the engine's calls to its own operations as messages to the Objective-C
// object, where its class overrides them.
#pragma once

#import <Foundation/Foundation.h>

#include <memory>
#include <span>
#include <string_view>
#include <unordered_map>

#include "hosts/appkit/platform.hpp"
#include "qz/subclass.hpp"

namespace qz::hosts::appkit {

class DerivedClass final : public Subclass {
 public:
  /// `object` is not retained; `baseClass` is the one whose methods call the engine.
  DerivedClass(id object, Class baseClass, Platform& platform);

  bool overrides(std::string_view operation) override;
  Result perform(std::string_view operation, std::span<const Argument> arguments) override;
  std::shared_ptr<void> object() override;

  /// The base class's method calls the engine's operation of this name next.
  void willCallOwn(SEL operation) { own_ = operation; }
  /// The object is about to end.
  void forgetObject() { object_ = nil; }

 private:
  bool isOverridden(std::string_view operation);

  id object_;  // its owner
  Class baseClass_;
  Platform& platform_;
  bool isBaseClass_;
  SEL own_ = nullptr;
  std::unordered_map<std::string_view, bool> overridden_;
};

}  // namespace qz::hosts::appkit
