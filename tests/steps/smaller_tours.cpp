// SPDX-License-Identifier: MIT
// Leaves out one thing at a time, the largest ones first.
#include "tests/steps/smaller_tours.hpp"

#include <functional>
#include <utility>

namespace qz::meaning {

namespace {

using PartOf = std::function<Part&(Tour&)>;

class Smaller {
 public:
  explicit Smaller(Tour tour) : tour_(std::move(tour)) {}

  std::vector<Tour> all() {
    for (std::size_t i = 1; i < tour_.steps.size(); ++i)
      without([&](Tour& t) { removeStep(t, i); });
    for (std::size_t i = 0; i < tour_.controls.size(); ++i) {
      without([&](Tour& t) { removeControl(t, i); });
    }
    if (tour_.backOver) without([](Tour& t) { t.backOver.reset(); });
    leaveOutOf([](Tour& t) -> Part& { return t.everyStep; });
    for (const auto& fragment : tour_.fragments) {
      leaveOutOf([&](Tour& t) -> Part& { return t.fragments.at(fragment.first); });
    }
    for (std::size_t i = 0; i < tour_.steps.size(); ++i) {
      leaveOutOf([i](Tour& t) -> Part& { return t.steps[i].second; });
    }
    for (std::size_t i = 0; i < tour_.controls.size(); ++i) simplify(i);
    return smaller_;
  }

 private:
  template <class Change>
  void without(const Change& change) {
    Tour tour = tour_;
    change(tour);
    smaller_.push_back(tour);
  }

  static void forEachPart(Tour& tour, const std::function<void(Part&)>& change) {
    change(tour.everyStep);
    for (auto& [name, part] : tour.fragments) change(part);
    for (auto& [name, part] : tour.steps) change(part);
  }

  /// What led to the step leads to the end.
  static void removeStep(Tour& tour, std::size_t step) {
    const std::string name = tour.steps[step].first;
    tour.steps.erase(tour.steps.begin() + static_cast<std::ptrdiff_t>(step));
    forEachPart(tour, [&](Part& part) {
      if (part.like == name) part.like = "";
      if (part.wait && part.wait->go == name) part.wait->go = "end";
      for (auto& [control, words] : part.controls) {
        if (words.press && words.press->ends_with(name)) words.press = "end";
      }
      for (Use& use : part.uses) {
        for (auto& [parameter, value] : use.arguments) value = value == name ? "end" : value;
      }
    });
  }

  static void removeControl(Tour& tour, std::size_t control) {
    forEachPart(tour, [&](Part& part) { part.controls.erase(tour.controls[control].name); });
    tour.controls.erase(tour.controls.begin() + static_cast<std::ptrdiff_t>(control));
  }

  void leaveOutOf(const PartOf& partOf) {
    Part part = partOf(tour_);
    for (const auto& control : part.controls) {
      without([&](Tour& t) { partOf(t).controls.erase(control.first); });
    }
    for (std::size_t i = 0; i < part.uses.size(); ++i) {
      without([&](Tour& t) {
        partOf(t).uses.erase(partOf(t).uses.begin() + static_cast<std::ptrdiff_t>(i));
      });
    }
    if (!part.like.empty()) without([&](Tour& t) { partOf(t).like = ""; });
    leaveOutOptions(partOf);
    for (const auto& control : part.controls) {
      leaveOutOptions([&](Tour& t) -> Words& { return partOf(t).controls.at(control.first); });
    }
  }

  /// Leaves out each option of what `of` finds in a tour.
  template <class Of>
  void leaveOutOptions(const Of& of) {
    constexpr auto count = std::tuple_size_v<decltype(of(tour_).options())>;
    for (std::size_t i = 0; i < count; ++i) {
      bool isSaid = false;
      Tour tour = tour_;
      std::size_t place = 0;
      const auto leaveOut = [&](auto& option) {
        if (place++ != i) return;
        isSaid = option.has_value();
        option.reset();
      };
      std::apply([&](auto&... option) { (leaveOut(option), ...); }, of(tour).options());
      if (isSaid) smaller_.push_back(tour);
    }
  }

  void simplify(std::size_t control) {
    const HostControl& host = tour_.controls[control];
    HostControl simple{host.name, host.kind, host.tag};
    const auto with = [&](auto member) {
      if (host.*member == simple.*member) return;
      without([&](Tour& t) { t.controls[control].*member = simple.*member; });
    };
    with(&HostControl::caption);
    with(&HostControl::toolTip);
    with(&HostControl::isShown);
    with(&HostControl::isEnabled);
    with(&HostControl::state);
  }

  Tour tour_;
  std::vector<Tour> smaller_{};
};

}  // namespace

std::vector<Tour> smallerThan(const Tour& tour) { return Smaller(tour).all(); }

}  // namespace qz::meaning
