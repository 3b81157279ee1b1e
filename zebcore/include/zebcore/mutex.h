// RecursiveMutex: a recursive mutex whose Lock waits a bounded time.
//
//   RecursiveLockGuard guard(mutex, "zebmediatypes::Initialize", 60000);
//   if (!guard) return;   // not had within 60 s: the body must not run
#pragma once

#include <zebcore/export.h>

#include <condition_variable>
#include <cstddef>
#include <mutex>
#include <string>
#include <thread>

namespace zebcore::threads {

class ZEBCORE_API RecursiveMutex {
 public:
  // `name` names the mutex in diagnostics; null is allowed.
  explicit RecursiveMutex(const char* name = nullptr);
  RecursiveMutex(const RecursiveMutex&) = delete;
  RecursiveMutex& operator=(const RecursiveMutex&) = delete;

  // Waits up to `milliseconds` for the lock. True when it is held (once more,
  // for a thread that held it already); false when the wait ran out, in which
  // case it is not held and Unlock must not be called. `site` (null allowed)
  // names the caller in the trace of a timed-out wait (category
  // "zebcore.Threads", level 1).
  bool Lock(const char* site, unsigned int milliseconds);
  // Releases one hold. Only the holding thread may call it; any other call is
  // reported as a contract breach and changes nothing.
  void Unlock();

  const std::string& Name() const noexcept { return name_; }

 private:
  // The owner and depth, guarded by a plain mutex; waiters sleep on the
  // condition until the depth drops to zero.
  std::mutex state_;
  std::condition_variable released_;
  std::thread::id owner_;
  std::size_t depth_ = 0;
  std::string name_;
};

// Holds a RecursiveMutex for a scope, if it could be had.
class RecursiveLockGuard {
 public:
  RecursiveLockGuard(RecursiveMutex& mutex, const char* site, unsigned int milliseconds)
      : mutex_(mutex), held_(mutex.Lock(site, milliseconds)) {}
  ~RecursiveLockGuard() {
    if (held_) mutex_.Unlock();
  }
  RecursiveLockGuard(const RecursiveLockGuard&) = delete;
  RecursiveLockGuard& operator=(const RecursiveLockGuard&) = delete;

  bool Held() const noexcept { return held_; }
  explicit operator bool() const noexcept { return held_; }

 private:
  RecursiveMutex& mutex_;
  bool held_;
};

}  // namespace zebcore::threads
