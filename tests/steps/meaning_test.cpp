// SPDX-License-Identifier: MIT
// A built source does what the source means: at every place, on generated sources.
// Environment variables choose other sources, and more of them: QZ_FIRST_SEED and QZ_SOURCES.

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <fstream>
#include <iostream>
#include <iterator>
#include <sstream>

#include "tests/check/checking.hpp"
#include "tests/steps/joint_walk.hpp"
#include "tests/steps/smaller_tours.hpp"
#include "tests/steps/source_generator.hpp"

namespace qz::meaning {
namespace {

using naive::Dice;

const std::size_t mostDisagreements = 200;

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

/// The source, built so that it starts with the last of its start keys.
BuiltSource builtOf(const tools::steps::ScriptFile& opened, const Folder& folder) {
  const auto& [source, built] = *opened.from;
  return {folder.path(), built.script, built.startKeys.front(),
          planStage(source.stage, built.script, source.path)};
}

/// Whether users who read 200 words in a minute can read the text in so many seconds.
bool isRead(const Reading& reading, int seconds) {
  std::string text;
  for (const Span& span : reading) text += span.text;
  std::istringstream in(text);
  const auto words = std::distance(std::istream_iterator<std::string>(in), {});
  return seconds >= 2 && seconds >= 0.3 * static_cast<double>(words);
}

/// Whether a wait changes a text before it can be read.
bool isHasty(const Tour& tour, const Interpreter& meaning, const State& state) {
  if (!state.waits) return false;
  const State next = meaning.waitOver(state);
  if (next.isOver) return false;
  const Look before = meaning.look(state);
  const Look later = meaning.look(next);
  for (std::size_t i = 0; i < tour.controls.size(); ++i) {
    const Reading& text = before.controls[i].reading;
    if (tour.controls[i].kind != ViewKind::textField || text == later.controls[i].reading) continue;
    if (before.controls[i].isShown && !isRead(text, meaning.waitOf(state)->seconds)) return true;
  }
  return false;
}

/// What a source asks for: the codes of errors and warnings that its script must or may have.
struct Asked {
  std::set<std::string> must{};  ///< at least one of them, if there are any
  std::set<std::string> may{};
};

Asked askedFor(const Generated& generated) {
  const Interpreter meaning(generated.tour);
  const Places& places = generated.places;
  const auto out = placesWithAWayOut(places);
  Asked asked;
  // No place is the end.
  if (out.empty()) asked.must = {"no-end"};
  // From some places users cannot come to the end: these lead only to each other, or nowhere.
  if (!out.empty() && out.size() != places.size()) asked.must = {"trap", "dead-end"};
  // There may also be places from which nothing leads anywhere.
  if (out.size() != places.size()) asked.may.insert("dead-end");
  // A wait is shorter than the time that its step takes to read.
  const auto isHastyPlace = [&](const auto& place) {
    return isHasty(generated.tour, meaning, place.first);
  };
  if (std::any_of(places.begin(), places.end(), isHastyPlace)) asked.may.insert("too-brief");
  asked.may.insert(asked.must.begin(), asked.must.end());
  return asked;
}

/// What the check should not say, or should have said.
std::string misjudged(const tools::steps::ScriptFile& opened, const Folder& folder,
                      const Asked& asked) {
  namespace check = tools::check;
  check::CheckOptions options;
  options.toolkit = tools::testToolkit();
  options.stage = opened.from->source.stage;
  options.resources = folder.path();
  const check::Verdict verdict = checkScript(opened.file, options, {});
  std::string words = verdict.explored.complete ? "" : "the check is not complete\n";
  bool isSaid = asked.must.empty();
  for (const check::Finding& finding : verdict.findings) {
    isSaid |= asked.must.contains(finding.code);
    if (finding.severity == check::Severity::note || asked.may.contains(finding.code)) continue;
    words += finding.message + " [" + finding.code + "]\n";
  }
  return isSaid ? words : words + "the check does not say [" + *asked.must.begin() + "]\n";
}

struct Totals {
  std::size_t places = 0;
  std::size_t moves = 0;
};

/// Walks through the source from a step.
std::string walk(const Generated& generated, const tools::steps::ScriptFile& opened,
                 const Folder& folder, const std::string& step, Totals& totals) {
  const BuiltSource built = builtOf(opened, folder);
  JointWalk walk(generated.tour, built, step);
  std::string wrong = walk.run();
  totals.places += walk.places();
  totals.moves += walk.moves();
  return wrong;
}

/// `start` is a number of a step.
std::string disagreement(const Generated& generated, std::size_t start, Totals& totals) {
  const Folder folder(generated);
  const auto& steps = generated.tour.steps;
  const std::string& first = steps.front().first;
  const std::string& other = steps[start % steps.size()].first;
  try {
    const auto opened = tools::steps::openScript(folder.source());
    std::string wrong = walk(generated, opened, folder, first, totals);
    if (wrong.empty()) wrong = misjudged(opened, folder, askedFor(generated));
    if (!wrong.empty() || other == first) return wrong;
    return walk(generated, tools::steps::openScript(folder.source(), other), folder, other, totals);
  } catch (const tools::Failure& failure) {
    return std::string("refused: ") + failure.what();
  }
}

/// Returns a source that goes wrong and lacks nothing without which it would not.
Generated smallest(Generated wrong, std::size_t start) {
  Dice dice(1);
  Totals ignored;
  for (bool isSmaller = true; isSmaller;) {
    isSmaller = false;
    for (const Tour& tour : smallerThan(wrong.tour)) {
      const auto smaller = sourceOf(tour, dice);
      if (!smaller) continue;
      const std::string why = disagreement(*smaller, start, ignored);
      if (why.empty() || why.starts_with("refused")) continue;
      wrong = *smaller;
      isSmaller = true;
      break;
    }
  }
  return wrong;
}

TEST(Meaning, OfGeneratedSourcesIsWhatTheirScriptsDo) {
  const std::uint64_t first = numberInEnvironment("QZ_FIRST_SEED", 1);
  const std::uint64_t count = numberInEnvironment("QZ_SOURCES", 200);
  std::size_t disagreements = 0;
  Totals totals;
  for (std::uint64_t seed = first; seed < first + count; ++seed) {
    const Generated generated = generate(seed);
    const std::size_t start = seed % 4;  // a quarter of the sources starts only with its first step
    const std::string wrong = disagreement(generated, start, totals);
    if (wrong.empty()) continue;
    const Generated small = getenv("QZ_NOSHRINK") ? generated : smallest(generated, start);
    ADD_FAILURE() << "seed " << seed << ": " << disagreement(small, start, totals) << "\n"
                  << small.yaml << small.window;
    if (++disagreements == mostDisagreements) break;
  }
  std::cout << count << " sources, " << totals.places << " places, " << totals.moves << " moves\n";
}

}  // namespace
}  // namespace qz::meaning
