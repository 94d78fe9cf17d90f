// SPDX-License-Identifier: MIT
// What the tables of properties share.
#pragma once

#include <algorithm>
#include <cassert>
#include <iterator>
#include <string_view>
#include <vector>

#include "tools/scenario/vocabulary.hpp"

namespace qz::tools::scenario {

/// Returns the row for the property `name`, which must exist, in a table whose rows have an `info`.
template <class Table>
const auto& rowNamed(const Table& table, std::string_view name) {
  const auto found = std::find_if(std::begin(table), std::end(table),
                                  [&](const auto& row) { return row.info.name == name; });
  assert(found != std::end(table));
  return *found;
}

template <class Table>
std::vector<PropertyInfo> infosOf(const Table& table) {
  std::vector<PropertyInfo> infos;
  for (const auto& row : table) infos.push_back(row.info);
  return infos;
}

}  // namespace qz::tools::scenario
