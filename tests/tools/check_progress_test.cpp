// SPDX-License-Identifier: MIT
// What a long check says meanwhile: nothing unless a terminal reads it, and nothing in the first
// second.
#include "tools/check_progress.hpp"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <unistd.h>

#include <chrono>
#include <csignal>
#include <cstdlib>
#include <iostream>
#include <thread>

#include "tool_run.hpp"

namespace qz::tools {
namespace {

/// Makes a file descriptor standard error while this object lives.
class ErrorReplacement {
 public:
  explicit ErrorReplacement(int descriptor) : before_(::dup(STDERR_FILENO)) {
    ::dup2(descriptor, STDERR_FILENO);
    ::close(descriptor);
  }
  ~ErrorReplacement() {
    ::dup2(before_, STDERR_FILENO);
    ::close(before_);
  }
  ErrorReplacement(const ErrorReplacement&) = delete;
  ErrorReplacement& operator=(const ErrorReplacement&) = delete;

 private:
  int before_;
};

/// Makes standard error a terminal while this object lives.
class ErrorTerminal {
 public:
  ErrorTerminal() : master_(::posix_openpt(O_RDWR | O_NOCTTY)), error_(openTerminal()) {}
  ~ErrorTerminal() { ::close(master_); }
  ErrorTerminal(const ErrorTerminal&) = delete;
  ErrorTerminal& operator=(const ErrorTerminal&) = delete;

 private:
  int openTerminal() const {
    ::grantpt(master_);
    ::unlockpt(master_);
    return ::open(::ptsname(master_), O_RDWR | O_NOCTTY);
  }

  int master_;
  ErrorReplacement error_;
};

using Clock = std::chrono::steady_clock;

/// Shows the progress until something is written, or for this time. Returns how long it took.
Clock::duration showUntilWritten(ProgressLine& line, const Captured& error, Clock::duration most) {
  const auto began = Clock::now();
  while (error.text().empty() && Clock::now() - began < most) {
    line.show("a\x1b.plist", {1000, 20});
    std::this_thread::yield();
  }
  return Clock::now() - began;
}

TEST(CheckProgress, AppearsAfterASecondAndDisappears) {
  const ErrorTerminal terminal;
  const Captured error(std::cerr);
  {
    ProgressLine line;
    const auto taken = showUntilWritten(line, error, std::chrono::seconds(5));
    EXPECT_GE(taken, std::chrono::milliseconds(990));
    EXPECT_NE(error.text().find("a\\u{1b}.plist: 1000 places, "), std::string::npos)
        << error.text();
    EXPECT_NE(error.text().find("20 to go on from"), std::string::npos) << error.text();
    std::this_thread::sleep_for(std::chrono::milliseconds(200));
    line.show("drawing", 3, 9, "pictures");
    EXPECT_TRUE(error.text().ends_with("\r\x1b[Kdrawing 3 of 9 pictures")) << error.text();
  }
  EXPECT_TRUE(error.text().ends_with("\r\x1b[K")) << error.text();
  EXPECT_EQ(error.text().find('\n'), std::string::npos);
}

TEST(CheckProgress, LeavesNothingBehindAfterShortWork) {
  const ErrorTerminal terminal;
  const Captured error(std::cerr);
  {
    ProgressLine line;
    line.show("a.plist", {1, 1});
  }
  EXPECT_EQ(error.text(), "");
}

TEST(CheckProgress, IsOnlyForTerminals) {
  const ErrorReplacement file(::open("/dev/null", O_WRONLY));
  const Captured error(std::cerr);
  ProgressLine line;
  showUntilWritten(line, error, std::chrono::milliseconds(1100));
  EXPECT_EQ(error.text(), "");
}

TEST(CheckInterruption, IsWantedOnceTheUserInterrupts) {
  const Interruption interruption;
  EXPECT_FALSE(Interruption::isWanted());
  std::raise(SIGINT);
  EXPECT_TRUE(Interruption::isWanted());
}

TEST(CheckInterruption, IsForgottenByTheNextWork) {
  {
    const Interruption interruption;
    std::raise(SIGINT);
  }
  const Interruption interruption;
  EXPECT_FALSE(Interruption::isWanted());
}

TEST(CheckInterruptionDeathTest, EndsTheProgramTheSecondTime) {
  const Interruption interruption;
  std::raise(SIGINT);
  EXPECT_EXIT(std::raise(SIGINT), testing::KilledBySignal(SIGINT), "");
}

}  // namespace
}  // namespace qz::tools
