// SPDX-License-Identifier: MIT
// Why a script cannot be said in steps.
#pragma once

#include <cstddef>
#include <optional>
#include <string>

#include "tools/comparison/behavior.hpp"
#include "tools/support/failure.hpp"

namespace qz::tools::lift {

/// Thrown if the language cannot say what a script does. The message says what that is.
class Unsayable : public Failure {
 public:
  Unsayable(comparison::SituationIndex situation, std::optional<std::size_t> control,
            const std::string& message)
      : Failure(ExitStatus::failed, message), situation_(situation), control_(control) {}

  comparison::SituationIndex situation() const { return situation_; }
  const std::optional<std::size_t>& control() const { return control_; }

 private:
  comparison::SituationIndex situation_;
  std::optional<std::size_t> control_;
};

}  // namespace qz::tools::lift
