// SPDX-License-Identifier: MIT
// Texts that end where readable memory ends: a reader that looks past such a text crashes.
#pragma once

#include <gtest/gtest.h>
#include <sys/mman.h>
#include <unistd.h>

#include <algorithm>
#include <cstddef>
#include <string_view>

namespace qz {

/// A page of memory, followed by one that cannot be read.
class EndOfMemory {
 public:
  EndOfMemory() {
    // Both pages cannot be read at first, and the first one is then opened.
    void* pages = mmap(nullptr, 2 * size_, PROT_NONE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
    if (pages == MAP_FAILED) return;
    page_ = static_cast<char*>(pages);
    if (mprotect(page_, size_, PROT_READ | PROT_WRITE) != 0) ADD_FAILURE() << "no readable page";
  }
  EndOfMemory(const EndOfMemory&) = delete;
  EndOfMemory& operator=(const EndOfMemory&) = delete;
  ~EndOfMemory() {
    if (page_) munmap(page_, 2 * size_);
  }

  /// Returns a copy of `text`, which is at most a page, at the end of the page. Valid until the
  /// next call.
  std::string_view holding(std::string_view text) {
    EXPECT_TRUE(page_ && text.size() <= size_);
    if (!page_ || text.size() > size_) return {};
    char* const start = page_ + size_ - text.size();
    std::copy(text.begin(), text.end(), start);
    return {start, text.size()};
  }

 private:
  std::size_t size_ = static_cast<std::size_t>(sysconf(_SC_PAGESIZE));
  char* page_ = nullptr;
};

}  // namespace qz
