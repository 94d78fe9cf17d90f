// SPDX-License-Identifier: MIT
// How statements refer to things: by the names that a scenario declares, by the tag or the index of
// a control, and by the names of properties.
#pragma once

#include <cstddef>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "qz/toolkit/tag.hpp"
#include "tools/scenario/lexer.hpp"

namespace qz::tools::scenario {

/// Returns the tag in "#TAG"; absent if `text` is something else.
std::optional<toolkit::Tag> tagIn(std::string_view text);
/// Returns the index in "@INDEX"; absent if `text` is something else.
std::optional<std::size_t> indexIn(std::string_view text);

/// "SUBJECT", "SUBJECT.PROPERTY" or "SUBJECT.PROPERTY.KEY"; a key may contain further dots.
struct Path {
  std::string subject;
  std::optional<std::string> property;
  std::optional<std::string> key;
};
Path splitPath(std::string_view text);

/// What a name can refer to.
enum class NameKind { window, control, kept };
std::string_view describe(NameKind kind);

/// The names declared so far. Windows, controls and kept values share one set of names.
class Names {
 public:
  /// Says why `word` cannot be declared; absent if it can.
  std::optional<std::string> whyNotNew(const Word& word) const;
  void declare(const Word& word, NameKind kind);

  /// Returns what `name` refers to, also if it needs no declaration: `tutorial`, #TAG, @INDEX.
  std::optional<NameKind> kindOf(std::string_view name) const;
  std::vector<std::string_view> all() const;

 private:
  struct Declared {
    NameKind kind;
    int line;
  };
  std::map<std::string, Declared, std::less<>> names_;
};

}  // namespace qz::tools::scenario
