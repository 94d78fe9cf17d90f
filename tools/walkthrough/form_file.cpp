// SPDX-License-Identifier: MIT
// Reads forms if the build has Qt's form loader.
#include "tools/walkthrough/form_file.hpp"

#include "tools/support/failure.hpp"
#include "tools/support/input_file.hpp"

#ifdef QZ_FORMS
#include <filesystem>
#include <stdexcept>

#include "hosts/forms/form_description.hpp"
#endif

namespace qz::tools::walkthrough {

bool namesForm(std::string_view path) { return path.ends_with(".ui"); }

std::string describeFormFile(const std::string& path) {
  const std::string form = requireContents(path, "a form of Qt Designer's");
#ifdef QZ_FORMS
  try {
    return hosts::forms::describeForm(form, std::filesystem::path(path).parent_path().string());
  } catch (const std::runtime_error& refused) {
    throw Failure(ExitStatus::badInput,
                  path + ": " + refused.what() + " (read as a form of Qt Designer's)");
  }
#else
  throw Failure(ExitStatus::badInput,
                path +
                    ": this build does not read forms: install Qt's form loader (scripts/setup "
                    "forms, on Debian), then configure and build again; or have the program "
                    "write the file with WalkThrough::describe");
#endif
}

}  // namespace qz::tools::walkthrough
