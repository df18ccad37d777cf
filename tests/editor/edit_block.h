// Edit structures for tests: blocks of an exact number of bytes, so the sanitizer reports
// any access past them, written and read byte by byte at the stored offsets.
#ifndef MORVEX_TESTS_EDITOR_EDIT_BLOCK_H
#define MORVEX_TESTS_EDITOR_EDIT_BLOCK_H

#include "host/contract.h"

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <memory>
#include <string>
#include <vector>

namespace morvex::tests {

inline constexpr std::size_t kSizeOffset = 0;
inline constexpr std::size_t kVersionOffset = 8;
inline constexpr std::size_t kVerifyOffset = 29;
inline constexpr std::size_t kLoopOffset = 30;
inline constexpr std::size_t kFunctionCountOffset = 32;
inline constexpr std::size_t kMemberCountOffset = 36;
inline constexpr std::size_t kFirstNameOffset = 40;

class EditBlock {
public:
  // A block of exactly `bytes` bytes, each holding `fill`.
  explicit EditBlock(std::size_t bytes = host::kMaxEditStructureSize, unsigned char fill = 0)
      : bytes_(new unsigned char[bytes]), size_(bytes) {
    std::memset(bytes_.get(), fill, bytes);
  }

  // A block of `bytes` bytes holding the given lists as a host stores them: the size
  // field, the version, the counts, then the names.
  static EditBlock holding(const std::vector<std::string> &functions,
                           const std::vector<std::string> &members,
                           std::size_t bytes = host::kMaxEditStructureSize,
                           std::uint32_t version = host::kEditVersion) {
    EditBlock block(bytes);
    block.putU32(kSizeOffset, static_cast<std::uint32_t>(
                                  host::editStructureSize(functions.size(), members.size())));
    block.putU32(kVersionOffset, version);
    block.putU32(kFunctionCountOffset, static_cast<std::uint32_t>(functions.size()));
    block.putU32(kMemberCountOffset, static_cast<std::uint32_t>(members.size()));
    std::size_t entry = 0;
    for (const std::string &name : functions) {
      block.putName(entry++, name);
    }
    for (const std::string &name : members) {
      block.putName(entry++, name);
    }
    return block;
  }

  host::EditStructure &edit() { return *reinterpret_cast<host::EditStructure *>(bytes_.get()); }
  unsigned char *bytes() { return bytes_.get(); }
  std::size_t size() const { return size_; }
  std::vector<unsigned char> snapshot() const {
    return std::vector<unsigned char>(bytes_.get(), bytes_.get() + size_);
  }

  std::uint32_t u32(std::size_t offset) const {
    const unsigned char *at = bytes_.get() + offset;
    return static_cast<std::uint32_t>(at[0] | at[1] << 8 | at[2] << 16) |
           static_cast<std::uint32_t>(at[3]) << 24;
  }
  std::int32_t i32(std::size_t offset) const { return static_cast<std::int32_t>(u32(offset)); }
  void putU32(std::size_t offset, std::uint32_t value) {
    for (std::size_t i = 0; i < 4; ++i) {
      bytes_[offset + i] = static_cast<unsigned char>(value >> (8 * i));
    }
  }

  static std::size_t entryOffset(std::size_t entry) {
    return kFirstNameOffset + entry * host::kNameEntrySize;
  }
  // Writes the name's bytes and a zero into entry `entry`, counted across both lists.
  void putName(std::size_t entry, const std::string &name) {
    std::memcpy(bytes_.get() + entryOffset(entry), name.c_str(), name.size() + 1);
  }
  // The text of entry `entry` up to its zero (the zero must lie within the entry).
  std::string name(std::size_t entry) const {
    const char *at = reinterpret_cast<const char *>(bytes_.get() + entryOffset(entry));
    return std::string(at, strnlen(at, host::kNameEntrySize));
  }
  // The lists as the counts of the block give them.
  std::vector<std::string> functionNames() const {
    return names(0, static_cast<std::size_t>(i32(kFunctionCountOffset)));
  }
  std::vector<std::string> memberNames() const {
    return names(static_cast<std::size_t>(i32(kFunctionCountOffset)),
                 static_cast<std::size_t>(i32(kMemberCountOffset)));
  }

private:
  std::vector<std::string> names(std::size_t first, std::size_t count) const {
    std::vector<std::string> result;
    for (std::size_t i = 0; i < count; ++i) {
      result.push_back(name(first + i));
    }
    return result;
  }

  std::unique_ptr<unsigned char[]> bytes_;
  std::size_t size_;
};

// "name0", "name1", ... as many as asked.
inline std::vector<std::string> numberedNames(const std::string &stem, std::size_t count) {
  std::vector<std::string> names;
  for (std::size_t i = 0; i < count; ++i) {
    names.push_back(stem + std::to_string(i));
  }
  return names;
}

} // namespace morvex::tests

#endif
