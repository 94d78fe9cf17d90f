// SPDX-License-Identifier: MIT
// Shared by the tests of the readers.
#pragma once

#include <string>
#include <string_view>

#include "qz/property_list/canonical_dump.hpp"
#include "qz/property_list/reader.hpp"
#include "qz/property_list/scalars.hpp"

namespace qz::toolkit {

/// In tables of expected results: the bytes are refused.
constexpr std::string_view refused = "refused";

/// Returns the canonical form of the value that is read, or "refused".
inline std::string dumpOf(std::string_view bytes) {
  const ReadResult result = readPropertyList(bytes);
  return result.value ? canonicalDump(*result.value) : std::string(refused);
}

/// Returns `text` repeated `times` times.
inline std::string repeated(std::string_view text, std::size_t times) {
  std::string result;
  for (std::size_t i = 0; i < times; ++i) result += text;
  return result;
}

/// Returns an XML property list whose root is the element `xml`.
inline std::string plist(std::string_view xml) {
  return "<plist version=\"1.0\">" + std::string(xml) + "</plist>";
}

}  // namespace qz::toolkit
