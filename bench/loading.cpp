// Loading scripts, from bytes in memory to the script dictionary, beside libplist (which yields the
// same typed values) and pugixml (which yields text only: what reading XML costs at least).
#include <plist/plist.h>
#include <pugixml.hpp>

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "bench/made_scripts.hpp"
#include "bench/measuring.hpp"
#include "toolkit/property_list/binary_writer.hpp"
#include "toolkit/property_list/reader.hpp"

namespace {

using bench::Contender;

constexpr std::size_t megabyte = 1'000'000;
constexpr std::size_t loadedSizes[] = {1 * megabyte, 18 * megabyte};

void require(bool loaded, const char* by) {
  if (loaded) return;
  std::fprintf(stderr, "bench-loading: the script was not read by %s\n", by);
  std::exit(1);
}

Contender ourLoad(const std::string& bytes) {
  const auto script = std::make_shared<toolkit::ValueRef<toolkit::Dictionary>>();
  return {"this reader",
          [&bytes, script] {
            *script = toolkit::dictionaryFromPropertyList(bytes);
            require(static_cast<bool>(*script), "this reader");
          },
          [script] { *script = nullptr; }};
}

Contender pugixmlLoad(const std::string& bytes) {
  const auto document = std::make_shared<pugi::xml_document>();
  return {
      "pugixml",
      [&bytes, document] { require(document->load_buffer(bytes.data(), bytes.size()), "pugixml"); },
      [document] { document->reset(); }};
}

Contender libplistLoad(const std::string& bytes, bool isBinary) {
  struct Root {
    plist_t value = nullptr;
    ~Root() { plist_free(value); }
  };
  const auto root = std::make_shared<std::optional<Root>>();
  return {"libplist",
          [&bytes, root, isBinary] {
            const auto read = isBinary ? plist_from_bin : plist_from_xml;
            read(bytes.data(), static_cast<std::uint32_t>(bytes.size()), &root->emplace().value);
            require((*root)->value != nullptr, "libplist");
          },
          [root] { root->reset(); }};
}

std::string binaryOf(const std::string& xml) {
  return toolkit::writeBinaryPropertyList(toolkit::readPropertyList(xml).value);
}

std::string inMegabytes(std::size_t bytes) {
  return std::to_string((bytes + megabyte / 2) / megabyte) + " MB";
}

void measureLoads() {
  bench::printHead("Loading a script", {"file", "this reader", "pugixml", "libplist",
                                        "pugixml : this", "libplist : this"});
  for (const std::size_t size : loadedSizes) {
    const int rounds = size > 10 * megabyte ? 9 : 60;
    const std::string xml = bench::xmlScript(size);
    const auto t =
        bench::leastTimes({ourLoad(xml), pugixmlLoad(xml), libplistLoad(xml, false)}, rounds);
    bench::printRow({"XML, " + inMegabytes(xml.size()), bench::shownTime(t[0]),
                     bench::shownTime(t[1]), bench::shownTime(t[2]), bench::shownRatio(t[1] / t[0]),
                     bench::shownRatio(t[2] / t[0])});
    const std::string binary = binaryOf(xml);
    const auto b = bench::leastTimes({ourLoad(binary), libplistLoad(binary, true)}, rounds);
    bench::printRow({"the same in binary", bench::shownTime(b[0]), "", bench::shownTime(b[1]), "",
                     bench::shownRatio(b[1] / b[0])});
  }
}

void measureSmallLoads() {
  constexpr std::size_t bytes = 2000;
  constexpr int count = 1000;
  const std::string xml = bench::xmlScript(bytes);
  const auto repeated = [](Contender one) {
    return Contender{one.name, [one] {
                       for (int i = 0; i < count; ++i) {
                         one.prepare();
                         one.run();
                       }
                     }};
  };
  const auto t = bench::leastTimes(
      {repeated(ourLoad(xml)), repeated(pugixmlLoad(xml)), repeated(libplistLoad(xml, false))}, 20);
  bench::printRow({"1000 times XML, 2 kB, and freeing it", bench::shownTime(t[0]),
                   bench::shownTime(t[1]), bench::shownTime(t[2]), bench::shownRatio(t[1] / t[0]),
                   bench::shownRatio(t[2] / t[0])});
}

/// A program of its own, for the memory it takes: loads a made script, or makes it only.
int loadOnce(std::size_t size, bool load) {
  const std::string xml = bench::xmlScript(size);
  if (!load) return 0;
  return toolkit::dictionaryFromPropertyList(xml) ? 0 : 1;
}

void measureGrowth(const std::vector<std::size_t>& sizes) {
  bench::printHead(
      "Growth with the size of an XML script",
      {"size", "time", "a byte", "peak memory beyond the file's bytes", "of the file's size"});
  std::vector<std::pair<double, double>> points;
  for (const std::size_t size : sizes) {
    const std::string xml = bench::xmlScript(size);
    const auto bytes = static_cast<double>(xml.size());
    const double time = bench::leastTimes({ourLoad(xml)}, size > 100 * megabyte ? 3 : 15)[0];
    points.emplace_back(bytes, time);
    const auto peak = [size](const char* mode) {
      return static_cast<double>(bench::peakMemoryOf({mode, std::to_string(size)}));
    };
    const double memory = peak("--load") - peak("--make");
    bench::printRow({inMegabytes(size), bench::shownTime(time), bench::shownTime(time / bytes),
                     inMegabytes(static_cast<std::size_t>(memory)),
                     bench::shownRatio(memory / bytes)});
  }
  std::printf("\nTime grows with the size to the power of %.3f.\n", bench::fittedExponent(points));
}

}  // namespace

int main(int argc, char** argv) {
  if (argc == 3)
    return loadOnce(std::strtoull(argv[2], nullptr, 10), !std::strcmp(argv[1], "--load"));
  measureLoads();
  measureSmallLoads();
  measureGrowth({megabyte, 8 * megabyte, 64 * megabyte, 500 * megabyte});
  return 0;
}
