// SPDX-License-Identifier: MIT
// Texts that end where readable memory ends: a reader that looks past such a text crashes.
#pragma once

#include <gtest/gtest.h>

#if defined(_WIN32)
#include <windows.h>
#else
#include <sys/mman.h>
#include <unistd.h>
#endif

#include <algorithm>
#include <cstddef>
#include <string_view>

namespace qz {

/// Two pages of memory, of which only the first can be read.
#if defined(_WIN32)
inline std::size_t pageSize() {
  SYSTEM_INFO info = {};
  GetSystemInfo(&info);
  return info.dwPageSize;
}
inline char* makePages(std::size_t size) {
  void* const pages = VirtualAlloc(nullptr, 2 * size, MEM_RESERVE, PAGE_NOACCESS);
  return static_cast<char*>(VirtualAlloc(pages, size, MEM_COMMIT, PAGE_READWRITE));
}
inline void releasePages(char* pages, std::size_t) { VirtualFree(pages, 0, MEM_RELEASE); }
#else
inline std::size_t pageSize() { return static_cast<std::size_t>(sysconf(_SC_PAGESIZE)); }
inline char* makePages(std::size_t size) {
  void* const pages = mmap(nullptr, 2 * size, PROT_NONE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
  if (pages == MAP_FAILED) return nullptr;
  if (mprotect(pages, size, PROT_READ | PROT_WRITE) != 0) ADD_FAILURE() << "no readable page";
  return static_cast<char*>(pages);
}
inline void releasePages(char* pages, std::size_t size) { munmap(pages, 2 * size); }
#endif

/// A page of memory, followed by one that cannot be read.
class EndOfMemory {
 public:
  EndOfMemory() = default;
  EndOfMemory(const EndOfMemory&) = delete;
  EndOfMemory& operator=(const EndOfMemory&) = delete;
  ~EndOfMemory() {
    if (page_) releasePages(page_, size_);
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
  std::size_t size_ = pageSize();
  char* page_ = makePages(size_);
};

}  // namespace qz
