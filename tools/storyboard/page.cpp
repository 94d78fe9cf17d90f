// SPDX-License-Identifier: MIT
// Moves are links, so that a page can be clicked through even where programs do not run. Pictures
// are backgrounds in the style, so that the parts that steps have in common are in the page once.
// Names of steps have no "_", with which the page's own names begin.
#include "tools/storyboard/page.hpp"

#include <algorithm>
#include <array>
#include <cstdio>

#include "toolkit/property_list/base64.hpp"
#include "tools/play/pressing.hpp"
#include "tools/play/words.hpp"
#include "tools/storyboard/map_html.hpp"
#include "tools/storyboard/markup.hpp"
#include "tools/storyboard/page_parts.hpp"
#include "tools/storyboard/reading_order.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::storyboard {
namespace {

using walkthrough::ControlPicture;
using walkthrough::StepPicture;

constexpr std::string_view mark = " class=\"marked\"";

std::string base64(std::string_view bytes) {
  std::string text;
  toolkit::encodeBase64(bytes, "", text);
  std::erase(text, '\n');
  return text;
}

std::string joined(const std::vector<std::string>& words) {
  std::string text;
  for (const std::string& word : words) text += (text.empty() ? "" : ", ") + word;
  return text;
}

std::string attribute(std::string_view name, std::string_view value) {
  return " " + std::string(name) + "=\"" + html(value) + "\"";
}

std::string percent(double share) {
  std::array<char, 32> text{};
  std::snprintf(text.data(), text.size(), "%.3f%%", 100 * share);
  return text.data();
}

/// Returns the style of an element at a place that is in shares of the window from the top left.
std::string placeOf(const toolkit::Rect& area) {
  return "left:" + percent(area.x) + ";top:" + percent(area.y) + ";width:" + percent(area.width) +
         ";height:" + percent(area.height);
}

/// Returns what a user calls the control: what it says, else its name.
std::string callingOf(const ControlPicture& control) {
  const std::string content = play::contentOf(control);
  if (!content.empty()) return std::string(firstCharacters(content, 200));
  const std::string kind(drivers::rowOf(control.view.kind).word);
  return kind + " " +
         (control.name.empty() ? std::to_string(control.view.tag) : printable(control.name));
}

class PageWriter {
 public:
  explicit PageWriter(const Page& page) : page_(page), map_(mapOf(page)) {}

  std::string write() {
    writeHead();
    writeIntroduction();
    writeContents();
    text_ += "<main id=\"_steps\">\n";
    for (std::size_t i = 0; i < page_.steps.size(); ++i) writeStep(i);
    text_ += "</main>\n<script>";
    text_ += pageProgram();
    text_ += "</script>\n</body>\n</html>\n";
    return std::move(text_);
  }

 private:
  void writeHead() {
    text_ +=
        "<!DOCTYPE html>\n<html lang=\"en\">\n<head>\n<meta charset=\"utf-8\">\n"
        "<meta http-equiv=\"Content-Security-Policy\" content=\"default-src 'none'; img-src data:; "
        "style-src 'unsafe-inline'; script-src 'sha256-" +
        base64(fromHex(pageProgramHash())) +
        "'\">\n<meta name=\"viewport\" content=\"width=device-width, initial-scale=1\">\n"
        "<link rel=\"icon\" href=\"data:,\">\n<title>" +
        html(page_.title) + "</title>\n<style>" + std::string(pageStyle()) + pictureRules() +
        "</style>\n</head>\n<body>\n";
  }

  /// Returns the rules that show pictures. Each part of a picture is in the page once, however many
  /// steps show it.
  std::string pictureRules() const {
    if (page_.ground.empty()) return "";
    std::string rules = ".drawn { background-image: " + imageOf(page_.ground) + "; }\n";
    for (std::size_t i = 0; i < page_.patches.size(); ++i) {
      const PagePatch& patch = page_.patches[i];
      rules += ".p" + std::to_string(i) + " {" + placeOf(patch.area) +
               ";background-image:" + imageOf(patch.png) + "}\n";
    }
    return rules;
  }

  static std::string imageOf(const std::string& png) {
    return "url(data:image/png;base64," + base64(png) + ")";
  }

  void writeIntroduction() {
    text_ += "<header>\n<h1 dir=\"auto\">" + html(page_.title) + "</h1>\n";
    for (const std::string& remark : page_.remarks) text_ += "<p>" + html(remark) + "</p>\n";
    writeFindings();
    text_ +=
        "<div class=\"player\" hidden>\n<button type=\"button\" id=\"_back\">Back</button>\n"
        "<button type=\"button\" id=\"_again\">Start again</button>\n"
        "<label for=\"_command\">Played so far</label>\n"
        "<input id=\"_command\" readonly>\n"
        "<button type=\"button\" id=\"_copy\">Copy</button>\n"
        "<span role=\"status\" id=\"_status\"></span>\n</div>\n";
    text_ += map_ ? htmlOf(page_, *map_)
                  : "<p>This page has no map: it was made without Graphviz.</p>\n";
    text_ += "</header>\n";
  }

  // --- findings ---

  void writeFindings() {
    if (page_.findings.empty()) return;
    text_ +=
        "<details class=\"findings\"><summary>Findings: " + std::to_string(page_.findings.size()) +
        "</summary>\n<ul>\n";
    for (std::size_t i = 0; i < page_.findings.size(); ++i) writeFinding(i);
    text_ += "</ul>\n</details>\n";
  }

  void writeFinding(std::size_t index) {
    const PageFinding& finding = page_.findings[index];
    text_ += "<li id=\"_finding-" + std::to_string(index + 1) + "\" class=\"" + finding.severity +
             "\"><strong>" + finding.severity + "</strong> <span dir=\"auto\">" +
             html(finding.message) + "</span> <code>" + finding.code + "</code>, <code>" +
             html(finding.place) + "</code>";
    if (!finding.help.empty()) text_ += "<br>" + html(finding.help);
    if (!finding.path.empty()) text_ += "<br>See it:";
    for (const auto& [words, to] : finding.path) text_ += " " + linkTo(to, words);
    text_ += "</li>\n";
  }

  /// Returns a link to a step; only the words if the page does not have the step.
  std::string linkTo(const PageTarget& to, const std::string& words) const {
    if (!to.step) return "<span>" + html(words) + "</span>";
    return "<a href=\"#" + page_.steps[*to.step].name.id + "\">" + html(words) + "</a>";
  }

  void writeFindingsAt(std::size_t step) {
    for (std::size_t i = 0; i < page_.findings.size(); ++i) {
      const PageFinding& finding = page_.findings[i];
      const bool isHere = !finding.path.empty() && finding.path.back().second.step == step;
      if (!isHere) continue;
      text_ += "<p class=\"finding " + finding.severity + "\"><strong>" + finding.severity +
               "</strong> <span dir=\"auto\">" + html(finding.message) +
               "</span> <a href=\"#_finding-" + std::to_string(i + 1) +
               "\">more about it</a></p>\n";
    }
  }

  // --- the list of steps ---

  void writeContents() {
    text_ +=
        "<nav aria-label=\"Steps\">\n<label for=\"_search\">Search</label>\n"
        "<input id=\"_search\" type=\"search\">\n<ul id=\"_contents\">\n";
    for (const PageStep& step : page_.steps) {
      text_ += "<li><a dir=\"auto\" href=\"#" + step.name.id + "\">" + html(step.name.title) +
               "</a></li>\n";
    }
    text_ += "</ul>\n</nav>\n";
  }

  // --- a step ---

  void writeStep(std::size_t index) {
    const PageStep& step = page_.steps[index];
    text_ += "<section id=\"" + step.name.id + "\" class=\"step" + (index == 0 ? " current" : "") +
             "\"" + attribute("data-command", step.command) + nodeOf(index) +
             ">\n<h2 tabindex=\"-1\" dir=\"auto\">" + html(step.name.title) + "</h2>\n";
    writeFindingsAt(index);
    text_ += "<div class=\"columns\">\n<div class=\"seen\">\n";
    const bool isShown = step.picture.window && step.picture.window->visible && !step.picture.ended;
    if (isShown) writePicture(step);
    writeTimers(step);
    text_ += "<p class=\"standing\" dir=\"auto\">" + html(play::standing(step.picture)) + "</p>\n";
    text_ += "</div>\n<div class=\"about\">\n";
    if (isShown) writeText(step);
    writeSource(step);
    text_ += "</div>\n</div>\n</section>\n";
  }

  std::string nodeOf(std::size_t step) const {
    if (!map_) return "";
    return " data-node=\"" + std::to_string(map_->nodeOfStep[step]) + "\"";
  }

  void writePicture(const PageStep& step) {
    const auto& content = step.picture.window->content;
    text_ += "<div class=\"picture" + std::string(step.isDrawn ? " drawn" : "") +
             "\" style=\"--width:" + play::numberWords(content.width) +
             ";--height:" + play::numberWords(content.height) + "\">\n";
    text_ += patchesOf(step);
    for (const std::size_t control : readingOrder(step.picture)) writeArea(step, control);
    text_ += "</div>\n";
  }

  /// Writes where a control is: what can be pressed as a link, the rest only where nothing is
  /// drawn.
  void writeArea(const PageStep& step, std::size_t index) {
    const ControlPicture& control = step.picture.controls[index];
    const PageMove* const press = pressOf(step, index);
    if (!press && step.isDrawn) return;
    const auto& frame = control.view.frame;
    const auto& content = step.picture.window->content;
    const std::string style =
        " style=\"" +
        placeOf({frame.x / content.width, 1 - (frame.y + frame.height) / content.height,
                 frame.width / content.width, frame.height / content.height}) +
        ";z-index:" + std::to_string(index + 1) + "\"";
    const std::string kind = "area " + classOf(control);
    const std::string words = step.isDrawn ? "" : boxWords(control);
    if (!press) {
      text_ += "<span aria-hidden=\"true\" dir=\"auto\" class=\"" + kind + "\"" + style + ">" +
               words + "</span>\n";
    } else {
      text_ += pressLink(*press, callingOf(control), kind + " press", style, words);
    }
  }

  static const PageMove* pressOf(const PageStep& step, std::size_t control) {
    const auto found = std::find_if(step.moves.begin(), step.moves.end(),
                                    [&](const PageMove& move) { return move.control == control; });
    return found == step.moves.end() ? nullptr : &*found;
  }

  /// Returns a link that makes a move; it leads nowhere if the page does not have the step.
  std::string pressLink(const PageMove& move, const std::string& label, const std::string& kind,
                        const std::string& style, const std::string& words) const {
    std::string link = "<a dir=\"auto\" class=\"" + kind + "\"" + style +
                       attribute("data-move", move.argument) + attribute("aria-label", label);
    if (move.to.step) {
      link += " href=\"#" + page_.steps[*move.to.step].name.id + "\"";
    } else {
      link += " role=\"link\" aria-disabled=\"true\"" + attribute("title", whyNot(move.to));
    }
    return link + ">" + words + "</a>\n";
  }

  static std::string whyNot(const PageTarget& to) {
    return to.title.empty() ? "The lists that this runs have no end, or were not explored"
                            : "Leads to a step that this page leaves out: " + to.title;
  }

  static std::string classOf(const ControlPicture& control) {
    std::string kind(drivers::rowOf(control.view.kind).word);
    std::replace(kind.begin(), kind.end(), ' ', '-');
    if (control.flashing) kind += " flashing";
    return control.view.enabled ? kind : kind + " disabled";
  }

  static std::string boxWords(const ControlPicture& control) {
    const auto& row = drivers::rowOf(control.view.kind);
    std::string words = play::contentOf(control);
    if (row.showsState) {
      const auto state = control.view.state;
      const std::string box = state == toolkit::State::on ? "☑ " : "☐ ";
      words.insert(0, state == toolkit::State::mixed ? "⊟ " : box);
    }
    return html(words);
  }

  // --- timers ---

  void writeTimers(const PageStep& step) {
    for (const PageMove& move : step.moves) {
      if (move.control) continue;
      const double seconds = step.picture.timers.front().timeLeft;
      const std::string time = play::numberWords(seconds);
      text_ += "<p class=\"timer\"><span>After <span class=\"countdown\">" + time +
               "</span> s something happens by itself.</span> "
               "<button type=\"button\" class=\"wait\" hidden data-seconds=\"" +
               time + "\">Wait</button> " +
               pressLink(move, "Skip the wait of " + time + " s", "skip", "", "Skip the wait") +
               "</p>\n";
    }
  }

  // --- the text of a picture, and the source ---

  void writeText(const PageStep& step) {
    text_ += "<h3>What it says</h3>\n<ul class=\"says\">\n";
    for (const std::size_t index : readingOrder(step.picture)) {
      const ControlPicture& control = step.picture.controls[index];
      const auto& row = drivers::rowOf(control.view.kind);
      const std::string content = play::contentOf(control);
      const bool saysNothing = content.empty() && !row.isButton;
      if (saysNothing) continue;
      const std::string name =
          control.name.empty() ? std::to_string(control.view.tag) : printable(control.name);
      text_ += "<li><span class=\"kind\">" + std::string(row.word) +
               "</span> <span class=\"name\">" + html(name) +
               "</span> <span class=\"content\" dir=\"auto\">" + html(content) + "</span>";
      const std::string details = joined(play::remarksOn(control));
      if (!details.empty()) text_ += " <span class=\"details\">" + html(details) + "</span>";
      text_ += "</li>\n";
    }
    text_ += "</ul>\n";
  }

  void writeSource(const PageStep& step) {
    for (const SourceExcerpt& excerpt : step.source) {
      text_ += "<h3>Source: <code>" + html(excerpt.path) + "</code></h3>\n<pre tabindex=\"0\">";
      for (const SourceLine& line : excerpt.lines) {
        text_ += "<span" + std::string(line.isMarked ? mark : "") + "><i>" +
                 std::to_string(line.number) + "</i> " + html(line.text) + "</span>\n";
      }
      text_ += "</pre>\n";
    }
  }

  const Page& page_;
  const std::optional<PageMap> map_;
  std::string text_;
};

}  // namespace

std::string htmlOf(const Page& page) { return PageWriter(page).write(); }

}  // namespace qz::tools::storyboard
