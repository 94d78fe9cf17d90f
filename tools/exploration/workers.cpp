// SPDX-License-Identifier: MIT
#include "tools/exploration/workers.hpp"

namespace qz::tools::check {

Workers::Workers(std::size_t count) {
  for (std::size_t i = 0; i < count; ++i) threads_.emplace_back([this, i] { serve(i); });
}

Workers::~Workers() {
  {
    const std::lock_guard lock(mutex_);
    isOver_ = true;
  }
  changed_.notify_all();
  for (std::thread& thread : threads_) thread.join();
}

void Workers::run(const Work& work, const std::function<void()>& meanwhile) {
  {
    const std::lock_guard lock(mutex_);
    work_ = &work;
    busy_ = threads_.size();
    ++runs_;
  }
  changed_.notify_all();
  meanwhile();
  std::unique_lock lock(mutex_);
  changed_.wait(lock, [this] { return busy_ == 0; });
}

void Workers::serve(std::size_t worker) {
  std::unique_lock lock(mutex_);
  for (std::size_t served = 0;; ++served) {
    changed_.wait(lock, [&] { return isOver_ || runs_ > served; });
    if (isOver_) return;
    const Work& work = *work_;
    lock.unlock();
    work(worker);
    lock.lock();
    if (--busy_ == 0) changed_.notify_all();
  }
}

}  // namespace qz::tools::check
