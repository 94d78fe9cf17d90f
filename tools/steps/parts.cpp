// SPDX-License-Identifier: MIT
// The entries of a source, together with those of the files that it includes.
#include "tools/steps/parts.hpp"

#include <algorithm>
#include <filesystem>

#include "tools/steps/words.hpp"
#include "tools/support/suggestions.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::steps {
namespace {

namespace fs = std::filesystem;

constexpr std::string_view sourceWords[] = {"window",    "assets",     "include",   "controls",
                                            "back over", "every step", "fragments", "steps"};

// A walk-through needs few.
constexpr std::size_t deepestInclude = 20;

}  // namespace

NodeRef Parts::part(const std::string& word) const {
  const auto found = parts_.find(word);
  return found == parts_.end() ? nullptr : found->second;
}

void Parts::read(const std::string& path, std::string text) {
  known_.insert(path);
  const Place begin = files_.add(path, std::move(text));
  const NodeRef root = readYaml(files_.lastText(), begin, mistakes_);
  areWhole_ &= root != nullptr;
  if (!root) return;
  NodeRef included;
  for (const auto& [word, value] :
       entriesOf(*root, "a walk-through in steps (a table)", mistakes_)) {
    if (word->text == words::include) {
      included = value;
    } else {
      join(*word, value);
    }
  }
  if (!included) return;
  open_.insert(path);
  include(*included, path);
  open_.erase(path);
}

void Parts::include(const Node& what, const std::string& from) {
  if (what.kind != Node::Kind::list) return includeFile(what, from);
  for (const NodeRef& name : what.elements) includeFile(*name, from);
}

void Parts::includeFile(const Node& name, const std::string& from) {
  const auto file = textOf(name, "the name of a file, or a list of names", mistakes_);
  if (!file) return;
  const auto path = (fs::path(from).parent_path() / *file).lexically_normal().string();
  if (open_.contains(path)) {
    mistakes_.add(name.place, path + " includes itself; expected another file");
  } else if (open_.size() == deepestInclude) {
    mistakes_.add(name.place, "files include each other too deeply; expected at most " +
                                  std::to_string(deepestInclude) + " levels");
  } else if (!known_.contains(path)) {  // two files may share a third
    readIncluded(name, path);
  }
}

void Parts::readIncluded(const Node& name, const std::string& path) {
  if (auto text = readText_(path)) return read(path, *std::move(text));
  mistakes_.add(name.place, path + ": cannot be read; expected a part of a walk-through");
  areWhole_ = false;
  files_.add(path, "");  // so that a watch waits for it
  known_.insert(path);
}

void Parts::join(const Node& word, const NodeRef& value) {
  const std::vector<std::string_view> known(std::begin(sourceWords), std::end(sourceWords));
  if (std::find(known.begin(), known.end(), word.text) == known.end()) {
    mistakes_.add(word.place, "expected one of " + enumerate({known.begin(), known.end()}) +
                                  ", found " + foundWords(word) + didYouMean(word.text, known));
    return;
  }
  NodeRef& part = parts_[word.text];
  if (!part) {
    part = value;
  } else if (part->kind == Node::Kind::table && value->kind == Node::Kind::table) {
    part = joined(*part, *value);
  } else {
    refuseSecond(word, part->place);
  }
}

NodeRef Parts::joined(const Node& before, const Node& more) {
  std::map<std::string, Place> names;
  for (const auto& [name, value] : before.entries) names[name->text] = name->place;
  const auto both = std::make_shared<Node>(before);
  for (const auto& entry : more.entries) {
    const auto known = names.find(entry.first->text);
    if (known == names.end()) {
      both->entries.push_back(entry);
    } else {
      refuseSecond(*entry.first, known->second);
    }
  }
  return both;
}

void Parts::refuseSecond(const Node& second, Place first) {
  mistakes_.add(second.place, quote(second.text) + " is also in " + files_.at(first).text() +
                                  "; expected one entry of this name");
}

}  // namespace qz::tools::steps
