// RecursiveMutex.

#include <zebcore/logging.h>
#include <zebcore/mutex.h>

#include <chrono>
#include <string>

namespace zebcore::threads {

RecursiveMutex::RecursiveMutex(const char* name) : name_(name ? name : "") {}

bool RecursiveMutex::Lock(const char* site, unsigned int milliseconds) {
  if (mutex_.try_lock_for(std::chrono::milliseconds(milliseconds))) return true;
  if (logging::TraceEnabled("zebcore.Threads", 1)) {
    logging::Trace("zebcore.Threads", 1,
                   "RecursiveMutex '" + name_ + "': " + (site ? site : "(unnamed site)") +
                       " gave up waiting after " + std::to_string(milliseconds) + " ms");
  }
  return false;
}

void RecursiveMutex::Unlock() { mutex_.unlock(); }

}  // namespace zebcore::threads
