// SPDX-License-Identifier: MIT
#include "tools/diff/properties.hpp"

#include "tools/play/words.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::diff {
namespace {

using toolkit::AttributedString;
using toolkit::memory::SavedView;

std::string quotedOr(const std::string& text, const char* none) {
  return text.empty() ? none : quote(text);
}

std::string nameOf(const toolkit::Ref<toolkit::Image>& image) {
  return image ? quote(image->name()) : "none";
}

std::string backgroundWords(const SavedView& view) {
  return view.background ? play::colorWords(*view.background) : "none";
}

/// Returns such as `“Hello”: Times 12 bold; “you”: plain`.
std::string styleOf(const AttributedString& text) {
  std::string words;
  for (const auto& [range, attributes] : text.runs()) {
    words += (words.empty() ? "" : "; ") +
             quoteStart(text.string().substr(range.location, range.length)) + ": " +
             play::styleWords(attributes);
  }
  return words.empty() ? "plain" : words;
}

class PropertyComparer {
 public:
  std::vector<PropertyChange> compare(const SavedView& before, const SavedView& after) {
    addText("text", before.text, after.text);
    addText("title", before.title, after.title);
    addWords("tooltip", before.toolTip, after.toolTip);
    add("image", nameOf(before.image), nameOf(after.image));
    add("picture", nameOf(before.layerContents), nameOf(after.layerContents));
    add("state", std::string(play::stateWord(before.state)),
        std::string(play::stateWord(after.state)));
    add("background", backgroundWords(before), backgroundWords(after));
    // Such as a colour that differs by less than its words.
    if (changes_.empty() && !(before == after)) add("style", "one", "another");
    return std::move(changes_);
  }

 private:
  void add(const char* property, const std::string& before, const std::string& after) {
    if (before != after) changes_.push_back({property, {before, after}, false});
  }
  void addWords(const char* property, const std::string& before, const std::string& after) {
    if (before == after) return;
    changes_.push_back({property, {quotedOr(before, "none"), quotedOr(after, "none")}, true});
  }
  void addText(const char* property, const AttributedString& before,
               const AttributedString& after) {
    addWords(property, before.string(), after.string());
    const bool isSameText = before.string() == after.string();
    if (isSameText && !(before == after)) {
      add((std::string("style of the ") + property).c_str(), styleOf(before), styleOf(after));
    }
  }

  std::vector<PropertyChange> changes_;
};

}  // namespace

std::vector<PropertyChange> propertyChanges(const SavedView& before, const SavedView& after) {
  return PropertyComparer().compare(before, after);
}

}  // namespace qz::tools::diff
