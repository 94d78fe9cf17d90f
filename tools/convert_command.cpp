// SPDX-License-Identifier: MIT
// The command `convert`.
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "qz/property_list/formats.hpp"
#include "qz/toolkit/exception.hpp"
#include "tools/commands.hpp"
#include "tools/output_format.hpp"
#include "tools/shared_values.hpp"
#include "tools/steps/script_file.hpp"
#include "tools/support/failure.hpp"
#include "tools/support/input_file.hpp"
#include "tools/support/replace_file.hpp"
#include "tools/support/suggestions.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools {
namespace {

using toolkit::Format;
using toolkit::FormatRow;

struct ConvertOptions {
  std::string in;
  std::string out;
  std::optional<Format> format;
};

std::vector<std::string_view> writableNames() {
  std::vector<std::string_view> names;
  for (const FormatRow& row : writableFormats()) names.push_back(row.name);
  return names;
}

std::string writableList() {
  const auto names = writableNames();
  return enumerate({names.begin(), names.end()});
}

/// Says which suffix chooses which format.
std::string suffixRules() {
  std::string rules;
  for (const FormatRow& row : writableFormats()) {
    if (row.format == standardFormat) continue;
    rules += std::string(row.name) + " where OUT ends with " +
             enumerate({row.suffixes.begin(), row.suffixes.end()}) + ", ";
  }
  return rules + "else " + std::string(toolkit::formatRow(standardFormat).name);
}

std::string written(const InputFile& file, const FormatRow& row) {
  if (!row.writesSharedOnce) requireWritableInFull(file);
  return row.write(file.root());
}

void convert(const ConvertOptions& options) {
  const InputFile file = steps::openPropertyList(options.in);
  const FormatRow& row = toolkit::formatRow(options.format.value_or(formatBySuffix(options.out)));
  try {
    replaceFile(options.out, written(file, row));
  } catch (const toolkit::InvalidArgumentException& refusal) {
    throw Failure(ExitStatus::failed, options.in + ": no " + std::string(row.title) +
                                          " can hold it: " + refusal.reason());
  }
}

void setFormat(ConvertOptions& options, const std::string& name) {
  for (const FormatRow& row : writableFormats()) {
    if (row.name == name) options.format = row.format;
  }
  if (options.format) return;
  throw UsageError("--format: expected " + writableList() + ", found " + quote(name));
}

void describeConvert(Command& command) {
  const auto options = std::make_shared<ConvertOptions>();
  command.argument("IN", options->in, "The property list, of any format; or a source").file();
  command.argument("OUT", options->out, "The file to write").path().file();
  command
      .taken(
          "--format", [options](const std::string& name) { setFormat(*options, name); },
          writableList() + "; without it, " + suffixRules())
      .valueName("FORMAT")
      .choices(writableNames());
  command.task([options] { convert(*options); });
}

}  // namespace

constexpr CommandEntry convertCommand{"convert", "Write a property list in another format",
                                      describeConvert};

}  // namespace qz::tools
