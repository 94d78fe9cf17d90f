// SPDX-License-Identifier: MIT
// What the tests of the readers have in common.
#pragma once

#include <string>
#include <string_view>

#include "toolkit/property_list/canonical_dump.hpp"
#include "toolkit/property_list/reader.hpp"
#include "toolkit/property_list/scalars.hpp"

namespace toolkit {

/// In the tables of what is read: the bytes are to be refused.
constexpr std::string_view refused = "refused";

/// What bytes are read as, in canonical form; or "refused".
inline std::string dumpOf(std::string_view bytes) {
  const ReadResult result = readPropertyList(bytes);
  return result.value ? canonicalDump(*result.value) : std::string(refused);
}

/// `text` so often after itself.
inline std::string repeated(std::string_view text, std::size_t times) {
  std::string result;
  for (std::size_t i = 0; i < times; ++i) result += text;
  return result;
}

/// An XML property list whose root is the element in `xml`.
inline std::string plist(std::string_view xml) {
  return "<plist version=\"1.0\">" + std::string(xml) + "</plist>";
}

}  // namespace toolkit
