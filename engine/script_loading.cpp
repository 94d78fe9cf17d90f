// SPDX-License-Identifier: MIT
// Loads and starts a script, optionally with the walk-through window as a sheet.

#include <algorithm>
#include <filesystem>

#include "engine/state.hpp"
#include "engine/tag_key.hpp"
#include "qz/property_list/reader.hpp"
#include "text/number_conversion.hpp"

namespace qz {

namespace {

bool isAbsolutePath(std::string path) {
  // Windows cannot convert what is not UTF-8, and only the ASCII characters matter here.
  std::replace_if(
      path.begin(), path.end(), [](char c) { return static_cast<unsigned char>(c) >= 0x80; }, 'x');
  return path.starts_with('~') || std::filesystem::path(path).is_absolute();
}

// A name is used exactly as given: ".plist" is never added. (An absent name reads as the text that
// the system's formats print for an absent object.)
std::string scriptPath(const std::optional<std::string>& name, const toolkit::Files& files) {
  const std::string given = name.value_or("(null)");
  return isAbsolutePath(given) ? given : files.resourcePath() + "/" + given;
}

toolkit::ValueRef<toolkit::Dictionary> readScript(const std::string& path,
                                                  const toolkit::Files& files) {
  const auto contents = files.contentsAtPath(path);
  return contents ? toolkit::dictionaryFromPropertyList(*contents) : nullptr;
}

}  // namespace

std::optional<std::string> smallestTagKey(const toolkit::Dictionary& script) {
  const auto& entries = script.entries();
  if (entries.empty()) return std::nullopt;
  const auto smaller = [](const auto& a, const auto& b) {
    return a.key->intValue() < b.key->intValue();
  };
  return tagKey(std::min_element(entries.begin(), entries.end(), smaller)->key->intValue());
}

bool QZ_Plist_State_Parser::loadPlist(std::optional<std::string> name,
                                      std::optional<std::string> runFromKey,
                                      std::shared_ptr<toolkit::SheetDelegate> withDelegate,
                                      bool runAsSheet) {
  const auto kept = keepAlive();
  const toolkit::Files& files = state_->toolkit.files();
  state_->runningAsSheet = runAsSheet;
  const std::string path = scriptPath(name, files);
  if (files.fileExistsAtPath(path)) {
    state_->plistDictionary->removeAllObjects();
    state_->plistDictionary.set(readScript(path, files));
    if (!*state_->plistDictionary) return false;
  }
  if (runAsSheet) {
    if (const Window tutorial = tutorialWindow()) {
      state_->toolkit.application().beginSheet(tutorial, window(), withDelegate, nullptr);
    } else {
      state_->toolkit.log().write("SERIOUS ERROR WE DON'T HAVE A WINDOW IN WHICH TO SHOW WIDGETS");
    }
  }
  withDelegate.reset();  // the run must not keep it alive
  if (!runFromKey) return true;
  const auto key = runFromKey->empty() ? smallestTagKey(**state_->plistDictionary) : runFromKey;
  if (!key) return false;
  return processCommandArray(state_->plistDictionary->objectForKey(*key),
                             toolkit::Number::withLong(text::intValueOf(*key)));
}

}  // namespace qz
