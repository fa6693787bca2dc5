// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/WorkInOrder.h"

#include <algorithm>
#include <condition_variable>
#include <exception>
#include <mutex>
#include <thread>
#include <vector>

namespace kelvasi {

namespace {

using Piece = std::function<void(std::size_t)>;

class Crew {
 public:
  Crew(std::size_t count, std::size_t workers, const Piece& work)
      : work_(work), ahead_(2 * workers), results_(count) {
    for (std::size_t worker = 0; worker < workers; ++worker) threads_.emplace_back([this] { workOn(); });
  }
  ~Crew() {
    {
      const std::lock_guard lock(mutex_);
      isEnding_ = true;
    }
    changed_.notify_all();
    for (std::thread& thread : threads_) thread.join();
  }
  Crew(const Crew&) = delete;
  Crew& operator=(const Crew&) = delete;

  void await(std::size_t piece) {
    std::unique_lock lock(mutex_);
    changed_.wait(lock, [&] { return results_[piece].isDone; });
    ++delivered_;
    changed_.notify_all();
    if (results_[piece].fault) std::rethrow_exception(results_[piece].fault);
  }

 private:
  struct Result {
    bool isDone = false;
    std::exception_ptr fault;
  };

  bool mayBegin() const { return next_ < delivered_ + ahead_; }

  void workOn() {
    std::unique_lock lock(mutex_);
    for (;;) {
      changed_.wait(lock, [this] { return isEnding_ || next_ == results_.size() || mayBegin(); });
      if (isEnding_ || next_ == results_.size()) return;
      const std::size_t piece = next_++;
      lock.unlock();
      std::exception_ptr fault;
      try {
        work_(piece);
      } catch (...) {
        fault = std::current_exception();
      }
      lock.lock();
      results_[piece] = {true, fault};
      changed_.notify_all();
    }
  }

  const Piece& work_;
  std::size_t ahead_;
  std::mutex mutex_;
  std::condition_variable changed_;
  std::vector<Result> results_;
  std::size_t next_ = 0;
  std::size_t delivered_ = 0;
  bool isEnding_ = false;
  std::vector<std::thread> threads_;
};

}  // namespace

void workInOrder(std::size_t count, std::size_t workers, const Piece& work, const Piece& deliver) {
  workers = std::min(workers, count);
  if (workers <= 1) {
    for (std::size_t piece = 0; piece < count; ++piece) {
      work(piece);
      deliver(piece);
    }
    return;
  }
  Crew crew(count, workers, work);
  for (std::size_t piece = 0; piece < count; ++piece) {
    crew.await(piece);
    deliver(piece);
  }
}

}  // namespace kelvasi
