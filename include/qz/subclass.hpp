// SPDX-License-Identifier: MIT
// Subclass: lets a class of another language derive from the engine. The engine then performs its
// own operations as that class overrides them.
#pragma once

#include <cstdint>
#include <memory>
#include <span>
#include <string_view>
#include <variant>

#include "qz/api.hpp"
#include "qz/property_list/value.hpp"
#include "qz/toolkit/run_loop.hpp"
#include "qz/toolkit/tag.hpp"
#include "qz/toolkit/view.hpp"
#include "qz/toolkit/window.hpp"

namespace qz {

/// Operations are named by their selectors, such as "processCommandArray:ForObject:". Only those
/// that the engine itself calls can be overridden. All functions run on the engine's thread.
class QZ_API Subclass {
 public:
  /// Text is a value. Absent values, controls, windows and timers are absent arguments.
  using Argument = std::variant<bool, std::uint64_t, toolkit::Tag, toolkit::ValueRef<>,
                                toolkit::Ref<toolkit::View>, toolkit::Ref<toolkit::Window>,
                                toolkit::Ref<toolkit::Timer>>;

  /// What an operation returns: YES or NO, a control, or nothing.
  struct Result {
    bool yes = false;                     ///< of an operation that answers YES or NO
    toolkit::Ref<toolkit::View> control;  ///< of one that finds a control; or absent
  };

  virtual ~Subclass() = default;

  /// Whether `perform` performs the operation. Asked at each call; an override that calls the
  /// engine's own operation answers NO to that one call.
  virtual bool overrides(std::string_view operation) = 0;

  /// Performs an overridden operation.
  virtual Result perform(std::string_view operation, std::span<const Argument> arguments) = 0;

  /// Returns a reference that keeps the object of the subclass alive. Valid timers of the engine
  /// hold one.
  virtual std::shared_ptr<void> object() = 0;
};

}  // namespace qz
