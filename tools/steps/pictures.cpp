// SPDX-License-Identifier: MIT
// Pictures of the steps of a source.
#include "tools/steps/pictures.hpp"

#include <array>
#include <cstdio>
#include <filesystem>

#include "qz/drivers/measuring.hpp"
#include "tools/steps/each_step.hpp"
#include "tools/support/failure.hpp"
#include "tools/support/file_names.hpp"

namespace qz::tools::steps {
namespace {

[[noreturn]] void refusePictures(const std::string& message) {
  throw Failure(ExitStatus::badInput, "--screenshots: " + message);
}

/// Returns a name such as "03-where-to.png".
std::string fileNameOf(StepIndex number, const std::string& step) {
  std::array<char, 32> start{};
  std::snprintf(start.data(), start.size(), "%02zu-", number + 1);
  return start.data() + fileWord(step) + ".png";
}

}  // namespace

std::map<std::string, std::string> writePictures(const Source& source,
                                                 const std::string& directory) {
  const auto driver = findDriver([](drivers::Driver& each) { return each.draws(); });
  if (!driver) refusePictures("no toolkit of this build draws here; expected one such as Qt");
  if (auto* const measuring = dynamic_cast<drivers::Measuring*>(driver.get())) {
    measuring->workOffScreen();
  }
  std::error_code error;
  std::filesystem::create_directories(directory, error);
  std::map<std::string, std::string> names;
  showEachStep(source, *driver, [&](StepIndex step, walkthrough::Stage& stage) {
    const std::string& name = source.tour.steps[step].name;
    const auto path = std::filesystem::path(directory) / fileNameOf(step, name);
    if (!driver->savePicture(stage.engine().tutorialWindow(), path.string())) {
      refusePictures(path.string() + ": cannot be written");
    }
    names[name] = path.string();
  });
  return names;
}

}  // namespace qz::tools::steps
