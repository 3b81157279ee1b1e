// RecursiveMutex.
//
// Built from a plain mutex and a condition rather than std::recursive_timed_mutex:
// the latter waits with pthread_mutex_clocklock, which the thread sanitizer of
// this tool chain does not see, so every lock would look like a race to it.

#include <zebcore/assert.h>
#include <zebcore/logging.h>
#include <zebcore/mutex.h>

#include <chrono>
#include <string>

namespace zebcore::threads {

RecursiveMutex::RecursiveMutex(const char* name) : name_(name ? name : "") {}

bool RecursiveMutex::Lock(const char* site, unsigned int milliseconds) {
  const std::thread::id self = std::this_thread::get_id();
  {
    std::unique_lock<std::mutex> lock(state_);
    if (depth_ > 0 && owner_ == self) {
      ++depth_;
      return true;
    }
    const auto deadline =
        std::chrono::steady_clock::now() + std::chrono::milliseconds(milliseconds);
    if (released_.wait_until(lock, deadline, [this] { return depth_ == 0; })) {
      owner_ = self;
      depth_ = 1;
      return true;
    }
  }
  if (logging::TraceEnabled("zebcore.Threads", 1)) {
    logging::Trace("zebcore.Threads", 1,
                   "RecursiveMutex '" + name_ + "': " + (site ? site : "(unnamed site)") +
                       " gave up waiting after " + std::to_string(milliseconds) + " ms");
  }
  return false;
}

void RecursiveMutex::Unlock() {
  {
    std::lock_guard<std::mutex> lock(state_);
    if (depth_ == 0 || owner_ != std::this_thread::get_id()) {
      debug::ReportAssertion("depth_ > 0 && owner_ == this thread",
                             "RecursiveMutex unlocked by a thread that does not hold it", __FILE__,
                             "zebcore::threads::RecursiveMutex::Unlock", __LINE__);
      return;
    }
    if (--depth_ > 0) return;
    owner_ = std::thread::id();
  }
  released_.notify_one();
}

}  // namespace zebcore::threads
