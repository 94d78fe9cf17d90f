// SPDX-License-Identifier: MIT
// Measures loading scripts, from bytes in memory to the script dictionary, against libplist (which
// yields the same typed values) and pugixml (which yields only text: the least that reading XML
// costs).
#include <plist/plist.h>
#include <pugixml.hpp>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "bench/made_scripts.hpp"
#include "bench/measuring.hpp"
#include "qz/property_list/binary_writer.hpp"
#include "qz/property_list/reader.hpp"

namespace qz {

namespace {

using bench::Contender;

constexpr std::size_t megabyte = 1'000'000;
constexpr std::size_t loadedSizes[] = {1 * megabyte, 18 * megabyte};
constexpr std::size_t grownSizes[] = {1 * megabyte, 8 * megabyte, 64 * megabyte, 500 * megabyte};

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

/// Prints one row: the time of each contender, and for the others the ratio to the first, this
/// reader.
void printTimes(const std::string& file, const std::vector<Contender>& contenders, int rounds) {
  const auto times = bench::leastTimes(contenders, rounds);
  std::vector<std::string> row{file};
  for (const char* name : {"this reader", "pugixml", "libplist"}) {
    std::string cell;
    for (std::size_t i = 0; i < contenders.size(); ++i) {
      if (contenders[i].name != name) continue;
      cell = bench::shownTime(times[i]);
      if (i > 0) cell += ", " + bench::shownRatio(times[i] / times[0]);
    }
    row.push_back(cell);
  }
  bench::printRow(row);
}

/// Returns a contender that does the work `count` times and frees each script before reading the
/// next.
Contender repeated(const Contender& one, int count) {
  return {one.name, [one, count] {
            for (int i = 0; i < count; ++i) {
              one.prepare();
              one.run();
            }
          }};
}

void measureLoads() {
  bench::printHead("Loading a script", {"file", "this reader", "pugixml", "libplist"});
  for (const std::size_t size : loadedSizes) {
    const int rounds = size > 10 * megabyte ? 9 : 60;
    const std::string xml = bench::xmlScript(size);
    printTimes("XML, " + inMegabytes(xml.size()),
               {ourLoad(xml), pugixmlLoad(xml), libplistLoad(xml, false)}, rounds);
    const std::string binary = binaryOf(xml);
    printTimes("the same in binary", {ourLoad(binary), libplistLoad(binary, true)}, rounds);
  }
  constexpr int count = 1000;
  const std::string xml = bench::xmlScript(2000);
  printTimes("1000 times XML, 2 kB, and freeing it",
             {repeated(ourLoad(xml), count), repeated(pugixmlLoad(xml), count),
              repeated(libplistLoad(xml, false), count)},
             20);
}

/// Prints the time of a program's first load of a generated script, the peak growth of its memory
/// meanwhile and the growth that remains, each per byte of the script.
void loadOnce(std::size_t size) {
  const std::string xml = bench::xmlScript(size);
  const Contender load = ourLoad(xml);
  const bench::Memory before = bench::memory();
  const double time = bench::timeOf(load.run);
  const bench::Memory after = bench::memory();
  const auto bytes = static_cast<double>(xml.size());
  std::printf("%g %g %g\n", time / bytes, static_cast<double>(after.most - before.now) / bytes,
              static_cast<double>(after.now - before.now) / bytes);
}

void measureGrowth() {
  bench::printHead("The first load of an XML script in a program, per byte of it",
                   {"file", "time", "most memory meanwhile", "memory of the script"});
  std::map<std::size_t, std::vector<double>> least;
  for (int round = 0; round < 5; ++round) {
    for (const std::size_t size : grownSizes) {
      const auto numbers = bench::numbersOfOwnRun(std::to_string(size));
      auto& best = least.try_emplace(size, numbers).first->second;
      for (std::size_t i = 0; i < best.size(); ++i) best[i] = std::min(best[i], numbers.at(i));
    }
  }
  std::vector<std::pair<double, double>> points;
  for (const auto& [size, best] : least) {
    points.emplace_back(size, best.at(0) * static_cast<double>(size));
    bench::printRow({inMegabytes(size), bench::shownTime(best[0]), bench::shownBytes(best.at(1)),
                     bench::shownBytes(best.at(2))});
  }
  bench::printExponent("Time grows with the size", points);
}

}  // namespace

}  // namespace qz

using namespace qz;

int main(int argc, char** argv) {
  if (argc == 2) {
    loadOnce(std::strtoull(argv[1], nullptr, 10));
    return 0;
  }
  measureGrowth();
  measureLoads();
  return 0;
}
