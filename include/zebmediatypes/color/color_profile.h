// ColorProfile
//
// A named colour profile with optional profile bytes (for example an ICC
// profile). A plain record: read and set the fields directly. Copying shares
// the byte block (the bytes are not duplicated); moving leaves the source's
// block null.
//
//   ColorProfile p;
//   p.colorProfileName = zebcore::string::ToUTF8String("BT.709 RGB Full");
//   zebcore::utility::Guid id = p.ToGuid();   // same content, same id, every run
#pragma once

#include <zebcore/allocator.h>
#include <zebcore/guid.h>
#include <zebcore/string.h>
#include <zebmediatypes/export.h>

#include <boost/operators.hpp>
#include <memory>

namespace zebmediatypes {

struct ZEBMEDIATYPES_API ColorProfile : boost::totally_ordered<ColorProfile> {
  // UTF-8 name; empty by default.
  zebcore::UTF8String colorProfileName;
  // The profile bytes; null by default. A block of 0 bytes is not null.
  std::shared_ptr<zebcore::allocator::RecycledMemory> colorProfileData;
  // The memo of ToGuid(); the null Guid until the first ToGuid() of a
  // non-empty profile. It is copied with the record and NOT cleared when a
  // field changes afterwards: set it back to Guid() (or build a new record)
  // to have a changed profile identified afresh.
  mutable zebcore::utility::Guid cachedGuid;

  // True when there is no byte block and the name is empty.
  bool empty() const noexcept;

  // The content identifier: the null Guid for an empty profile (memo left
  // alone); else the memo if set; else the Murmur3 hash of "ZEBColorProfile",
  // the name's bytes and the profile bytes, stored in the memo. Zero bytes of
  // data feed nothing, so a 0-byte block hashes like no block. Writes the memo:
  // not to be called on one object from two threads at once.
  zebcore::utility::Guid ToGuid() const;

  // Compare the name, then the block (none orders before any), then its bytes.
  // The memo takes no part.
  friend ZEBMEDIATYPES_API bool operator==(const ColorProfile& a, const ColorProfile& b) noexcept;
  friend ZEBMEDIATYPES_API bool operator<(const ColorProfile& a, const ColorProfile& b) noexcept;
};

}  // namespace zebmediatypes
