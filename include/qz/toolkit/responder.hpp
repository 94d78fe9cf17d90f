// SPDX-License-Identifier: MIT
// Responders: objects to which a control sends its action.
#pragma once

#include <memory>
#include <string_view>

#include "qz/api.hpp"
#include "qz/toolkit/ref.hpp"

namespace qz::toolkit {

class View;

/// The target of a control, or a link of the responder chain. The action of a control without a
/// target travels along this chain: the control, its superviews, their window, the window's
/// delegate.
class QZ_API Responder {
 public:
  virtual ~Responder() = default;

  /// Performs `action` (a selector's text such as "buttonPushed:") on behalf of `sender`. NO if
  /// this responder does not understand the action; the next one in the chain is then asked.
  virtual bool tryToPerform(std::string_view action, const Ref<View>& sender);
};

}  // namespace qz::toolkit
