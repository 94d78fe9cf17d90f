// SPDX-License-Identifier: MIT
// Lists the values of an enumeration, for tests that each value has its row in a table.
#pragma once

#include <cstddef>
#include <string_view>
#include <type_traits>
#include <utility>
#include <vector>

namespace qz {

/// Whether `value` has a name in its enumeration. GCC and Clang write "value = E::name" into this
/// text if it has a name, and "value = (E)7" if it does not.
template <auto value>
constexpr bool isEnumerator() {
  const std::string_view function = __PRETTY_FUNCTION__;
  const std::string_view key = "value = ";
  const char first = function[function.find(key) + key.size()];
  return first != '(' && first != '-' && (first < '0' || first > '9');
}

/// Returns the enumerators of `E` from 0 to 63, in order.
template <class E>
std::vector<E> enumerators() {
  std::vector<E> found;
  const auto add = [&]<std::size_t... at>(std::index_sequence<at...>) {
    ((isEnumerator<static_cast<E>(at)>() ? found.push_back(static_cast<E>(at)) : void()), ...);
  };
  add(std::make_index_sequence<64>());
  return found;
}

}  // namespace qz
