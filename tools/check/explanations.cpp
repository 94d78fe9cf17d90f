// SPDX-License-Identifier: MIT
#include "tools/check/explanations.hpp"

#include <algorithm>
#include <sstream>

#include "tools/check/checking_page.hpp"

namespace qz::tools::check {
namespace {

/// Returns the line with links replaced by their words: a terminal cannot follow them.
std::string withoutLinks(std::string_view line) {
  std::string plain;
  while (!line.empty()) {
    const std::size_t open = std::min(line.find('['), line.size());
    const std::size_t middle = line.find("](", open);
    const std::size_t close = line.find(')', middle);
    plain += line.substr(0, open);
    line.remove_prefix(open);
    if (close == std::string_view::npos) break;
    plain += line.substr(1, middle - open - 1);
    line.remove_prefix(close + 1 - open);
  }
  return plain.append(line);
}

/// Returns what introduces an example, from the words behind the fence of its block.
std::string_view titleOf(std::string_view fence) {
  if (fence.ends_with(" window")) return "The window:";
  if (fence.ends_with(" mended")) return "The script, mended:";
  return fence.ends_with("plist") ? "The script:" : "For example:";
}

}  // namespace

std::optional<std::string> explanationOf(std::string_view code) {
  const std::string_view page = checkingPage();
  const std::string heading = "\n### `" + std::string(code) + "`\n\n";
  const std::size_t begin = page.find(heading);
  if (begin == std::string_view::npos) return std::nullopt;
  const std::size_t start = begin + heading.size();
  const std::size_t end = std::min(page.find("\n## ", start), page.find("\n### ", start));
  std::istringstream entry{std::string(page.substr(start, std::min(end, page.size()) - start))};
  std::string text = std::string(code) + "\n\n";
  bool isCode = false;
  for (std::string line; std::getline(entry, line);) {
    if (line.starts_with("```")) {
      if (!isCode) text.append(titleOf(line)).append("\n\n");
      isCode = !isCode;
    } else {
      text += (isCode && !line.empty() ? "    " + line : withoutLinks(line)) + "\n";
    }
  }
  return text;
}

}  // namespace qz::tools::check
