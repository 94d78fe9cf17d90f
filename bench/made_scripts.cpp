// SPDX-License-Identifier: MIT
#include "bench/made_scripts.hpp"

namespace qz::bench {
namespace {

std::string element(const char* tag, const std::string& content) {
  return "\t\t\t<" + std::string(tag) + ">" + content + "</" + tag + ">\n";
}

std::string command(const std::string& name, const std::string& parameters) {
  return "\t\t<array>\n" + element("string", name) + parameters + "\t\t</array>\n";
}

std::string list(std::size_t number) {
  const std::string tag = std::to_string(number);
  const std::string next = std::to_string(number + 1);
  return "\t<key>" + tag + "</key>\n\t<array>\n" +
         command("SET_TEXT_FOR_OBJECT_ID",
                 element("string", "Step " + tag +
                                       ": take the cup off the tray &amp; put it "
                                       "under the spout, then press Next.") +
                     element("integer", tag)) +
         command("SET_TITLE_FOR_OBJECT_ID", element("string", "Next") + element("integer", next)) +
         command("SET_TAG_FOR_OBJECT_ID_WITH_TIMER",
                 element("integer", next) + element("integer", tag) + element("real", "2.5")) +
         command("FLASH_ID", "\t\t\t<true/>\n" + element("integer", next)) +
         command("SET_FOREGROUND_COLOR_FOR_OBJECT_ID",
                 element("string", "green") + element("integer", tag)) +
         "\t\t<string>IDLE_LOOP</string>\n\t</array>\n";
}

}  // namespace

std::string xmlScript(std::size_t bytes) {
  std::string script =
      "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
      "<!DOCTYPE plist PUBLIC \"-//Apple//DTD PLIST 1.0//EN\" "
      "\"http://www.apple.com/DTDs/PropertyList-1.0.dtd\">\n"
      "<plist version=\"1.0\">\n<dict>\n";
  script.reserve(bytes + 2048);
  for (std::size_t number = 0; script.size() < bytes; ++number) script += list(number);
  script += "</dict>\n</plist>\n";
  return script;
}

}  // namespace qz::bench
