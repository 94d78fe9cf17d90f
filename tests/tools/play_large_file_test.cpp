// SPDX-License-Identifier: MIT
// A file for which there is not enough memory. Left out where a process's memory cannot be limited:
// other systems ignore the limit, and the sanitizers themselves need more than it allows.
#if defined(__linux__) && !defined(__SANITIZE_ADDRESS__) && !defined(__SANITIZE_THREAD__)

#include <gtest/gtest.h>
#include <sys/resource.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <string>

#include "play_files.hpp"
#include "tools/support/input_file.hpp"

namespace qz::tools::play {
namespace {

constexpr rlim_t mebibyte = 1U << 20;

/// Lets the process take no more than 64 MiB of memory while this object lives.
class ScarceMemory {
 public:
  ScarceMemory() {
    ::getrlimit(RLIMIT_AS, &before_);
    std::size_t pages = 0;
    std::ifstream("/proc/self/statm") >> pages;
    const rlim_t most = pages * static_cast<rlim_t>(::sysconf(_SC_PAGESIZE)) + 64 * mebibyte;
    const rlimit limit{std::min(most, before_.rlim_max), before_.rlim_max};
    ::setrlimit(RLIMIT_AS, &limit);
  }
  ~ScarceMemory() { ::setrlimit(RLIMIT_AS, &before_); }
  ScarceMemory(const ScarceMemory&) = delete;
  ScarceMemory& operator=(const ScarceMemory&) = delete;

 private:
  rlimit before_{};
};

TEST(PlayLargeFile, IsRefusedIfItNeedsMoreMemoryThanThereIs) {
  const WorkingDirectory directory;
  directory.write("script.plist", "");
  std::filesystem::resize_file("script.plist", 512 * mebibyte);
  const ScarceMemory scarce;
  try {
    const InputFile file("script.plist", "a script", ExitStatus::failed);
    FAIL() << "accepted";
  } catch (const Failure& failure) {
    EXPECT_EQ(failure.status(), ExitStatus::failed);
    EXPECT_STREQ(failure.what(),
                 "script.plist: needs more memory than there is; expected a script");
  }
}

}  // namespace
}  // namespace qz::tools::play

#endif
