// RefCountedObjectWithWeakPtr: the base of objects shared through
// boost::intrusive_ptr that can also be observed through a weak pointer.
//
//   class Clip : public zebcore::utility::RefCountedObjectWithWeakPtr { ... };
//   boost::intrusive_ptr<Clip> clip(new Clip);
//   zebcore::utility::WeakPtr<Clip> weak(clip.get());
//   if (boost::intrusive_ptr<Clip> again = weak.Lock()) { ... }   // null once destroyed
//
// The strong count starts at 0; the first intrusive_ptr takes it to 1 and the
// release of the last one deletes the object (through its virtual destructor).
// The counts live in a small control block that outlives the object while weak
// pointers remain, so WeakPtr::Lock is safe from any thread. All operations are
// thread-safe; the object itself is not made so.
#pragma once

#include <atomic>
#include <boost/intrusive_ptr.hpp>
#include <cstddef>
#include <utility>

namespace zebcore::utility {

namespace details {

// Strong and weak counts. The object owns one weak count of its own, dropped
// when it is destroyed; the block goes with the last weak count.
struct WeakControlBlock {
  std::atomic<std::size_t> strong{0};
  std::atomic<std::size_t> weak{1};

  void AddWeak() noexcept { weak.fetch_add(1, std::memory_order_relaxed); }
  void ReleaseWeak() noexcept {
    if (weak.fetch_sub(1, std::memory_order_acq_rel) == 1) delete this;
  }
  // Takes one strong count unless it is already 0 (the object is going).
  bool TryAddStrong() noexcept {
    std::size_t count = strong.load(std::memory_order_relaxed);
    while (count != 0) {
      if (strong.compare_exchange_weak(count, count + 1, std::memory_order_acq_rel,
                                       std::memory_order_relaxed)) {
        return true;
      }
    }
    return false;
  }
};

}  // namespace details

class RefCountedObjectWithWeakPtr {
 public:
  RefCountedObjectWithWeakPtr(const RefCountedObjectWithWeakPtr&) = delete;
  RefCountedObjectWithWeakPtr& operator=(const RefCountedObjectWithWeakPtr&) = delete;

  void AddRef() const noexcept { control_->strong.fetch_add(1, std::memory_order_relaxed); }
  // Drops one strong count; the last one deletes the object.
  void Release() const noexcept {
    if (control_->strong.fetch_sub(1, std::memory_order_acq_rel) == 1) delete this;
  }
  // The strong count (a snapshot; for diagnostics and tests).
  std::size_t UseCount() const noexcept { return control_->strong.load(std::memory_order_acquire); }

  friend void intrusive_ptr_add_ref(const RefCountedObjectWithWeakPtr* object) noexcept {
    object->AddRef();
  }
  friend void intrusive_ptr_release(const RefCountedObjectWithWeakPtr* object) noexcept {
    object->Release();
  }

 protected:
  RefCountedObjectWithWeakPtr() : control_(new details::WeakControlBlock()) {}
  virtual ~RefCountedObjectWithWeakPtr() { control_->ReleaseWeak(); }

 private:
  template <class T>
  friend class WeakPtr;
  details::WeakControlBlock* control_;
};

// A pointer that does not keep its object alive. Lock() gives a strong pointer
// while the object exists and null afterwards.
template <class T>
class WeakPtr {
 public:
  WeakPtr() noexcept = default;
  explicit WeakPtr(T* object) noexcept
      : object_(object), control_(object != nullptr ? object->control_ : nullptr) {
    if (control_ != nullptr) control_->AddWeak();
  }
  WeakPtr(const WeakPtr& other) noexcept : object_(other.object_), control_(other.control_) {
    if (control_ != nullptr) control_->AddWeak();
  }
  WeakPtr& operator=(const WeakPtr& other) noexcept {
    WeakPtr copy(other);
    std::swap(object_, copy.object_);
    std::swap(control_, copy.control_);
    return *this;
  }
  ~WeakPtr() {
    if (control_ != nullptr) control_->ReleaseWeak();
  }

  boost::intrusive_ptr<T> Lock() const noexcept {
    if (control_ == nullptr || !control_->TryAddStrong()) return {};
    return boost::intrusive_ptr<T>(object_, false);  // adopts the count just taken
  }
  bool Expired() const noexcept {
    return control_ == nullptr || control_->strong.load(std::memory_order_acquire) == 0;
  }

 private:
  T* object_ = nullptr;
  details::WeakControlBlock* control_ = nullptr;
};

}  // namespace zebcore::utility
