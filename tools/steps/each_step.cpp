// SPDX-License-Identifier: MIT
// Shows every step of a source.
#include "tools/steps/each_step.hpp"

#include <exception>
#include <filesystem>
#include <numeric>

#include "tools/steps/compiler.hpp"
#include "tools/support/drivers.hpp"

namespace qz::tools::steps {

std::unique_ptr<drivers::Driver> findDriver(const std::function<bool(drivers::Driver&)>& suits) {
  for (const ToolkitRow& row : toolkits()) {
    if (!row.hasDisplay || !row.make) continue;
    try {
      if (auto driver = row.make(); suits(*driver)) return driver;
    } catch (const std::exception&) {
      // It needs a display, and there is none.
    }
  }
  return nullptr;
}

void showEachStep(const Source& source, drivers::Driver& driver,
                  const std::function<void(StepIndex, walkthrough::Stage&)>& see) {
  std::vector<StepIndex> all(source.tour.steps.size());
  std::iota(all.begin(), all.end(), 0);
  Mistakes mistakes;
  const Built built = build(source.tour, all, mistakes);
  mistakes.throwIfAny(source.files);
  const auto folder = std::filesystem::absolute(source.path).parent_path();
  driver.setResourcePath(folder.string());
  const auto plan = walkthrough::planStage(source.stage, built.script, source.path);
  for (const StepIndex step : all) {
    walkthrough::Stage stage(driver, plan);
    stage.start(built.script, built.startKeys[step]);
    see(step, stage);
  }
}

}  // namespace qz::tools::steps
