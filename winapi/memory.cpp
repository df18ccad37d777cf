// The global and the local heap: fixed blocks only, whose handle is their address.
#include <windows.h>

#include <cstdlib>
#include <cstring>
#include <new>

namespace {

// Each block carries its size in front of it, for GlobalSize.
struct BlockHead {
  alignas(std::max_align_t) SIZE_T bytes;
};

void *allocate(UINT flags, SIZE_T bytes) {
  constexpr UINT kMoveable = 0x0002; // GMEM_MOVEABLE and LMEM_MOVEABLE
  if ((flags & kMoveable) != 0 || bytes > static_cast<SIZE_T>(-1) - sizeof(BlockHead)) {
    return nullptr;
  }
  void *raw = (flags & GMEM_ZEROINIT) != 0 ? std::calloc(1, sizeof(BlockHead) + bytes)
                                           : std::malloc(sizeof(BlockHead) + bytes);
  if (raw == nullptr) {
    return nullptr;
  }
  auto *head = new (raw) BlockHead{bytes};
  return head + 1;
}

BlockHead *headOf(void *block) {
  return static_cast<BlockHead *>(block) - 1;
}

void release(void *block) {
  if (block != nullptr) {
    std::free(headOf(block));
  }
}

} // namespace

extern "C" {

HGLOBAL WINAPI GlobalAlloc(UINT flags, SIZE_T bytes) {
  return allocate(flags, bytes);
}

HGLOBAL WINAPI GlobalFree(HGLOBAL block) {
  release(block);
  return nullptr;
}

LPVOID WINAPI GlobalLock(HGLOBAL block) {
  return block;
}

BOOL WINAPI GlobalUnlock(HGLOBAL) {
  return FALSE;
} // a fixed block is never locked

SIZE_T WINAPI GlobalSize(HGLOBAL block) {
  return block == nullptr ? 0 : headOf(block)->bytes;
}

HLOCAL WINAPI LocalAlloc(UINT flags, SIZE_T bytes) {
  return allocate(flags, bytes);
}

HLOCAL WINAPI LocalFree(HLOCAL block) {
  release(block);
  return nullptr;
}

} // extern "C"
