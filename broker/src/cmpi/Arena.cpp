#include "cmpi/Arena.h"

#include "core/ObjectManagerCore.h"
#include "tvr/broker/Response.h"

namespace tvr::broker::detail {

namespace {
thread_local RequestFrame* tCurrentFrame = nullptr;
}

Arena::~Arena() {
  // Free newest first: later objects may refer to earlier ones.
  while (!objects_.empty()) objects_.pop_back();
}

void Arena::adopt(std::unique_ptr<ArenaObject> object) {
  std::lock_guard<std::mutex> lock(mutex_);
  object->owner_ = this;
  object->slot_ = objects_.size();
  objects_.push_back(std::move(object));
  ++live_;
}

void Arena::release(ArenaObject* object) {
  if (object && object->owner_) object->owner_->releaseOne(object);
}

void Arena::releaseOne(ArenaObject* object) {
  std::unique_ptr<ArenaObject> doomed;
  {
    std::lock_guard<std::mutex> lock(mutex_);
    const std::size_t slot = object->slot_;
    if (slot >= objects_.size() || objects_[slot].get() != object) return;
    doomed = std::move(objects_[slot]);
    --live_;
  }
}

std::size_t Arena::mark() const {
  std::lock_guard<std::mutex> lock(mutex_);
  return objects_.size();
}

void Arena::releaseSince(std::size_t mark) {
  std::vector<std::unique_ptr<ArenaObject>> doomed;
  {
    std::lock_guard<std::mutex> lock(mutex_);
    while (objects_.size() > mark) {
      if (objects_.back()) {
        doomed.push_back(std::move(objects_.back()));
        --live_;
      }
      objects_.pop_back();
    }
  }
}

std::size_t Arena::liveObjects() const {
  std::lock_guard<std::mutex> lock(mutex_);
  return live_;
}

void TraceSink::add(TraceLine line) {
  if (observer && *observer) (*observer)(line);
  if (kept) kept->push_back(std::move(line));
}

RequestFrame* currentFrame() { return tCurrentFrame; }

FrameScope::FrameScope(RequestFrame* frame) : previous_(tCurrentFrame) { tCurrentFrame = frame; }

FrameScope::~FrameScope() { tCurrentFrame = previous_; }

Arena& arenaFor(ObjectManagerCore* core) {
  if (RequestFrame* frame = currentFrame(); frame && frame->arena) return *frame->arena;
  if (core) return core->longLivedArena();
  // Objects made outside any request and without a known object manager
  // (e.g. a clone of a string kept by a provider) live until the process ends.
  static Arena* processArena = new Arena();
  return *processArena;
}

} // namespace tvr::broker::detail
