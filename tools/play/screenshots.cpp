// SPDX-License-Identifier: MIT
// Pictures of a walk-through in a directory.
#include "tools/play/screenshots.hpp"

#include <array>
#include <cstdio>
#include <filesystem>
#include <regex>
#include <system_error>
#include <utility>

#include "tools/support/failure.hpp"

namespace qz::tools::play {
namespace {

namespace fs = std::filesystem;

[[noreturn]] void refuse(const std::string& message) {
  throw Failure(ExitStatus::badInput, "--screenshots: " + message);
}

/// Deletes the pictures of an earlier walk-through, which would mix with the new ones.
void clearAway(const std::string& directory) {
  static const std::regex own("[0-9]{2,}-(start|press|advance|list|wait)[-.0-9a-zA-Z]*\\.png");
  std::error_code error;
  for (const auto& entry : fs::directory_iterator(directory, error)) {
    if (std::regex_match(entry.path().filename().string(), own)) fs::remove(entry.path(), error);
  }
}

}  // namespace

Screenshots::Screenshots(drivers::Driver& driver, std::string directory)
    : driver_(driver), directory_(std::move(directory)) {
  if (!driver.draws()) {
    refuse("the toolkit " + std::string(driver.name()) +
           " has no pixels; expected one that draws, such as --toolkit qt");
  }
  std::error_code error;
  fs::create_directories(directory_, error);
  if (!fs::is_directory(directory_, error)) refuse(directory_ + ": no directory can be made there");
  clearAway(directory_);
  const std::string path = directory_ + "/transcript.txt";
  text_.open(path);
  if (!text_) refuse(path + ": cannot be written");
}

void Screenshots::keep(Transcript& transcript) { transcript.alsoTo(text_, Style{}); }

void Screenshots::take(const toolkit::Ref<toolkit::Window>& window, std::string_view what) {
  if (!driver_.look(window).visible) return;
  std::array<char, 16> number{};
  std::snprintf(number.data(), number.size(), "%02d-", taken_++);
  const std::string path = directory_ + "/" + number.data() + std::string(what) + ".png";
  if (!driver_.savePicture(window, path)) refuse(path + ": cannot be written");
}

}  // namespace qz::tools::play
