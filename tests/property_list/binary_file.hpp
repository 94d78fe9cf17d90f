// SPDX-License-Identifier: MIT
// Binary property lists put together object by object, for tests that need malformed ones.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "toolkit/property_list/binary_layout.hpp"

namespace qz::toolkit {

/// Writes each object unchanged, including its marker. The other fields may hold wrong values.
struct BinaryFile {
  std::vector<std::string> objects;
  std::string header = "bplist00";
  std::size_t offsetSize = 2;
  std::size_t referenceSize = 1;
  std::uint64_t topObject = 0;
  std::uint64_t moreObjects = 0;            // claimed, but missing
  std::vector<std::uint64_t> offsets = {};  // in place of the true ones

  std::string bytes() const {
    std::string bytes = header;
    std::vector<std::uint64_t> table;
    for (const std::string& object : objects) {
      table.push_back(bytes.size());
      bytes += object;
    }
    if (!offsets.empty()) table = offsets;
    const std::size_t tableOffset = bytes.size();
    for (const std::uint64_t offset : table) binary::appendNumber(bytes, offset, offsetSize);
    bytes.append(6, '\x55');  // these bytes have no meaning
    bytes += static_cast<char>(offsetSize);
    bytes += static_cast<char>(referenceSize);
    binary::appendNumber(bytes, table.size() + moreObjects, 8);
    binary::appendNumber(bytes, topObject, 8);
    binary::appendNumber(bytes, tableOffset, 8);
    return bytes;
  }
};

}  // namespace qz::toolkit
