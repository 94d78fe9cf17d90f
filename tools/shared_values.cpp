// SPDX-License-Identifier: MIT
#include "tools/shared_values.hpp"

#include <algorithm>
#include <cstdint>
#include <filesystem>
#include <string>
#include <system_error>

#include "toolkit/property_list/walk.hpp"

namespace qz::tools {
namespace {

// How many values any memory holds, and how many per byte files with reasonable sharing reach.
constexpr std::uintmax_t alwaysFine = 10'000'000;
constexpr std::uintmax_t valuesPerByte = 100;

}  // namespace

void requireWritableInFull(const InputFile& file) {
  std::error_code error;
  const std::uintmax_t bytes = std::filesystem::file_size(file.path(), error);
  const std::uintmax_t most = error ? alwaysFine : std::max(alwaysFine, valuesPerByte * bytes);
  if (toolkit::visitsInWalk(*file.root()) <= most) return;
  throw Failure(ExitStatus::failed,
                file.path() + ": too large to write out: shared collections expand to more than " +
                    std::to_string(most) + " values");
}

}  // namespace qz::tools
