// The broker's memory services (mft). Memory a provider gets here belongs
// to the request, like every object the broker hands out: `mark` and
// `release` free back to a point within the request, and the end of the
// request frees the rest.
#include "cmpi/Objects.h"
#include "core/ObjectManagerCore.h"

#include <cstddef>
#include <cstdlib>
#include <new>
#include <cstring>

namespace tvr::broker::detail {

namespace {

// A block of raw memory owned by an arena. The block's address is what the
// provider sees; the arena object is found again through a small header.
// The header keeps the data as aligned as malloc's.
struct MemoryBlock : ArenaObject {
  static constexpr std::size_t kHeader = alignof(std::max_align_t);
  explicit MemoryBlock(std::size_t size) : bytes(new (std::align_val_t(kHeader)) char[size + kHeader]()), size(size) {
    MemoryBlock* self = this;
    std::memcpy(bytes, &self, sizeof self);
  }
  ~MemoryBlock() override { ::operator delete[](bytes, std::align_val_t(kHeader)); }
  MemoryBlock(const MemoryBlock&) = delete;
  MemoryBlock& operator=(const MemoryBlock&) = delete;
  void* data() { return bytes + kHeader; }
  static MemoryBlock* of(void* data) {
    MemoryBlock* block = nullptr;
    std::memcpy(&block, static_cast<char*>(data) - kHeader, sizeof block);
    return block;
  }
  char* bytes;
  std::size_t size;
};

// The mark handed to the provider: where the arena stood.
struct Mark : ArenaObject {
  Arena* arena;
  std::size_t position;
  Mark(Arena* a, std::size_t p) : arena(a), position(p) {}
};

CMPIGcStat* mark(const CMPIBroker* mb, CMPIStatus* rc) {
  ObjectManagerCore* core = coreOf(mb);
  if (!core) return setStatus(rc, CMPI_RC_ERR_INVALID_HANDLE), nullptr;
  Arena& arena = arenaFor(core);
  const std::size_t position = arena.mark();
  setStatus(rc, CMPI_RC_OK);
  return arena.make<Mark>(&arena, position);
}

CMPIStatus release(const CMPIBroker* mb, const CMPIGcStat* gc) {
  if (!coreOf(mb) || !gc) return status(CMPI_RC_ERR_INVALID_HANDLE);
  const Mark* m = static_cast<const Mark*>(gc);
  m->arena->releaseSince(m->position); // frees the mark too: it was made after the position
  return status(CMPI_RC_OK);
}

void* cmpiMalloc(const CMPIBroker* mb, size_t size) {
  ObjectManagerCore* core = coreOf(mb);
  if (!core) return nullptr;
  return arenaFor(core).make<MemoryBlock>(size)->data();
}

void* cmpiCalloc(const CMPIBroker* mb, size_t count, size_t size) {
  if (size && count > static_cast<size_t>(-1) / size) return nullptr;
  return cmpiMalloc(mb, count * size); // blocks are zeroed when made
}

void* cmpiRealloc(const CMPIBroker* mb, void* ptr, size_t size) {
  if (!ptr) return cmpiMalloc(mb, size);
  MemoryBlock* old = MemoryBlock::of(ptr);
  void* fresh = cmpiMalloc(mb, size);
  if (!fresh) return nullptr;
  const std::size_t oldSize = old->size;
  std::memcpy(fresh, ptr, oldSize < size ? oldSize : size);
  Arena::release(old);
  return fresh;
}

char* cmpiStrDup(const CMPIBroker* mb, const char* s) {
  if (!s) return nullptr;
  const std::size_t n = std::strlen(s) + 1;
  char* out = static_cast<char*>(cmpiMalloc(mb, n));
  if (out) std::memcpy(out, s, n);
  return out;
}

void cmpiFree(const CMPIBroker*, void* ptr) {
  if (ptr) Arena::release(MemoryBlock::of(ptr));
}

template <class Object, class Cmpi> void freeObject(Cmpi* cmpi, Object* (*find)(const Cmpi*)) {
  if (Object* o = find(cmpi)) Arena::release(o);
}

void freeInstance(const CMPIBroker*, CMPIInstance* inst) { freeObject(inst, instanceOf); }
void freeObjectPath(const CMPIBroker*, CMPIObjectPath* obj) { freeObject(obj, pathOf); }
void freeArgs(const CMPIBroker*, CMPIArgs* args) { freeObject(args, argsOf); }
void freeString(const CMPIBroker*, CMPIString* str) { freeObject(str, stringOf); }
void freeArray(const CMPIBroker*, CMPIArray* array) { freeObject(array, arrayOf); }
void freeDateTime(const CMPIBroker*, CMPIDateTime* date) { freeObject(date, dateTimeOf); }
void freeSelectExp(const CMPIBroker*, CMPISelectExp*) {}

} // namespace

CMPIBrokerMemFT brokerMemFT = {
    CMPICurrentVersion, mark,         release,      cmpiMalloc, cmpiCalloc, cmpiRealloc, cmpiStrDup, cmpiFree,
    freeInstance,       freeObjectPath, freeArgs,   freeString, freeArray,  freeDateTime, freeSelectExp,
};

} // namespace tvr::broker::detail
