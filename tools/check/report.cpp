// SPDX-License-Identifier: MIT
#include "tools/check/report.hpp"

#include <charconv>

namespace qz::tools::check {
namespace {

std::string shortest(double number) {
  char digits[32];
  const auto end = std::to_chars(std::begin(digits), std::end(digits), number).ptr;
  return {std::begin(digits), end};
}

}  // namespace

std::vector<ReportFormat> reportFormats() {
  return {{"text", "for people", writeText},
          {"json", "one JSON object", writeJson},
          {"sarif", "SARIF 2.1.0, for code hosts", writeSarif},
          {"junit", "JUnit's XML, for CI services", writeJunit},
          {"github", "annotations of GitHub's workflows", writeGithub}};
}

std::optional<toolkit::TextPosition> positionOf(const Finding& finding, const InputFile& file) {
  const auto position = finding.where ? file.positionOf(finding.where) : std::nullopt;
  const auto* const text = position ? std::get_if<toolkit::TextPosition>(&*position) : nullptr;
  return text ? std::optional(*text) : std::nullopt;
}

const std::string& pathOf(const Finding& finding, const InputFile& file) {
  if (finding.elsewhere) return finding.elsewhere->path;
  return finding.where ? file.pathOf(finding.where) : file.path();
}

std::string placeOf(const Finding& finding, const InputFile& file) {
  if (finding.elsewhere) return finding.elsewhere->text();
  return finding.where ? file.placeOf(finding.where) : file.path();
}

std::string shellWord(const std::string& text) {
  const bool isPlain = !text.empty() && text.find_first_not_of(
                                            "abcdefghijklmnopqrstuvwxyzABCDEFGHIJKLMNOPQRSTUVWXYZ"
                                            "0123456789_-./") == std::string::npos;
  if (isPlain) return text;
  std::string quoted = "'";
  for (const char c : text) quoted += c == '\'' ? std::string("'\\''") : std::string(1, c);
  return quoted + "'";
}

std::string stageArguments(const CheckOptions& options) {
  std::string arguments;
  const auto add = [&](const char* option, const std::optional<std::string>& value) {
    if (value) arguments += std::string(" ") + option + " " + shellWord(*value);
  };
  add("--window", options.stage.window);
  add("--assets", options.stage.assets);
  add("--resources", options.resources);
  if (options.stage.sheet) arguments += " --sheet";
  return arguments;
}

std::string playCommand(const Report& report, const Path& path) {
  return "qz-walkthrough play " + shellWord(report.verdict.path) + report.stageArguments + " " +
         playArguments(path, report.verdict.names);
}

std::string playArguments(const Path& path, const walkthrough::Names& names) {
  std::string arguments;
  bool isPressing = false;
  for (const Step& step : path) {
    if (const auto* press = std::get_if<PressMove>(&step)) {
      arguments += isPressing ? " " : " --press ";
      const auto name = names.controls.find(press->tag);
      arguments +=
          name == names.controls.end() ? std::to_string(press->tag) : shellWord(name->second);
      isPressing = true;
      continue;
    }
    isPressing = false;
    if (const auto* start = std::get_if<StartMove>(&step)) {
      const std::string name = names.stepOf(start->key);
      arguments += " --start " + shellWord(name.empty() ? start->key : name);
    } else {
      arguments += " --advance " + shortest(std::get<WaitMove>(step).seconds);
    }
  }
  return arguments.empty() ? arguments : arguments.substr(1);
}

}  // namespace qz::tools::check
