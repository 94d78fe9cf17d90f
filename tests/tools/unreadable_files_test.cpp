// SPDX-License-Identifier: MIT
// Files that exist but cannot be read. Sockets stand for them, because they refuse every user.
#include <gtest/gtest.h>
#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>

#include <cstring>
#include <string>

#include "play_files.hpp"
#include "tool_run.hpp"
#include "tools/commands.hpp"
#include "tools/support/input_file.hpp"

namespace qz::tools {
namespace {

/// Makes a file that no user can open.
void makeSocket(const std::string& name) {
  const int made = ::socket(AF_UNIX, SOCK_STREAM, 0);
  ASSERT_GE(made, 0);
  sockaddr_un address{};
  address.sun_family = AF_UNIX;
  name.copy(address.sun_path, sizeof address.sun_path - 1);
  EXPECT_EQ(::bind(made, reinterpret_cast<const sockaddr*>(&address), sizeof address), 0);
  ::close(made);
}

const std::string reason = std::strerror(ENXIO);

TEST(UnreadableFiles, AreRefusedAsPropertyLists) {
  const play::WorkingDirectory directory;
  makeSocket("script.plist");
  try {
    const InputFile file("script.plist", "a script");
    FAIL() << "accepted";
  } catch (const Failure& failure) {
    EXPECT_EQ(failure.status(), ExitStatus::badInput);
    EXPECT_EQ(failure.what(), "script.plist: cannot be read (" + reason + "); expected a script");
  }
}

TEST(UnreadableFiles, AreRefusedAsScenarios) {
  const play::WorkingDirectory directory;
  makeSocket("one.walk");
  const Result result = run(testCommand, {"test", "one.walk"});
  EXPECT_EQ(result.status, static_cast<int>(ExitStatus::badInput));
  EXPECT_EQ(result.out, "");
  EXPECT_EQ(result.err, "one.walk: cannot be read (" + reason + ")\n");
}

}  // namespace
}  // namespace qz::tools
