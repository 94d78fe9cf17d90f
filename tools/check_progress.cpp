// SPDX-License-Identifier: MIT
#include "tools/check_progress.hpp"

#include <signal.h>  // NOLINT(modernize-deprecated-headers): the standard one has no sigaction
#include <unistd.h>

#include <atomic>
#include <iostream>

#include "tools/support/text_layout.hpp"

namespace qz::tools {
namespace {

constexpr const char* clearLine = "\r\x1b[K";

std::atomic<bool> interrupted = false;

extern "C" void noteInterruption(int) { interrupted = true; }

std::string perSecond(std::size_t places, double seconds) {
  return std::to_string(static_cast<std::size_t>(static_cast<double>(places) / seconds));
}

}  // namespace

ProgressLine::ProgressLine() : isOn_(::isatty(STDERR_FILENO) != 0) {}

ProgressLine::~ProgressLine() {
  if (isShown_) std::cerr << clearLine << std::flush;
}

/// Whether the line is to be written now.
bool ProgressLine::isDue() {
  using namespace std::chrono_literals;
  const auto now = Clock::now();
  if (!isOn_ || now - began_ < 1s || now - shown_ < 200ms) return false;
  shown_ = now;
  isShown_ = true;
  return true;
}

void ProgressLine::show(const std::string& script, const check::Progress& progress) {
  const std::lock_guard lock(mutex_);
  if (!isDue()) return;
  const double seconds = std::chrono::duration<double>(shown_ - began_).count();
  std::cerr << clearLine << oneLine(script) << ": " << progress.places << " places, "
            << perSecond(progress.places, seconds) << " a second, " << progress.frontier
            << " to go on from; Ctrl-C stops" << std::flush;
}

void ProgressLine::show(const std::string& what, std::size_t done, std::size_t all,
                        const std::string& noun) {
  const std::lock_guard lock(mutex_);
  if (!isDue()) return;
  std::cerr << clearLine << what << ' ' << done << " of " << all << ' ' << noun << std::flush;
}

Interruption::Interruption() {
  interrupted = false;
  struct sigaction action = {};
  action.sa_handler = noteInterruption;
  action.sa_flags = static_cast<int>(SA_RESETHAND);
  ::sigaction(SIGINT, &action, nullptr);
}

Interruption::~Interruption() { ::signal(SIGINT, SIG_DFL); }

bool Interruption::isWanted() { return interrupted; }

}  // namespace qz::tools
