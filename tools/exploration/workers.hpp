// SPDX-License-Identifier: MIT
// Threads that wait for work, because some work is too short to begin threads for it.
#pragma once

#include <condition_variable>
#include <cstddef>
#include <functional>
#include <mutex>
#include <thread>
#include <vector>

namespace qz::tools::check {

class Workers {
 public:
  using Work = std::function<void(std::size_t worker)>;

  explicit Workers(std::size_t count);
  ~Workers();
  Workers(const Workers&) = delete;
  Workers& operator=(const Workers&) = delete;

  std::size_t count() const { return threads_.size(); }
  /// Has each thread call `work` with its number, which begins at 0, and calls `meanwhile` in this
  /// thread. Returns when all calls have returned.
  void run(const Work& work, const std::function<void()>& meanwhile);

 private:
  void serve(std::size_t worker);

  std::mutex mutex_;
  std::condition_variable changed_;
  const Work* work_ = nullptr;
  std::size_t runs_ = 0;  // how often `run` was called
  std::size_t busy_ = 0;  // how many threads have not returned from `work_`
  bool isOver_ = false;
  std::vector<std::thread> threads_;  // the last field, because the threads use the others
};

}  // namespace qz::tools::check
