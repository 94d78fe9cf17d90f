// SPDX-License-Identifier: MIT
#include "tools/check/look_words.hpp"

#include "tools/support/text_layout.hpp"

namespace qz::tools::check {
namespace {

using toolkit::AttributedString;
using toolkit::State;
using toolkit::memory::SavedView;

/// Returns a noun with its value, such as "the text “A”", or "no text".
std::string nounOf(const std::string& noun, const std::string& value) {
  return value.empty() ? "no " + noun : "the " + noun + " " + quoteStart(value);
}

std::string imageOf(const SavedView& view, bool ofLayer) {
  const auto& image = ofLayer ? view.layerContents : view.image;
  return image ? image->name() : "";
}

std::string wordOf(State state) {
  if (state == State::mixed) return "the mixed state";
  return state == State::on ? "the state on" : "the state off";
}

class LookComparer {
 public:
  std::vector<LookWords> compare(const SavedView& before, const SavedView& after) {
    addText("text", before.text, after.text);
    addText("title", before.title, after.title);
    addNouns(nounOf("image", imageOf(before, false)), nounOf("image", imageOf(after, false)));
    addNouns(nounOf("picture", imageOf(before, true)), nounOf("picture", imageOf(after, true)));
    addNouns(nounOf("tooltip", before.toolTip), nounOf("tooltip", after.toolTip));
    addNouns(wordOf(before.state), wordOf(after.state));
    if (before.background != after.background) addStyle("background");
    if (words_.empty() && !(before == after)) addStyle("style");
    return std::move(words_);
  }

 private:
  void addNouns(const std::string& before, const std::string& after) {
    if (before == after) return;
    words_.push_back({before + " or " + after, after + " instead of " + before});
  }
  void addStyle(const std::string& noun) {
    words_.push_back({"one " + noun + " or another", "another " + noun});
  }
  void addText(const std::string& noun, const AttributedString& before,
               const AttributedString& after) {
    if (before.string() != after.string()) {
      addNouns(nounOf(noun, before.string()), nounOf(noun, after.string()));
    } else if (!(before == after)) {
      addStyle("style of its " + noun);
    }
  }

  std::vector<LookWords> words_;
};

}  // namespace

std::vector<LookWords> wordsFor(const SavedView& before, const SavedView& after) {
  return LookComparer().compare(before, after);
}

}  // namespace qz::tools::check
