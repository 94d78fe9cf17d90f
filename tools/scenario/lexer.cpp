// SPDX-License-Identifier: MIT
// Splits the text of a scenario file into the words of its statements.

#include "tools/scenario/lexer.hpp"

#include <algorithm>
#include <optional>
#include <set>
#include <utility>

#include "text/ascii.hpp"
#include "text/hexadecimal.hpp"
#include "text/utf8.hpp"

namespace qz::tools::scenario {
namespace {

using text::isDigit;

bool isBlank(char c) { return c == ' ' || c == '\t' || c == '\r'; }
bool continuesCharacter(char c) { return (static_cast<unsigned char>(c) & 0xC0U) == 0x80U; }

/// Returns the message of a JSON error without the library's prefix and position.
std::string plainMessage(const std::string& message) {
  const auto start = message.find("parse error") == std::string::npos
                         ? message.find("] ") + 2
                         : message.find(": ", message.find("parse error")) + 2;
  return message.substr(start);
}

/// Finds the first key that occurs twice in one object of the JSON that is being parsed.
class RepeatedKeys {
 public:
  void see(Json::parse_event_t event, const Json& parsed) {
    if (event == Json::parse_event_t::object_start) open_.emplace_back();
    if (event == Json::parse_event_t::object_end) open_.pop_back();
    if (event != Json::parse_event_t::key || first_) return;
    if (!open_.back().insert(parsed.get<std::string>()).second) first_ = parsed.get<std::string>();
  }
  const std::optional<std::string>& first() const { return first_; }

 private:
  std::vector<std::set<std::string>> open_;
  std::optional<std::string> first_;
};

class Lexer {
 public:
  explicit Lexer(std::string_view text) : text_(text) {}

  std::vector<Line> lines() {
    std::vector<Line> lines;
    while (!atEnd()) {
      if (auto line = this->line(); !line.words.empty()) lines.push_back(std::move(line));
    }
    return lines;
  }

 private:
  bool atEnd() const { return offset_ == text_.size(); }
  char peek(std::size_t ahead = 0) const {
    return offset_ + ahead < text_.size() ? text_[offset_ + ahead] : '\n';
  }
  bool atWordEnd(std::size_t ahead = 0) const {
    return isBlank(peek(ahead)) || peek(ahead) == '\n';
  }

  char take() {
    const char c = text_[offset_++];
    if (c == '\n') {
      at_ = {at_.line + 1, 1};
    } else if (!continuesCharacter(peek())) {
      ++at_.column;
    }
    return c;
  }

  Line line() {
    Line line;
    skipBlanks();
    const auto start = offset_;
    while (!atEnd() && peek() != '\n') {
      if (atComment()) {
        skipComment();
      } else {
        line.words.push_back(word());
        line.end = at_;
      }
      skipBlanks();
    }
    line.source = shortSource(text_.substr(start, offset_ - start));
    if (!atEnd()) take();
    return line;
  }

  static std::string shortSource(std::string_view source) {
    const auto end = source.find('\n');
    std::string first(source.substr(0, end));
    while (!first.empty() && isBlank(first.back())) first.pop_back();
    return end == std::string_view::npos ? first : first + " …";
  }

  void skipBlanks() {
    while (!atEnd() && isBlank(peek())) take();
  }

  void skipComment() {
    while (!atEnd() && peek() != '\n') take();
  }

  bool atComment() const {
    if (peek() != '#') return false;
    std::size_t ahead = peek(1) == '-' ? 2 : 1;
    if (!text::isDigit(peek(ahead))) return true;
    while (text::isDigit(peek(ahead))) ++ahead;
    return !atWordEnd(ahead) && peek(ahead) != '.';
  }

  Word word() {
    if (peek() == '"') return quotedWord();
    if (peek() == '[' || peek() == '{') return json();
    Word word{Word::Kind::bare, {}, {}, at_};
    while (!atWordEnd()) {
      if (peek() == '"') {
        throw SyntaxError(at_, "a quotation mark inside a word; put a space before it");
      }
      word.text += take();
    }
    return word;
  }

  Word quotedWord() {
    Word word{Word::Kind::quoted, {}, {}, at_};
    std::string raw(1, take());
    while (peek() != '"') {
      if (peek() == '\n' || peek() == '\r') {
        throw SyntaxError(word.at, "this quotation mark is not closed on its line");
      }
      raw += peek() == '\\' ? escape() : plainCharacter();
    }
    raw += take();
    requireWordEnd("the closing quotation mark");
    // Only a \u escape for half a surrogate pair can still be wrong.
    const auto decoded = Json::parse(raw, nullptr, false);
    if (decoded.is_discarded()) throw SyntaxError(word.at, "an unpaired surrogate in a \\u escape");
    word.text = decoded.get<std::string>();
    return word;
  }

  /// Takes a byte and returns it as JSON, which allows no tab within quotation marks.
  std::string plainCharacter() {
    const char c = take();
    return c == '\t' ? "\\t" : std::string(1, c);
  }

  /// Takes an escape and returns it as JSON. JSON lacks `\*`, which patterns of log lines need.
  std::string escape() {
    const auto at = at_;
    std::string escape(1, take());
    if (peek() == '*') return escape + '\\' + take();
    if (std::string_view("\"\\/bfnrtu").find(peek()) == std::string_view::npos) {
      throw SyntaxError(
          at, "unknown escape; expected \\\" \\\\ \\/ \\b \\f \\n \\r \\t \\uXXXX or \\*");
    }
    escape += take();
    for (int digits = 0; escape[1] == 'u' && digits < 4; ++digits) {
      if (!text::isHexadecimalDigit(peek())) {
        throw SyntaxError(at, "expected four hexadecimal digits after \\u");
      }
      escape += take();
    }
    return escape;
  }

  void requireWordEnd(std::string_view what) const {
    if (!atWordEnd()) throw SyntaxError(at_, "expected a blank after " + std::string(what));
  }

  Word json() {
    Word word{Word::Kind::json, {}, {}, at_};
    const auto start = offset_;
    word.text = bracketedText();
    requireWordEnd("the closing bracket");
    RepeatedKeys keys;
    try {
      word.value = Json::parse(word.text, [&](int, Json::parse_event_t event, const Json& parsed) {
        keys.see(event, parsed);
        return true;
      });
    } catch (const Json::parse_error& error) {
      throw SyntaxError(positionAt(word.at, start, error.byte), plainMessage(error.what()));
    } catch (const Json::exception& error) {
      throw SyntaxError(word.at, plainMessage(error.what()));
    }
    if (keys.first()) {
      throw SyntaxError(word.at,
                        "the key " + inQuotes(*keys.first()) + " occurs twice in one object");
    }
    return word;
  }

  /// Takes the text from the bracket here to the one that closes it. Blanks replace comments, so
  /// that offsets in the text are offsets in the file.
  std::string bracketedText() {
    const auto start = at_;
    std::string text;
    int depth = 0;
    do {
      if (atEnd()) throw SyntaxError(start, "this bracket is never closed");
      if (peek() == '"') {
        takeJsonString(text);
        continue;
      }
      if (peek() == '#') {
        const auto from = offset_;
        skipComment();
        text.append(offset_ - from, ' ');
        continue;
      }
      if (peek() == '[' || peek() == '{') ++depth;
      if (peek() == ']' || peek() == '}') --depth;
      if (depth > deepestNesting) {
        throw SyntaxError(at_, "JSON nested more than " + std::to_string(deepestNesting) + " deep");
      }
      text += take();
    } while (depth > 0);
    return text;
  }

  void takeJsonString(std::string& text) {
    const auto start = at_;
    text += take();
    while (peek() != '"') {
      if (peek() == '\n') throw SyntaxError(start, "this quotation mark is not closed on its line");
      if (peek() == '\\' && peek(1) != '\n') text += take();
      text += take();
    }
    text += take();
  }

  /// Returns the place of byte `count` (from 1) of the text at `offset`, which begins at `from`.
  Position positionAt(Position from, std::size_t offset, std::size_t count) const {
    Lexer walker(*this);
    walker.at_ = from;
    walker.offset_ = offset;
    while (count-- > 1 && !walker.atEnd()) walker.take();
    return walker.at_;
  }

  std::string_view text_;
  std::size_t offset_ = 0;
  Position at_;
};

void requireText(std::string_view text) {
  Position at;
  while (!text.empty()) {
    const auto length = text::utf8Length(text, 0);
    if (length == 0) throw SyntaxError(at, "a byte that is not valid UTF-8");
    const auto c = static_cast<unsigned char>(text[0]);
    const bool endsLine = c == '\n' || text.starts_with("\r\n");
    if (c < 0x20 && c != '\t' && !endsLine) throw SyntaxError(at, "a control character");
    at = c == '\n' ? Position{at.line + 1, 1} : Position{at.line, at.column + 1};
    text.remove_prefix(length);
  }
}

}  // namespace

std::vector<Line> readWords(std::string_view text) {
  if (text.substr(0, 3) == "\xEF\xBB\xBF") text.remove_prefix(3);  // a byte order mark
  requireText(text);
  return Lexer(text).lines();
}

}  // namespace qz::tools::scenario
