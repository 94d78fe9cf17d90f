// SPDX-License-Identifier: MIT
// Finds the form that a statement is written in.

#include "tools/scenario/form_matcher.hpp"

#include <algorithm>
#include <cctype>
#include <optional>

#include "tools/scenario/slots.hpp"
#include "tools/support/suggestions.hpp"

namespace qz::tools::scenario {
namespace {

std::vector<std::string_view> split(std::string_view text, char separator) {
  std::vector<std::string_view> parts;
  for (std::size_t start = 0; start <= text.size();) {
    const auto end = std::min(text.find(separator, start), text.size());
    parts.push_back(text.substr(start, end - start));
    start = end + 1;
  }
  return parts;
}

// A slot has a capital in its name; a literal word has none.
bool isSlot(std::string_view part) {
  return std::any_of(part.begin(), part.end(),
                     [](char c) { return std::isupper(static_cast<unsigned char>(c)) != 0; });
}

/// Why words do not fit a form.
struct Mismatch {
  std::size_t word = 0;               ///< the first that does not fit
  std::optional<SyntaxError> reason;  ///< a more precise reason, if there is one
  std::vector<std::string> expected;  ///< what was expected, if there is no reason
};

/// One attempt at one form.
class Attempt {
 public:
  Attempt(std::span<const Word> words, SlotContext context) : words_(words), context_(context) {}

  /// Returns the match, its `form` not yet set; absent if the words do not fit the form.
  std::optional<Match> match(const Form& form) {
    const auto parts = split(form.syntax, ' ');
    bool skipping = false;
    for (std::size_t i = 1; i < parts.size(); ++i) {
      auto part = parts[i];
      if (part.starts_with('[')) {
        part.remove_prefix(1);
        skipping = !optionalBegins(part);
      }
      const bool groupEnds = part.ends_with(']');
      if (groupEnds) part.remove_suffix(1);
      if (part == "STATEMENT...") return nestedStatement();
      if (!skipping && !takePart(part)) return std::nullopt;
      if (groupEnds) skipping = false;
    }
    if (next_ == words_.size()) return finished();
    mismatch_ = {next_, {}, {"the end of the line"}};
    return std::nullopt;
  }

  const Mismatch& mismatch() const { return mismatch_; }

 private:
  Match finished() { return {0, std::move(arguments_), std::move(declared_), next_}; }

  std::optional<Match> nestedStatement() {
    if (next_ < words_.size()) return finished();
    mismatch_ = {next_, {}, {"a statement"}};
    return std::nullopt;
  }

  // An optional part that begins with a literal word is present if that word is; one that begins
  // with a slot, if any word is left.
  bool optionalBegins(std::string_view part) const {
    if (next_ == words_.size()) return false;
    return isSlot(part) || words_[next_].isBare(part);
  }

  bool takePart(std::string_view part) {
    const bool repeated = part.ends_with("...");
    if (repeated) part.remove_suffix(3);
    do {
      if (!takeWord(part)) return false;
    } while (repeated && next_ < words_.size());
    return true;
  }

  bool takeWord(std::string_view part) {
    const auto alternatives = split(part, '|');
    mismatch_ = {next_, {}, {}};
    for (const auto alternative : alternatives) {
      mismatch_.expected.emplace_back(isSlot(alternative) ? slotNamed(alternative).expected
                                                          : alternative);
    }
    if (next_ == words_.size()) return false;
    // Literal words come first: a slot may take any word.
    return takeAlternative(alternatives, false) || takeAlternative(alternatives, true);
  }

  bool takeAlternative(const std::vector<std::string_view>& alternatives, bool wantsSlot) {
    const auto& word = words_[next_];
    for (const auto alternative : alternatives) {
      if (isSlot(alternative) != wantsSlot) continue;
      if (wantsSlot ? !fits(slotNamed(alternative), word) : !word.isBare(alternative)) continue;
      arguments_.add(alternative, word);
      if (const auto kind = declaredBy(alternative)) declared_.emplace_back(word, *kind);
      ++next_;
      return true;
    }
    return false;
  }

  bool fits(const Slot& slot, const Word& word) {
    try {
      return slot.fits(word, context_);
    } catch (const SyntaxError& error) {
      mismatch_.reason = error;
      return false;
    }
  }

  std::span<const Word> words_;
  SlotContext context_;
  std::size_t next_ = 1;
  Arguments arguments_;
  std::vector<std::pair<Word, NameKind>> declared_;
  Mismatch mismatch_;
};

/// Returns the literal words in `expected`; the description of a slot has several words.
std::vector<std::string_view> ownWords(const std::vector<std::string>& expected) {
  std::vector<std::string_view> words;
  for (const auto& one : expected) {
    if (!isSlot(one) && one.find(' ') == std::string::npos) words.push_back(one);
  }
  return words;
}

/// Throws the SyntaxError about the mismatches that came furthest.
[[noreturn]] void refuse(std::span<const Word> words, Position end,
                         const std::vector<Mismatch>& mismatches, std::string_view onlySyntax) {
  const auto furthest =
      std::max_element(mismatches.begin(), mismatches.end(), [](const auto& a, const auto& b) {
        return a.word < b.word;
      })->word;
  std::vector<std::string> expected;
  for (const auto& mismatch : mismatches) {
    if (mismatch.word != furthest) continue;
    if (mismatch.reason) throw SyntaxError(*mismatch.reason);
    for (const auto& one : mismatch.expected) {
      if (std::find(expected.begin(), expected.end(), one) == expected.end()) {
        expected.push_back(one);
      }
    }
  }
  const bool atEnd = furthest == words.size();
  std::string message = "found " + (atEnd ? "the end of the line" : describe(words[furthest])) +
                        ", expected " + enumerate(expected);
  if (!atEnd && words[furthest].kind == Word::Kind::bare) {
    message += didYouMean(words[furthest].text, ownWords(expected));
  }
  if (!onlySyntax.empty()) message += " (" + std::string(onlySyntax) + ")";
  throw SyntaxError(atEnd ? end : words[furthest].at, message);
}

[[noreturn]] void refuseKeyword(const Word& word, const Vocabulary& vocabulary) {
  if (word.kind != Word::Kind::bare) {
    throw SyntaxError(word.at, "expected a statement, which begins with a bare word");
  }
  std::vector<std::string_view> keywords;
  for (const auto& form : vocabulary.forms) keywords.push_back(keywordOf(form));
  throw SyntaxError(word.at,
                    "unknown statement " + describe(word) + didYouMean(word.text, keywords));
}

}  // namespace

std::string_view keywordOf(const Form& form) {
  return form.syntax.substr(0, form.syntax.find(' '));
}

Match matchForm(std::span<const Word> words, Position end, const Vocabulary& vocabulary,
                const Names& names) {
  std::vector<Mismatch> mismatches;
  std::string_view syntax;
  for (std::size_t i = 0; i < vocabulary.forms.size(); ++i) {
    const auto& form = vocabulary.forms[i];
    if (!words.front().isBare(keywordOf(form))) continue;
    Attempt attempt(words, {vocabulary, names});
    if (auto match = attempt.match(form)) {
      match->form = i;
      return *match;
    }
    mismatches.push_back(attempt.mismatch());
    syntax = mismatches.size() == 1 ? form.syntax : std::string_view();
  }
  if (mismatches.empty()) refuseKeyword(words.front(), vocabulary);
  refuse(words, end, mismatches, syntax);
}

}  // namespace qz::tools::scenario
