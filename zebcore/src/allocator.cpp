// RecycledMemory.

#include <zebcore/allocator.h>

namespace zebcore::allocator {

std::shared_ptr<RecycledMemory> RecycledMemory::Create(std::size_t size) {
  return std::make_shared<RecycledMemory>(size);
}

unsigned char* RecycledMemory::Allocate(std::size_t size) {
  bytes_.resize(size);
  return GetData();
}

}  // namespace zebcore::allocator
