// STLAllocator and RecycledMemory
//
// STLAllocator is the allocator every string and container of the family uses.
// It is a thin, stateless allocator over the global operator new, so two
// instances always compare equal and containers may exchange storage freely.
//
// RecycledMemory is a shared, resizable block of bytes (for example the bytes of
// an ICC profile). It is handed around by std::shared_ptr; copies of the pointer
// share the bytes.
#pragma once

#include <zebcore/export.h>

#include <cstddef>
#include <memory>
#include <new>
#include <vector>

namespace zebcore::allocator {

template <class T>
class STLAllocator {
 public:
  using value_type = T;

  STLAllocator() noexcept = default;
  template <class U>
  constexpr STLAllocator(const STLAllocator<U>&) noexcept {}  // NOLINT: rebinding

  [[nodiscard]] T* allocate(std::size_t n) { return std::allocator<T>().allocate(n); }
  void deallocate(T* p, std::size_t n) noexcept { std::allocator<T>().deallocate(p, n); }

  template <class U>
  friend constexpr bool operator==(const STLAllocator&, const STLAllocator<U>&) noexcept {
    return true;
  }
  template <class U>
  friend constexpr bool operator!=(const STLAllocator&, const STLAllocator<U>&) noexcept {
    return false;
  }
};

// A block of bytes that owners share through std::shared_ptr.
//
//   auto block = RecycledMemory::Create(0);
//   block->Allocate(16);               // 16 zero bytes
//   std::memcpy(block->GetData(), src, 16);
class ZEBCORE_API RecycledMemory {
 public:
  // A new block of `size` zero bytes.
  static std::shared_ptr<RecycledMemory> Create(std::size_t size);

  explicit RecycledMemory(std::size_t size) : bytes_(size) {}

  // Resizes the block to `size` bytes; new bytes are zero. Returns the data.
  unsigned char* Allocate(std::size_t size);

  // The bytes, or null for a block of 0 bytes.
  unsigned char* GetData() noexcept { return bytes_.empty() ? nullptr : bytes_.data(); }
  const unsigned char* GetData() const noexcept { return bytes_.empty() ? nullptr : bytes_.data(); }
  std::size_t GetSize() const noexcept { return bytes_.size(); }

 private:
  std::vector<unsigned char, STLAllocator<unsigned char>> bytes_;
};

}  // namespace zebcore::allocator
