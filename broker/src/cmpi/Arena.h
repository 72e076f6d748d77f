// Per-request ownership of everything the broker hands to providers.
//
// Real object managers free what a provider obtained from the broker when
// the request ends, so a provider that releases nothing leaks nothing. The
// embedded object manager does the same: every encapsulated object lives in
// the arena of the request that was running on the thread when it was made,
// and the arena frees it when the request ends (or earlier, on CMRelease).
#pragma once

#include <cstddef>
#include <functional>
#include <memory>
#include <mutex>
#include <utility>
#include <vector>

namespace tvr::broker {
struct TraceLine;
}

namespace tvr::broker::detail {

class Arena;
class ObjectManagerCore;

/// Base of every object an arena owns.
class ArenaObject {
public:
  virtual ~ArenaObject() = default;

private:
  friend class Arena;
  Arena* owner_ = nullptr;
  std::size_t slot_ = 0;
};

class Arena {
public:
  Arena() = default;
  Arena(const Arena&) = delete;
  Arena& operator=(const Arena&) = delete;
  ~Arena();

  /// Creates an object owned by this arena.
  template <class T, class... Args> T* make(Args&&... args) {
    auto object = std::make_unique<T>(std::forward<Args>(args)...);
    T* raw = object.get();
    adopt(std::move(object));
    return raw;
  }

  /// Frees one object now (CMRelease). Objects of other arenas are freed
  /// by their own arena; an unknown object is ignored.
  static void release(ArenaObject* object);

  /// The number of objects made so far: a mark that `releaseSince` can free back to.
  std::size_t mark() const;
  /// Frees every object made after `mark`.
  void releaseSince(std::size_t mark);
  /// How many objects are alive, for tests of memory ownership.
  std::size_t liveObjects() const;

private:
  void adopt(std::unique_ptr<ArenaObject> object);
  void releaseOne(ArenaObject* object);

  mutable std::mutex mutex_;
  std::vector<std::unique_ptr<ArenaObject>> objects_;
  std::size_t live_ = 0;
};

/// Where a request's broker trace calls go: kept in its answer, shown to
/// an observer, or both.
struct TraceSink {
  std::vector<TraceLine>* kept = nullptr;
  const std::function<void(const TraceLine&)>* observer = nullptr;

  void add(TraceLine line);
};

/// What the thread is working on: the request whose arena new objects go
/// to, and where broker trace calls are recorded.
struct RequestFrame {
  Arena* arena = nullptr;
  TraceSink* traces = nullptr;
  ObjectManagerCore* core = nullptr;
  int depth = 0; ///< nesting of up-calls
};

/// The frame of the innermost request running on this thread, or null.
RequestFrame* currentFrame();

/// Makes `frame` the current one for its lifetime, restoring the former.
class FrameScope {
public:
  explicit FrameScope(RequestFrame* frame);
  ~FrameScope();
  FrameScope(const FrameScope&) = delete;
  FrameScope& operator=(const FrameScope&) = delete;

private:
  RequestFrame* previous_;
};

/// The arena objects go to on this thread: the current request's, or, with
/// no request running, the long-lived arena of the object manager `core`
/// (or of the process, when `core` is null).
Arena& arenaFor(ObjectManagerCore* core);

} // namespace tvr::broker::detail
