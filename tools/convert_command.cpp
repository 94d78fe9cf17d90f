// SPDX-License-Identifier: MIT
// The command `convert`.
#include <filesystem>
#include <map>
#include <memory>
#include <optional>
#include <string>

#include "qz/property_list/binary_writer.hpp"
#include "qz/property_list/reader.hpp"
#include "qz/property_list/xml_writer.hpp"
#include "qz/toolkit/exception.hpp"
#include "tools/commands.hpp"
#include "tools/shared_values.hpp"
#include "tools/support/failure.hpp"
#include "tools/support/input_file.hpp"
#include "tools/support/replace_file.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools {
namespace {

using toolkit::Format;

const std::map<std::string, Format> formats = {{"binary", Format::binary}, {"xml", Format::xml}};

struct ConvertOptions {
  std::string in;
  std::string out;
  std::optional<Format> format;
};

Format formatByExtension(const std::string& path) {
  const auto extension = std::filesystem::path(path).extension();
  return extension == ".bplist" || extension == ".bin" ? Format::binary : Format::xml;
}

std::string written(const play::InputFile& file, Format format) {
  if (format == Format::binary) return toolkit::writeBinaryPropertyList(file.root());
  requireWritableInFull(file);
  return toolkit::writeXmlPropertyList(file.root());
}

void convert(const ConvertOptions& options) {
  const play::InputFile file(options.in, "a property list", ExitStatus::failed);
  const Format format = options.format.value_or(formatByExtension(options.out));
  try {
    replaceFile(options.out, written(file, format));
  } catch (const toolkit::InvalidArgumentException& refusal) {
    throw Failure(ExitStatus::failed, options.in + ": no " +
                                          std::string(toolkit::description(format)) +
                                          " can hold it: " + refusal.reason());
  }
}

void setFormat(ConvertOptions& options, const std::string& name) {
  const auto found = formats.find(name);
  if (found == formats.end()) {
    throw UsageError("--format: expected xml or binary, found " + quote(name));
  }
  options.format = found->second;
}

void describeConvert(Command& command) {
  const auto options = std::make_shared<ConvertOptions>();
  command.argument("IN", options->in, "The property list, of any format");
  command.argument("OUT", options->out, "The file to write").path();
  command
      .taken(
          "--format", [options](const std::string& name) { setFormat(*options, name); },
          "xml or binary; without it, binary where OUT ends with .bplist or .bin, else xml")
      .valueName("FORMAT");
  command.action([options] {
    convert(*options);
    return static_cast<int>(ExitStatus::fine);
  });
}

}  // namespace

constexpr CommandEntry convertCommand{"convert", "Write a property list in another format",
                                      describeConvert};

}  // namespace qz::tools
