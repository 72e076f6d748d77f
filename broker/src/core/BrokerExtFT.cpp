// The broker's operating-system services (xft), on POSIX threads.
#include "cmpi/Objects.h"
#include "core/ObjectManagerCore.h"

#include <pthread.h>
#include <sched.h>
#include <time.h>

#include <cerrno>
#include <cstdlib>
#include <cstring>

namespace tvr::broker::detail {

namespace {

char* resolveFileName(const char* filename) {
  if (!filename) return nullptr;
  const std::string name = std::string("lib") + filename + ".so";
  char* out = static_cast<char*>(std::malloc(name.size() + 1));
  if (out) std::memcpy(out, name.c_str(), name.size() + 1);
  return out;
}

CMPI_THREAD_TYPE newThread(CMPI_THREAD_RETURN(CMPI_THREAD_CDECL* start)(void*), void* parm, int detached) {
  if (!start) return nullptr;
  pthread_t thread;
  pthread_attr_t attr;
  pthread_attr_init(&attr);
  if (detached) pthread_attr_setdetachstate(&attr, PTHREAD_CREATE_DETACHED);
  const int rc = pthread_create(&thread, &attr, start, parm);
  pthread_attr_destroy(&attr);
  if (rc != 0) return nullptr;
  return reinterpret_cast<CMPI_THREAD_TYPE>(thread);
}

int joinThread(CMPI_THREAD_TYPE thread, CMPI_THREAD_RETURN* retval) {
  if (!thread) return EINVAL;
  return pthread_join(reinterpret_cast<pthread_t>(thread), retval);
}

int exitThread(CMPI_THREAD_RETURN returnCode) { pthread_exit(returnCode); }

int cancelThread(CMPI_THREAD_TYPE thread) {
  if (!thread) return EINVAL;
  return pthread_cancel(reinterpret_cast<pthread_t>(thread));
}

int threadSleep(CMPIUint32 msec) {
  timespec ts{static_cast<time_t>(msec / 1000), static_cast<long>(msec % 1000) * 1000000L};
  while (nanosleep(&ts, &ts) != 0 && errno == EINTR) {
  }
  return 0;
}

int threadOnce(int* once, void (*init)(void)) {
  // The flag is the caller's int; a CAS makes the first caller run `init`.
  if (!once || !init) return EINVAL;
  int expected = 0;
  if (__atomic_compare_exchange_n(once, &expected, 1, false, __ATOMIC_ACQ_REL, __ATOMIC_ACQUIRE)) {
    init();
    __atomic_store_n(once, 2, __ATOMIC_RELEASE);
    return 0;
  }
  while (__atomic_load_n(once, __ATOMIC_ACQUIRE) != 2) sched_yield();
  return 0;
}

// The key variable is the caller's 8-byte key; pthread keys are smaller.
int createThreadKey(CMPI_THREAD_KEY_TYPE* key, void (*cleanup)(void*)) {
  if (!key) return EINVAL;
  pthread_key_t k;
  const int rc = pthread_key_create(&k, cleanup);
  if (rc == 0) *key = static_cast<CMPI_THREAD_KEY_TYPE>(k);
  return rc;
}

int destroyThreadKey(CMPI_THREAD_KEY_TYPE key) { return pthread_key_delete(static_cast<pthread_key_t>(key)); }

void* getThreadSpecific(CMPI_THREAD_KEY_TYPE key) { return pthread_getspecific(static_cast<pthread_key_t>(key)); }

int setThreadSpecific(CMPI_THREAD_KEY_TYPE key, void* value) {
  return pthread_setspecific(static_cast<pthread_key_t>(key), value);
}

CMPI_MUTEX_TYPE newMutex(int) {
  auto* m = static_cast<pthread_mutex_t*>(std::malloc(sizeof(pthread_mutex_t)));
  if (!m) return nullptr;
  pthread_mutexattr_t attr;
  pthread_mutexattr_init(&attr);
  pthread_mutexattr_settype(&attr, PTHREAD_MUTEX_RECURSIVE);
  pthread_mutex_init(m, &attr);
  pthread_mutexattr_destroy(&attr);
  return m;
}

void destroyMutex(CMPI_MUTEX_TYPE mutex) {
  if (!mutex) return;
  pthread_mutex_destroy(static_cast<pthread_mutex_t*>(mutex));
  std::free(mutex);
}

void lockMutex(CMPI_MUTEX_TYPE mutex) {
  if (mutex) pthread_mutex_lock(static_cast<pthread_mutex_t*>(mutex));
}

void unlockMutex(CMPI_MUTEX_TYPE mutex) {
  if (mutex) pthread_mutex_unlock(static_cast<pthread_mutex_t*>(mutex));
}

CMPI_COND_TYPE newCondition(int) {
  auto* c = static_cast<pthread_cond_t*>(std::malloc(sizeof(pthread_cond_t)));
  if (c) pthread_cond_init(c, nullptr);
  return c;
}

void destroyCondition(CMPI_COND_TYPE cond) {
  if (!cond) return;
  pthread_cond_destroy(static_cast<pthread_cond_t*>(cond));
  std::free(cond);
}

int condWait(CMPI_COND_TYPE cond, CMPI_MUTEX_TYPE mutex) {
  if (!cond || !mutex) return EINVAL;
  return pthread_cond_wait(static_cast<pthread_cond_t*>(cond), static_cast<pthread_mutex_t*>(mutex));
}

int timedCondWait(CMPI_COND_TYPE cond, CMPI_MUTEX_TYPE mutex, struct timespec* wait) {
  if (!cond || !mutex || !wait) return EINVAL;
  return pthread_cond_timedwait(static_cast<pthread_cond_t*>(cond), static_cast<pthread_mutex_t*>(mutex), wait);
}

int signalCondition(CMPI_COND_TYPE cond) {
  if (!cond) return EINVAL;
  return pthread_cond_signal(static_cast<pthread_cond_t*>(cond));
}

} // namespace

CMPIBrokerExtFT brokerExtFT = {
    CMPICurrentVersion, resolveFileName, newThread,   joinThread,      exitThread,       cancelThread,
    threadSleep,        threadOnce,      createThreadKey, destroyThreadKey, getThreadSpecific, setThreadSpecific,
    newMutex,           destroyMutex,    lockMutex,   unlockMutex,     newCondition,     destroyCondition,
    condWait,           timedCondWait,   signalCondition,
};

} // namespace tvr::broker::detail
