// SPDX-License-Identifier: MIT
// The texts of a source, for translators.
#pragma once

#include <functional>
#include <map>
#include <optional>
#include <string>
#include <vector>

#include "tools/steps/place.hpp"

namespace qz::tools::steps {

/// A text in another language.
struct Translation {
  std::optional<std::string> text{};  ///< absent: there is none of the text as it is now
  bool isOld = false;                 ///< there is one of the text as it was before
};

using Translate = std::function<Translation(const std::string& text)>;

/// Where a text is used.
struct TextUse {
  Place place = 0;
  std::string step{};     ///< "every step" for what all have in common
  std::string control{};  ///< by its name
  std::string property{};
  friend bool operator==(const TextUse&, const TextUse&) = default;
};

/// A text, once, however often it is used.
struct Text {
  std::string text{};  ///< as it is written in the source
  std::vector<TextUse> uses{};
  std::optional<Translation> translation{};  ///< absent if no language was asked for
};

/// Collects the texts of a source while it is read, and puts translations in their place.
class Texts {
 public:
  /// Without `translate` the texts stay as they are.
  explicit Texts(Translate translate = {}) : translate_(std::move(translate)) {}

  /// Says of which step the next texts are.
  void enterStep(const std::string& name) { step_ = name; }
  /// Notes a text, and returns its translation. Empty texts are not noted.
  std::string translated(const std::string& text, TextUse use);

  /// Returns all texts in the order in which they were noted first.
  const std::vector<Text>& list() const { return list_; }

 private:
  Translate translate_;
  std::string step_;
  std::vector<Text> list_;
  std::map<std::string, std::size_t> numbers_;
};

/// Returns the text with letters after it, so that it is half as long again: shows which texts have
/// no room to grow before anybody has translated them.
std::string lengthened(const std::string& text);

}  // namespace qz::tools::steps
