// SPDX-License-Identifier: MIT
// A picture of a walk-through as text for a terminal.
#include "tools/play/picture_render.hpp"

#include <algorithm>
#include <vector>

#include "tools/play/words.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::play {
namespace {

constexpr std::size_t widestContent = 44;     // longer text continues below
constexpr std::size_t narrowestContent = 16;  // however narrow the terminal
constexpr std::size_t narrowestRemarks = 20;  // the same
constexpr std::size_t hang = 2;               // indent of the later lines of a paragraph
constexpr std::string_view margin = "  ";
constexpr std::string_view gap = "  ";

// How a colour terminal sets parts of a picture apart.
constexpr std::string_view bold = "1";
constexpr std::string_view faint = "2";
constexpr std::string_view yellow = "33";

std::string joined(const std::vector<std::string>& words) {
  std::string text;
  for (const std::string& word : words) text += (text.empty() ? "" : ", ") + word;
  return text;
}

std::string painted(const std::string& text, std::string_view paint, const Style& style) {
  const bool blank = text.find_first_not_of(' ') == std::string::npos;
  if (!style.color || paint.empty() || blank) return text;
  return "\x1b[" + std::string(paint) + "m" + text + "\x1b[0m";
}

/// One line of the table of controls, its cells not yet wrapped.
struct Row {
  char mark = ' ';
  std::string tag;
  std::string kind;
  std::string content;
  std::string remarks;
  bool hidden = false;
};

Row rowOf(const ControlPicture& control, char mark) {
  std::string content = contentOf(control);
  // The line end that closes a paragraph would only leave an empty line in the table.
  content.erase(content.find_last_not_of('\n') + 1);
  const std::string name =
      control.name.empty() ? std::to_string(control.view.tag) : printable(control.name);
  return {mark,
          name,
          std::string(rowOf(control.view.kind).word),
          content,
          joined(remarksOn(control)),
          control.view.hidden};
}

char markOf(const ControlChanges& changes) {
  if (changes.isNew) return '+';
  return changes.changes.empty() ? ' ' : '*';
}

class Renderer {
 public:
  Renderer(const StepPicture& picture, const PictureChanges& changes, const Style& style)
      : picture_(picture), changes_(changes), style_(style) {}

  std::string render() {
    addWindow();
    addControls();
    addEngine();
    if (changes_.none()) addParagraph("Nothing changed.", faint);
    return std::move(text_);
  }

 private:
  void addWindow() {
    std::string words = "No walk-through window.";
    if (picture_.window) {
      const std::string name = picture_.title.empty() ? "" : " " + quote(picture_.title);
      words = "Window" + name + ": " + joined(remarksOn(*picture_.window));
    }
    addParagraph(words, "");
    addChanges(changes_.window, margin.size());
    text_ += '\n';
  }

  void addControls() {
    if (picture_.controls.empty() && changes_.gone.empty()) return;
    std::vector<Row> rows;
    for (std::size_t i = 0; i < picture_.controls.size(); ++i) {
      rows.push_back(rowOf(picture_.controls[i], markOf(changes_.controls[i])));
    }
    for (const ControlPicture& control : changes_.gone) rows.push_back(rowOf(control, '-'));
    measure(rows);

    addRow({' ', picture_.step.empty() ? "tag" : "name", "kind", "shows", "details", false}, faint);
    for (std::size_t i = 0; i < rows.size(); ++i) {
      addRow(rows[i], rows[i].hidden ? faint : "");
      if (i >= picture_.controls.size()) continue;
      addRuns(captionOf(picture_.controls[i]));
      addChanges(changes_.controls[i].changes, kindColumn());
    }
    text_ += '\n';
  }

  void addEngine() {
    std::string words = place();
    if (picture_.flashingAllowed) words += "; flashing is allowed";
    for (const TimerPicture& timer : picture_.timers) {
      words += timer.step.empty() ? "; list " + timer.key + " runs "
                                  : "; the step " + quote(timer.step) + " comes ";
      words += whenWords(timer.timeLeft);
    }
    if (picture_.ended) words += "; the walk-through has ended";
    addParagraph(words + ".", "");
    addChanges(changes_.engine, margin.size());
  }

  std::string place() const {
    if (!picture_.step.empty()) return "Step " + quote(picture_.step);
    if (picture_.lastList) return "List " + *picture_.lastList + " was started last";
    return "No list was started";
  }

  /// Computes how wide the columns must be.
  void measure(const std::vector<Row>& rows) {
    for (const Row& row : rows) {
      tagWidth_ = std::max(tagWidth_, displayWidth(row.tag));
      kindWidth_ = std::max(kindWidth_, displayWidth(row.kind));
    }
    measureContents(rows);
  }

  /// Computes how wide the contents are, in the room that the columns before them leave.
  void measureContents(const std::vector<Row>& rows) {
    const std::size_t room = widthFrom(contentColumn()) - gap.size();
    const std::size_t widest =
        std::clamp(room - std::min(room, narrowestRemarks), narrowestContent, widestContent);
    for (const Row& row : rows) {
      for (const std::string& line : wrap(row.content, widest)) {
        contentWidth_ = std::max(contentWidth_, displayWidth(line));
      }
    }
  }

  std::size_t kindColumn() const { return margin.size() + 2 + tagWidth_ + gap.size(); }
  std::size_t contentColumn() const { return kindColumn() + kindWidth_ + gap.size(); }
  std::size_t remarksColumn() const { return contentColumn() + contentWidth_ + gap.size(); }
  std::size_t widthFrom(std::size_t column) const {
    return std::max(narrowestRemarks, style_.width > column ? style_.width - column : 0);
  }

  void addRow(const Row& row, std::string_view paint) {
    const auto contents = wrap(row.content, contentWidth_);
    const auto remarks = wrap(row.remarks, widthFrom(remarksColumn()));
    for (std::size_t i = 0; i < std::max(contents.size(), remarks.size()); ++i) {
      const bool first = i == 0;
      std::string line = padLeft(first ? row.tag : "", tagWidth_);
      line.append(gap).append(padRight(first ? row.kind : "", kindWidth_)).append(gap);
      line.append(padRight(i < contents.size() ? contents[i] : "", contentWidth_)).append(gap);
      line += i < remarks.size() ? remarks[i] : "";
      line.erase(line.find_last_not_of(' ') + 1);
      const std::string mark(1, first ? row.mark : ' ');
      text_.append(margin).append(painted(mark, yellow, style_)) += ' ';
      text_ += painted(line, paint, style_) + '\n';
    }
  }

  /// Adds the pieces of a text whose attributes are not the same throughout.
  void addRuns(const toolkit::AttributedString& text) {
    if (text.runs().size() < 2) return;
    for (const auto& [range, attributes] : text.runs()) {
      const std::string piece = text.string().substr(range.location, range.length);
      addHanging(quote(piece) + "  " + styleWords(attributes), contentColumn(), "");
    }
  }

  void addChanges(const std::vector<Change>& changes, std::size_t column) {
    for (const auto& [what, before, now] : changes) {
      std::string was = "↳ ";
      was.append(what).append(": ").append(before);
      const std::string is = "→ " + now;
      if (displayWidth(was) + 1 + displayWidth(is) <= widthFrom(column)) {
        addHanging(was.append(" ").append(is), column, yellow);
      } else {
        addHanging(was, column, yellow);
        addHanging(is, column + 2, yellow);
      }
    }
  }

  void addParagraph(const std::string& words, std::string_view paint) {
    addHanging(words, margin.size(), paint);
  }

  /// Wraps `words` to the width from `column` on; indents the second line and later ones.
  void addHanging(const std::string& words, std::size_t column, std::string_view paint) {
    std::size_t start = column;
    for (const std::string& line : wrap(words, widthFrom(column) - hang)) {
      text_.append(start, ' ');
      text_ += painted(line, paint, style_) + '\n';
      start = column + hang;
    }
  }

  const StepPicture& picture_;
  const PictureChanges& changes_;
  const Style& style_;
  std::size_t tagWidth_ = 3;      // of the column's heading
  std::size_t kindWidth_ = 4;     // the same
  std::size_t contentWidth_ = 5;  // the same
  std::string text_;
};

}  // namespace

std::string renderHeading(int number, std::string_view what, const Style& style) {
  std::string line = "── " + std::to_string(number) + ". " + std::string(what) + " ──";
  for (std::size_t width = displayWidth(line); width < style.width; ++width) line += "─";
  return painted(line, bold, style) + "\n";
}

std::string renderPicture(const StepPicture& picture, const PictureChanges& changes,
                          const Style& style) {
  return Renderer(picture, changes, style).render();
}

}  // namespace qz::tools::play
