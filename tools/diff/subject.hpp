// SPDX-License-Identifier: MIT
// What is compared: scripts, sources, host windows and descriptions of windows.
#pragma once

#include <string>

#include "tools/check/check.hpp"

namespace qz::tools::diff {

/// A file to compare.
struct NamedFile {
  std::string path{};      ///< by which people know it, and beside which its images are
  std::string readFrom{};  ///< the file that has its contents; often the same
};

/// One of the two walk-throughs, read from its files.
struct Subject {
  InputFile file;
  /// With the window, the start keys and the names of its source. If `standIn`, the window of both
  /// is made from both scripts.
  check::CheckOptions options{};
  bool isWindow = false;  ///< the file is a window, in which a script plays that does nothing
};

/// Reads a file, and the window that the options name. Throws a Failure if a file does not hold
/// what it should.
Subject openSubject(const NamedFile& file, const check::CheckOptions& options);

}  // namespace qz::tools::diff
