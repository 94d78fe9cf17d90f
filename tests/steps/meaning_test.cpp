// SPDX-License-Identifier: MIT
// A built source does what the source means: at every place, on generated sources.
// Environment variables choose other sources, and more of them: QZ_FIRST_SEED and QZ_SOURCES.

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <fstream>

#include "tests/check/checking.hpp"
#include "tests/steps/joint_walk.hpp"
#include "tests/steps/source_generator.hpp"

namespace qz::meaning {
namespace {

const std::size_t mostDisagreements = 1000;

std::uint64_t numberInEnvironment(const char* name, std::uint64_t otherwise) {
  const char* const text = std::getenv(name);
  return text ? std::strtoull(text, nullptr, 10) : otherwise;
}

/// A directory for one source, which is gone afterwards.
class Folder {
 public:
  explicit Folder(const Generated& generated) {
    std::string name = (std::filesystem::temp_directory_path() / "qz-source-XXXXXX").string();
    path_ = ::mkdtemp(name.data());
    write("tour.yaml", generated.yaml);
    write("host.plist", generated.window);
    for (const char* picture : pictures) write(std::string(picture) + ".png", "");
  }
  ~Folder() { std::filesystem::remove_all(path_); }
  Folder(const Folder&) = delete;
  Folder& operator=(const Folder&) = delete;

  std::string source() const { return (path_ / "tour.yaml").string(); }
  std::string path() const { return path_.string(); }

 private:
  void write(const std::string& name, const std::string& text) const {
    std::ofstream(path_ / name) << text;
  }

  std::filesystem::path path_;
};

BuiltSource builtOf(const tools::steps::ScriptFile& opened, const Folder& folder) {
  const auto& [source, built] = *opened.from;
  return {folder.path(), built.script, built.startKeys.at(0),
          planStage(source.stage, built.script, source.path)};
}

/// The codes of errors and warnings that a source asks for.
std::set<std::string> askedFor(const Interpreter& meaning, const Places& places) {
  std::set<std::string> codes;
  const auto out = placesWithAWayOut(places);
  // No place is the end.
  if (out.empty()) codes.insert("no-end");
  // Some steps lead only to each other, or nowhere.
  if (out.size() != places.size()) codes.insert({"trap", "dead-end"});
  // A wait ends before everybody has read the step.
  for (const auto& place : places) {
    if (place.first.waits && meaning.waitOf(place.first)->seconds < 10) codes.insert("too-brief");
  }
  return codes;
}

/// What the check says without being asked.
std::string unasked(const tools::steps::ScriptFile& opened, const Folder& folder,
                    const std::set<std::string>& asked) {
  namespace check = tools::check;
  check::CheckOptions options;
  options.toolkit = tools::testToolkit();
  options.stage = opened.from->source.stage;
  options.resources = folder.path();
  const check::Verdict verdict = checkScript(opened.file, options, {});
  std::string words = verdict.explored.complete ? "" : "the check is not complete\n";
  for (const check::Finding& finding : verdict.findings) {
    if (finding.severity == check::Severity::note || asked.contains(finding.code)) continue;
    words += finding.message + " [" + finding.code + "]\n";
  }
  return words;
}

struct Totals {
  std::size_t places = 0;
  std::size_t moves = 0;
};

std::string disagreement(const Generated& generated, Totals& totals) {
  const Folder folder(generated);
  try {
    const auto opened = tools::steps::openScript(folder.source());
    const BuiltSource built = builtOf(opened, folder);
    JointWalk walk(generated.tour, built);
    const std::string wrong = walk.run();
    totals.places += walk.places();
    totals.moves += walk.moves();
    if (!wrong.empty()) return wrong;
    return unasked(opened, folder, askedFor(Interpreter(generated.tour), generated.places));
  } catch (const tools::Failure& failure) {
    return std::string("refused: ") + failure.what();
  }
}

TEST(Meaning, OfGeneratedSourcesIsWhatTheirScriptsDo) {
  const std::uint64_t first = numberInEnvironment("QZ_FIRST_SEED", 1);
  const std::uint64_t count = numberInEnvironment("QZ_SOURCES", 200);
  std::size_t disagreements = 0;
  Totals totals;
  for (std::uint64_t seed = first; seed < first + count; ++seed) {
    const Generated generated = generate(seed);
    const std::string wrong = disagreement(generated, totals);
    if (wrong.empty()) continue;
    ADD_FAILURE() << "seed " << seed << ": " << wrong << "\n"
                  << generated.yaml << generated.window;
    if (++disagreements == mostDisagreements) break;
  }
  std::cout << count << " sources, " << totals.places << " places, " << totals.moves << " moves\n";
}

}  // namespace
}  // namespace qz::meaning
