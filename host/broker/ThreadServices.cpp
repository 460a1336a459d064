// The broker's threads, mutexes and conditions are POSIX ones. Handles of threads, mutexes and
// conditions belong to the provider, which destroys or joins them.

#include <pthread.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <ctime>
#include <memory>
#include <mutex>
#include <string>

#include "host/broker/BrokerTables.h"

namespace Corvcim {
namespace {

// "name" to "libname.so", in memory that the caller frees.
char* resolveFileName(const char* name) {
  return name != nullptr ? strdup(("lib" + std::string(name) + ".so").c_str()) : nullptr;
}

void* newThread(CMPIThreadFunc function, void* argument, int detached) {
  pthread_t thread{};
  if (function == nullptr || pthread_create(&thread, nullptr, function, argument) != 0) {
    return nullptr;
  }
  if (detached != 0) {
    pthread_detach(thread);
  }
  static_assert(sizeof(pthread_t) <= sizeof(void*));
  void* handle = nullptr;
  std::memcpy(&handle, &thread, sizeof thread);
  return handle;
}

pthread_t threadOf(void* handle) {
  pthread_t thread{};
  std::memcpy(&thread, &handle, sizeof thread);
  return thread;
}

int joinThread(void* thread, void** result) {
  return thread != nullptr ? pthread_join(threadOf(thread), result) : EINVAL;
}

int exitThread(void* result) {
  pthread_exit(result);
}

int cancelThread(void* thread) {
  return thread != nullptr ? pthread_cancel(threadOf(thread)) : EINVAL;
}

int threadSleep(CMPIUint32 milliseconds) {
  constexpr CMPIUint32 millisecondsPerSecond = 1000;
  constexpr long nanosecondsPerMillisecond = 1000000;
  timespec left = {static_cast<time_t>(milliseconds / millisecondsPerSecond),
                   static_cast<long>(milliseconds % millisecondsPerSecond) * nanosecondsPerMillisecond};
  while (nanosleep(&left, &left) != 0) {
    if (errno != EINTR) {
      return errno;
    }
  }
  return 0;
}

// The flag is the provider's: 0 before, 1 after. One mutex for all of them keeps it simple.
int threadOnce(int* done, CMPIThreadOnceFunc function) {
  static std::recursive_mutex mutex;
  if (done == nullptr || function == nullptr) {
    return EINVAL;
  }
  const std::lock_guard lock(mutex);
  if (*done == 0) {
    *done = 1;
    function();
  }
  return 0;
}

int createThreadKey(unsigned int* key, CMPIThreadKeyCleanupFunc cleanup) {
  if (key == nullptr) {
    return EINVAL;
  }
  pthread_key_t created{};
  const int error = pthread_key_create(&created, cleanup);
  *key = created;
  return error;
}

int destroyThreadKey(unsigned int key) {
  return pthread_key_delete(key);
}

void* getThreadSpecific(unsigned int key) {
  return pthread_getspecific(key);
}

int setThreadSpecific(unsigned int key, void* value) {
  return pthread_setspecific(key, value);
}

void* newMutex(int /*options*/) {
  auto mutex = std::make_unique<pthread_mutex_t>();
  return pthread_mutex_init(mutex.get(), nullptr) == 0 ? mutex.release() : nullptr;
}

void destroyMutex(void* mutex) {
  const std::unique_ptr<pthread_mutex_t> owned(static_cast<pthread_mutex_t*>(mutex));
  if (owned != nullptr) {
    pthread_mutex_destroy(owned.get());
  }
}

void lockMutex(void* mutex) {
  if (mutex != nullptr) {
    pthread_mutex_lock(static_cast<pthread_mutex_t*>(mutex));
  }
}

void unlockMutex(void* mutex) {
  if (mutex != nullptr) {
    pthread_mutex_unlock(static_cast<pthread_mutex_t*>(mutex));
  }
}

void* newCondition(int /*options*/) {
  auto condition = std::make_unique<pthread_cond_t>();
  return pthread_cond_init(condition.get(), nullptr) == 0 ? condition.release() : nullptr;
}

void destroyCondition(void* condition) {
  const std::unique_ptr<pthread_cond_t> owned(static_cast<pthread_cond_t*>(condition));
  if (owned != nullptr) {
    pthread_cond_destroy(owned.get());
  }
}

int condWait(void* condition, void* mutex) {
  if (condition == nullptr || mutex == nullptr) {
    return EINVAL;
  }
  return pthread_cond_wait(static_cast<pthread_cond_t*>(condition), static_cast<pthread_mutex_t*>(mutex));
}

int timedCondWait(void* condition, void* mutex, struct timespec* until) {
  if (condition == nullptr || mutex == nullptr || until == nullptr) {
    return EINVAL;
  }
  return pthread_cond_timedwait(static_cast<pthread_cond_t*>(condition), static_cast<pthread_mutex_t*>(mutex), until);
}

int signalCondition(void* condition) {
  return condition != nullptr ? pthread_cond_signal(static_cast<pthread_cond_t*>(condition)) : EINVAL;
}

}  // namespace

const CMPIBrokerExtFT threadServices = {
    CMPI_VERSION, resolveFileName, newThread,       joinThread,       exitThread,        cancelThread,
    threadSleep,  threadOnce,      createThreadKey, destroyThreadKey, getThreadSpecific, setThreadSpecific,
    newMutex,     destroyMutex,    lockMutex,       unlockMutex,      newCondition,      destroyCondition,
    condWait,     timedCondWait,   signalCondition,
};

}  // namespace Corvcim
