// SPDX-License-Identifier: MIT
// Reads and writes PO, a line at a time.
#include "tools/steps/po.hpp"

#include <optional>
#include <sstream>

#include "tools/support/failure.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::steps {
namespace {

constexpr std::pair<char, char> escapes[] = {
    {'n', '\n'}, {'t', '\t'}, {'r', '\r'}, {'"', '"'}, {'\\', '\\'}};

std::string quotedLine(std::string_view text) {
  std::string line = "\"";
  for (const char c : text) {
    char letter = 0;
    for (const auto& [name, character] : escapes) {
      if (c == character) letter = name;
    }
    line += letter == 0 ? std::string(1, c) : std::string("\\") + letter;
  }
  return line + "\"\n";
}

/// Returns a text as PO writes it: on one line, or each of its lines on a line of its own.
std::string quotedText(std::string_view text) {
  if (text.find('\n') >= text.size() - (text.empty() ? 0 : 1)) return quotedLine(text);
  std::string lines = "\"\"\n";
  while (!text.empty()) {
    const std::size_t end = std::min(text.find('\n'), text.size() - 1) + 1;
    lines += quotedLine(text.substr(0, end));
    text.remove_prefix(end);
  }
  return lines;
}

class PoReader {
 public:
  PoReader(std::string_view text, const std::string& path)
      : stream_{std::string(text)}, path_(path) {}

  std::vector<PoEntry> read() {
    std::string line;
    while (std::getline(stream_, line)) {
      ++number_;
      if (line.ends_with('\r')) line.pop_back();
      readLine(line);
    }
    finish();
    return std::move(entries_);
  }

 private:
  [[noreturn]] void refuse(const std::string& expected, std::string_view found) const {
    throw Failure(ExitStatus::badInput, path_ + ":" + std::to_string(number_) + ": expected " +
                                            expected + ", found " + quoteStart(found));
  }

  void readLine(std::string_view line) {
    if (line.empty()) return finish();
    if (line.starts_with("#~")) return;
    if (line.starts_with("#")) return readComment(line);
    if (line.starts_with("\"")) return append(line);
    if (line.starts_with("msgid ")) return begin(entry_.text, line, 6);
    if (line.starts_with("msgstr ")) return begin(entry_.translation, line, 7);
    if (line.starts_with("msgctxt ")) return begin(context_, line, 8);
    refuse("“msgid”, “msgstr”, a text in quotes or a comment", line);
  }

  void readComment(std::string_view line) {
    if (target_ && target_ != &context_ && !entry_.translation.empty()) finish();
    if (line.starts_with("#,") && line.find("fuzzy") != std::string_view::npos)
      entry_.isFuzzy = true;
  }

  void begin(std::string& target, std::string_view line, std::size_t at) {
    if (&target == &entry_.text && target_ == &entry_.translation) finish();
    target_ = &target;
    hasText_ = hasText_ || &target == &entry_.text;
    append(line.substr(at));
  }

  void append(std::string_view line) {
    if (!target_) refuse("“msgid” before a text", line);
    const bool isQuoted = line.size() >= 2 && line.front() == '"' && line.back() == '"';
    if (!isQuoted) refuse("a text in quotes", line);
    line = line.substr(1, line.size() - 2);
    for (std::size_t i = 0; i < line.size(); ++i) {
      if (line[i] != '\\') {
        *target_ += line[i];
      } else if (const auto character =
                     i + 1 < line.size() ? unescaped(line[i + 1]) : std::nullopt) {
        *target_ += *character;
        ++i;
      } else {
        refuse("\\n, \\t, \\r, \\\" or \\\\", line.substr(i));
      }
    }
  }

  static std::optional<char> unescaped(char letter) {
    for (const auto& [name, character] : escapes) {
      if (letter == name) return character;
    }
    return std::nullopt;
  }

  void finish() {
    if (hasText_ && !entry_.text.empty()) entries_.push_back(std::move(entry_));
    entry_ = {};
    context_.clear();
    target_ = nullptr;
    hasText_ = false;
  }

  std::istringstream stream_;
  const std::string& path_;
  std::size_t number_ = 0;  // of the line
  PoEntry entry_;
  std::string context_;
  std::string* target_ = nullptr;  // what the next text in quotes continues
  bool hasText_ = false;
  std::vector<PoEntry> entries_;
};

}  // namespace

std::vector<PoEntry> readPo(std::string_view text, const std::string& path) {
  return PoReader(text, path).read();
}

std::string writePoTemplate(const std::vector<PoEntry>& entries, const std::string& project) {
  std::string file = "msgid \"\"\nmsgstr \"\"\n";
  for (const std::string& line : {"Project-Id-Version: " + project + "\n",
                                  std::string("PO-Revision-Date: YEAR-MO-DA HO:MI+ZONE\n"),
                                  std::string("Last-Translator: FULL NAME <EMAIL@ADDRESS>\n"),
                                  std::string("Language-Team: LANGUAGE <LL@li.org>\n"),
                                  std::string("Language: \n"), std::string("MIME-Version: 1.0\n"),
                                  std::string("Content-Type: text/plain; charset=UTF-8\n"),
                                  std::string("Content-Transfer-Encoding: 8bit\n")}) {
    file += quotedLine(line);
  }
  for (const PoEntry& entry : entries) {
    file += '\n';
    for (const std::string& comment : entry.comments) file += "#. " + oneLine(comment) + '\n';
    for (const std::string& reference : entry.references) file += "#: " + reference + '\n';
    file += "msgid " + quotedText(entry.text) + "msgstr " + quotedText(entry.translation);
  }
  return file;
}

}  // namespace qz::tools::steps
