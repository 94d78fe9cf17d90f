// SPDX-License-Identifier: MIT
// The verifier that SPIN, a model checker, generates for a model with the same places and presses
// as the scripts of bench/switches.hpp.
#pragma once

#include <cstddef>
#include <filesystem>

namespace qz::bench {

/// What one run of a verifier found, and what it cost.
struct Verification {
  std::size_t states = 0;       ///< of the model: the places
  std::size_t transitions = 0;  ///< the presses
  double processor = 0;         ///< seconds
};

/// Builds the verifier in a directory of its own, which the destructor removes.
class SpinVerifier {
 public:
  /// Ends the program if SPIN or gcc fails.
  explicit SpinVerifier(std::size_t buttons);
  ~SpinVerifier();
  SpinVerifier(const SpinVerifier&) = delete;
  SpinVerifier& operator=(const SpinVerifier&) = delete;

  /// Goes through the whole model. Ends the program if the verifier finds an error.
  Verification run() const;

 private:
  std::size_t buttons_;
  std::filesystem::path directory_;
};

}  // namespace qz::bench
