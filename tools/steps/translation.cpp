// SPDX-License-Identifier: MIT
// Translations of a source.
#include "tools/steps/translation.hpp"

#include <filesystem>
#include <map>

#include "tools/steps/po.hpp"
#include "tools/support/failure.hpp"
#include "tools/support/text_layout.hpp"
#include "tools/support/whole_file.hpp"

namespace qz::tools::steps {
namespace {

// No language: shows which texts have no room to grow.
constexpr std::string_view longLanguage = "x-long";

Translation translationIn(const PoEntry& entry) {
  if (entry.translation.empty()) return {};
  if (entry.isFuzzy) return {.isOld = true};
  return {.text = entry.translation};
}

std::string reasonOf(const Translation& translation) {
  return translation.isOld ? " has changed since it was translated" : " has no translation";
}

}  // namespace

Translate translationTo(const std::string& language, const std::string& source) {
  if (language == longLanguage) {
    return [](const std::string& text) { return Translation{.text = lengthened(text)}; };
  }
  const auto path = std::filesystem::path(source).replace_filename(language + ".po").string();
  const auto file = wholeFile(path);
  if (!file) {
    throw Failure(ExitStatus::badInput, path + ": cannot be read; expected the translations to " +
                                            quote(language) + " beside the source");
  }
  std::map<std::string, Translation> known;
  for (const PoEntry& entry : readPo(*file, path)) known[entry.text] = translationIn(entry);
  return [known](const std::string& text) {
    const auto found = known.find(text);
    return found == known.end() ? Translation{} : found->second;
  };
}

std::vector<std::string> untranslated(const Source& source, const std::string& language) {
  std::vector<std::string> messages;
  for (const Text& text : source.texts) {
    if (!text.translation || text.translation->text) continue;
    const TextUse& use = text.uses.front();
    messages.push_back(source.files.at(use.place).text() + ": warning: " + quoteStart(text.text) +
                       " (" + use.step + ", " + use.control + ")" + reasonOf(*text.translation) +
                       " in " + quote(language) + "; it stays as it is");
  }
  return messages;
}

}  // namespace qz::tools::steps
