// SPDX-License-Identifier: MIT
// Playing on a terminal: the transcript has its width and, unless the user wants none, colours.
#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/ioctl.h>
#include <unistd.h>

#include <cstdlib>
#include <iostream>
#include <string>

#include "play_files.hpp"
#include "tool_run.hpp"
#include "tools/commands.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools {
namespace {

/// Makes standard output a terminal of some width in columns while this object lives.
class OutputTerminal {
 public:
  explicit OutputTerminal(unsigned short columns)
      : master_(::posix_openpt(O_RDWR | O_NOCTTY)), before_(::dup(STDOUT_FILENO)) {
    std::cout.flush();
    ::grantpt(master_);
    ::unlockpt(master_);
    const int terminal = ::open(::ptsname(master_), O_RDWR | O_NOCTTY);
    const winsize size{24, columns, 0, 0};
    ::ioctl(terminal, TIOCSWINSZ, &size);
    ::dup2(terminal, STDOUT_FILENO);
    ::close(terminal);
  }
  ~OutputTerminal() {
    ::dup2(before_, STDOUT_FILENO);
    ::close(before_);
    ::close(master_);
  }
  OutputTerminal(const OutputTerminal&) = delete;
  OutputTerminal& operator=(const OutputTerminal&) = delete;

 private:
  int master_;
  int before_;
};

class PlayOnTerminal : public testing::Test {
 protected:
  void SetUp() override {
    directory_.write("script.plist", "{ 1 = ((DISABLE_OBJECT_WITH_ID, 2)); 2 = (); }");
    ::unsetenv("NO_COLOR");
  }
  void TearDown() override { ::unsetenv("NO_COLOR"); }

  /// Returns the transcript on a terminal of that width.
  static std::string transcript(unsigned short columns) {
    const OutputTerminal terminal(columns);
    return run(playCommand, {"play", "script.plist", "--toolkit", "memory", "--advance", "1"}).out;
  }

  play::WorkingDirectory directory_;
};

bool hasColor(const std::string& text) { return text.find('\x1b') != std::string::npos; }

/// Returns the width of the first line, which is a heading that fills the line.
std::size_t widthOf(const std::string& transcript) {
  return displayWidth(transcript.substr(0, transcript.find('\n')));
}

TEST_F(PlayOnTerminal, ShowsColoursUnlessTheUserWantsNone) {
  EXPECT_TRUE(hasColor(transcript(80)));
  ::setenv("NO_COLOR", "", 1);
  EXPECT_TRUE(hasColor(transcript(80))) << "an empty value means nothing";
  ::setenv("NO_COLOR", "1", 1);
  EXPECT_FALSE(hasColor(transcript(80)));
}

TEST_F(PlayOnTerminal, IsAsWideAsTheTerminalWithinLimits) {
  ::setenv("NO_COLOR", "1", 1);
  const struct {
    unsigned short columns;
    std::size_t width;
  } cases[] = {{100, 100}, {72, 72}, {20, 72}, {1000, 140}, {0, 100}};
  for (const auto& test : cases) {
    EXPECT_EQ(widthOf(transcript(test.columns)), test.width) << test.columns;
  }
}

}  // namespace
}  // namespace qz::tools
