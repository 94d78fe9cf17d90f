// SPDX-License-Identifier: MIT
// The words of one statement, by the slots of its form.
#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "tools/scenario/lexer.hpp"

namespace qz::tools::scenario {

struct Statement;

class Arguments {
 public:
  /// `slot` is a slot of the form, or one of its literal words. It must outlive the arguments.
  void add(std::string_view slot, Word word) { words_.emplace_back(slot, std::move(word)); }

  bool has(std::string_view slot) const;
  /// Returns the word in a slot. Asking for a slot without a word is a programming error.
  const Word& word(std::string_view slot) const;
  const std::string& text(std::string_view slot) const { return word(slot).text; }
  std::vector<std::string> texts(std::string_view slot) const;

  // Numbers. The parser has checked that the words are numbers.
  double number(std::string_view slot) const;
  std::int64_t whole(std::string_view slot) const;
  std::uint64_t unsignedWhole(std::string_view slot) const;

  /// Returns the statement that this one holds; null if it holds none.
  const std::shared_ptr<const Statement>& nested() const { return nested_; }
  void setNested(std::shared_ptr<const Statement> statement) { nested_ = std::move(statement); }

  /// Returns the same arguments with `change` applied to every text, also within JSON, but not
  /// within the nested statement.
  Arguments changed(const std::function<std::string(std::string)>& change) const;

 private:
  std::vector<std::pair<std::string_view, Word>> words_;
  std::shared_ptr<const Statement> nested_;
};

}  // namespace qz::tools::scenario
