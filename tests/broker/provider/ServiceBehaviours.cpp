// Behaviours that use the broker's operating-system services (xft) and
// memory services (mft), reporting what they observed as properties.
#include "Behaviours.h"

#include <atomic>
#include <cstddef>
#include <cerrno>
#include <cstdint>
#include <cstring>
#include <ctime>

namespace tvrtest {

namespace {

CMPIInstance* reportInstance(const Request& request, const char* className) {
  CMPIObjectPath* path = CMNewObjectPath(request.broker, nameSpaceOf(request.path).c_str(), className, nullptr);
  return CMNewInstance(request.broker, path, nullptr);
}

void setBoolean(CMPIInstance* inst, const char* name, bool value) {
  CMPIBoolean b = value ? 1 : 0;
  CMSetProperty(inst, name, &b, CMPI_boolean);
}

void setNumber(CMPIInstance* inst, const char* name, CMPISint32 value) {
  CMSetProperty(inst, name, &value, CMPI_sint32);
}

// --- threads -----------------------------------------------------------------

constexpr int kWorkers = 3;

std::atomic<int> onceRuns{0};
void runOnce() { ++onceRuns; }

struct Shared {
  const CMPIBroker* broker;
  CMPI_MUTEX_TYPE mutex;
  CMPI_COND_TYPE arrived;
  CMPI_THREAD_KEY_TYPE key;
  int once;
  int count;
  bool workerKeysStartedEmpty;
  bool workerKeysKeptOwnValue;
};

struct Worker {
  Shared* shared;
  intptr_t index;
};

CMPI_THREAD_RETURN CMPI_THREAD_CDECL workerMain(void* parm) {
  Worker* self = static_cast<Worker*>(parm);
  Shared* s = self->shared;
  const CMPIBrokerExtFT* xft = s->broker->xft;
  const bool startedEmpty = xft->getThreadSpecific(s->key) == nullptr;
  xft->setThreadSpecific(s->key, self);
  xft->threadOnce(&s->once, runOnce);
  xft->threadSleep(1);
  const bool keptOwn = xft->getThreadSpecific(s->key) == self;
  xft->lockMutex(s->mutex);
  s->workerKeysStartedEmpty = s->workerKeysStartedEmpty && startedEmpty;
  s->workerKeysKeptOwnValue = s->workerKeysKeptOwnValue && keptOwn;
  ++s->count;
  xft->signalCondition(s->arrived);
  xft->unlockMutex(s->mutex);
  return reinterpret_cast<void*>(100 + self->index);
}

// --- objects made outside any request ----------------------------------------

struct HelperObjects {
  const CMPIBroker* broker = nullptr;
  CMPIString* string = nullptr;
  CMPIObjectPath* path = nullptr;
  CMPIArray* array = nullptr;
};
HelperObjects helperObjects;

CMPI_THREAD_RETURN CMPI_THREAD_CDECL makeHelperObjects(void* parm) {
  HelperObjects* h = static_cast<HelperObjects*>(parm);
  h->string = CMNewString(h->broker, "made on a helper thread", nullptr);
  h->path = CMNewObjectPath(h->broker, "root/tvrtest", "TVR_HelperThread", nullptr);
  h->array = CMNewArray(h->broker, 2, CMPI_uint8, nullptr);
  return nullptr;
}

} // namespace

CMPIStatus answerWithThreadServices(const Request& request) {
  const CMPIBrokerExtFT* xft = request.broker->xft;
  Shared shared{request.broker, xft->newMutex(0), xft->newCondition(0), 0, 0, 0, true, true};
  const int keyRc = xft->createThreadKey(&shared.key, nullptr);
  static const char mainValue[] = "main";
  xft->setThreadSpecific(shared.key, const_cast<char*>(mainValue));
  const int runsBefore = onceRuns.load();

  Worker workers[kWorkers];
  CMPI_THREAD_TYPE threads[kWorkers];
  for (int i = 0; i < kWorkers; ++i) {
    workers[i] = Worker{&shared, i};
    threads[i] = xft->newThread(workerMain, &workers[i], 0);
  }
  // The mutex is recursive: a second lock on the same thread does not block.
  xft->lockMutex(shared.mutex);
  xft->lockMutex(shared.mutex);
  xft->unlockMutex(shared.mutex);
  while (shared.count < kWorkers) xft->condWait(shared.arrived, shared.mutex);
  xft->unlockMutex(shared.mutex);

  timespec deadline{};
  clock_gettime(CLOCK_REALTIME, &deadline);
  deadline.tv_nsec += 5 * 1000 * 1000;
  if (deadline.tv_nsec >= 1000000000L) {
    deadline.tv_sec += 1;
    deadline.tv_nsec -= 1000000000L;
  }
  xft->lockMutex(shared.mutex);
  const int timedWaitRc = xft->timedCondWait(shared.arrived, shared.mutex, &deadline);
  xft->unlockMutex(shared.mutex);

  intptr_t joinedSum = 0;
  int joinRc = 0;
  for (int i = 0; i < kWorkers; ++i) {
    void* value = nullptr;
    joinRc |= xft->joinThread(threads[i], &value);
    joinedSum += reinterpret_cast<intptr_t>(value);
  }
  const bool mainKeptOwnValue = xft->getThreadSpecific(shared.key) == mainValue;
  const int destroyKeyRc = xft->destroyThreadKey(shared.key);
  xft->destroyCondition(shared.arrived);
  xft->destroyMutex(shared.mutex);

  CMPIInstance* inst = reportInstance(request, "TVR_Threads");
  setNumber(inst, "CreateKeyRc", keyRc);
  setNumber(inst, "Arrived", shared.count);
  setNumber(inst, "JoinRc", joinRc);
  setNumber(inst, "JoinedSum", static_cast<CMPISint32>(joinedSum));
  setNumber(inst, "OnceRuns", onceRuns.load() - runsBefore);
  setNumber(inst, "TimedWaitRc", timedWaitRc);
  setBoolean(inst, "TimedWaitTimedOut", timedWaitRc == ETIMEDOUT);
  setBoolean(inst, "WorkerKeysStartedEmpty", shared.workerKeysStartedEmpty);
  setBoolean(inst, "WorkerKeysKeptOwnValue", shared.workerKeysKeptOwnValue);
  setBoolean(inst, "MainKeyKeptOwnValue", mainKeptOwnValue);
  setNumber(inst, "DestroyKeyRc", destroyKeyRc);
  CMReturnInstance(request.result, inst);
  CMReturnDone(request.result);
  return ok();
}

CMPIStatus answerWithMemoryServices(const Request& request) {
  const CMPIBroker* b = request.broker;
  const CMPIBrokerMemFT* mft = b->mft;

  char* block = static_cast<char*>(mft->cmpiMalloc(b, 100));
  const bool aligned = reinterpret_cast<uintptr_t>(block) % alignof(std::max_align_t) == 0;
  std::strcpy(block, "kept across realloc");
  char* grown = static_cast<char*>(mft->cmpiRealloc(b, block, 64 * 1024));
  const bool reallocKept = grown && std::strcmp(grown, "kept across realloc") == 0;

  const unsigned char* zeroed = static_cast<unsigned char*>(mft->cmpiCalloc(b, 64, 16));
  bool callocZeroed = zeroed != nullptr;
  for (int i = 0; zeroed && i < 64 * 16; ++i) callocZeroed = callocZeroed && zeroed[i] == 0;

  char* copy = mft->cmpiStrDup(b, "duplicate me");
  const bool strDupEqual = copy && std::strcmp(copy, "duplicate me") == 0;
  mft->cmpiFree(b, copy);
  mft->cmpiFree(b, grown);

  CMPIStatus markRc = {CMPI_RC_OK, nullptr};
  CMPIGcStat* mark = mft->mark(b, &markRc);
  for (int i = 0; i < 10; ++i) CMNewString(b, "made after the mark", nullptr);
  mft->cmpiMalloc(b, 4096);
  const CMPIStatus releaseRc = mft->release(b, mark);

  CMPIInstance* inst = reportInstance(request, "TVR_Memory");
  setBoolean(inst, "MallocAligned", aligned);
  setBoolean(inst, "ReallocKeptContent", reallocKept);
  setBoolean(inst, "CallocZeroed", callocZeroed);
  setBoolean(inst, "StrDupEqual", strDupEqual);
  setNumber(inst, "MarkRc", markRc.rc);
  setNumber(inst, "ReleaseRc", releaseRc.rc);
  CMReturnInstance(request.result, inst);
  CMReturnDone(request.result);
  return ok();
}

// Objects of 64 KiB each, so the heap shows them clearly.
CMPIStatus answerWithBulkObjects(const Request& request) {
  constexpr int kStrings = 256;
  const CMPIBroker* b = request.broker;
  const std::string action = keyText(request.path, "Action");
  const std::string text(64 * 1024, 'x');

  CMPIGcStat* mark = action == "mark" ? b->mft->mark(b, nullptr) : nullptr;
  CMPIString* strings[kStrings];
  for (CMPIString*& s : strings) s = CMNewString(b, text.c_str(), nullptr);
  void* block = b->mft->cmpiMalloc(b, 8 * 1024 * 1024);
  returnText(request.result, "made");

  if (action == "release") {
    for (CMPIString* s : strings) CMRelease(s);
    b->mft->cmpiFree(b, block);
  } else if (action == "mark") {
    b->mft->release(b, mark);
  } else if (action != "keep") {
    return failure(b, CMPI_RC_ERR_INVALID_PARAMETER, "unknown action " + action);
  }
  returnText(request.result, "released");
  CMReturnDone(request.result);
  return ok();
}

CMPIStatus answerByReleasingObjects(const Request& request) {
  const CMPIBroker* b = request.broker;
  const CMPIResult* r = request.result;
  CMPIObjectPath* path = CMNewObjectPath(b, nameSpaceOf(request.path).c_str(), "TVR_Release", nullptr);
  CMPIInstance* inst = CMNewInstance(b, path, nullptr);
  CMSetProperty(inst, "Text", "property text", CMPI_chars);
  CMPIData property = CMGetProperty(inst, "Text", nullptr);
  CMPIObjectPath* echo = CMNewObjectPath(b, nameSpaceOf(request.path).c_str(), "TVR_Echo", nullptr);
  CMPIEnumeration* found = CBEnumInstanceNames(b, request.context, echo, nullptr);

  returnStatus(r, "instance", CMRelease(inst).rc);
  returnStatus(r, "path", CMRelease(path).rc);
  returnStatus(r, "string", CMRelease(CMNewString(b, "released", nullptr)).rc);
  returnStatus(r, "string from property", CMRelease(property.value.string).rc);
  returnStatus(r, "array", CMRelease(CMNewArray(b, 4, CMPI_sint32, nullptr)).rc);
  returnStatus(r, "dateTime", CMRelease(CMNewDateTime(b, nullptr)).rc);
  returnStatus(r, "args", CMRelease(CMNewArgs(b, nullptr)).rc);
  returnStatus(r, "context clone", CMRelease(CMClone(request.context, nullptr)).rc);
  if (found) returnStatus(r, "enumeration", CMRelease(found).rc);
  // The mft's free functions release the same way.
  b->mft->freeInstance(b, CMNewInstance(b, request.path, nullptr));
  b->mft->freeObjectPath(b, CMClone(request.path, nullptr));
  b->mft->freeString(b, CMNewString(b, "freed", nullptr));
  b->mft->freeArray(b, CMNewArray(b, 1, CMPI_boolean, nullptr));
  b->mft->freeDateTime(b, CMNewDateTime(b, nullptr));
  b->mft->freeArgs(b, CMNewArgs(b, nullptr));
  CMReturnDone(r);
  return ok();
}

CMPIStatus answerWithHelperThreadObjects(const Request& request) {
  const CMPIBroker* b = request.broker;
  const std::string action = keyText(request.path, "Action");
  if (action == "make") {
    helperObjects.broker = b;
    CMPI_THREAD_TYPE thread = b->xft->newThread(makeHelperObjects, &helperObjects, 0);
    b->xft->joinThread(thread, nullptr);
    returnText(request.result, "made " + shapeOf(helperObjects.string) + " " + shapeOf(helperObjects.path) + " " +
                                   shapeOf(helperObjects.array));
  } else if (action == "release") {
    returnStatus(request.result, "string", CMRelease(helperObjects.string).rc);
    returnStatus(request.result, "path", CMRelease(helperObjects.path).rc);
    returnStatus(request.result, "array", CMRelease(helperObjects.array).rc);
    forgetHelperThreadObjects();
  } else {
    return failure(b, CMPI_RC_ERR_INVALID_PARAMETER, "unknown action " + action);
  }
  CMReturnDone(request.result);
  return ok();
}

void forgetHelperThreadObjects() { helperObjects = HelperObjects{}; }

} // namespace tvrtest
