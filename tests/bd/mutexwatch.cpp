#include "mutexwatch.h"

#include <pthread.h>

#include <utility>

// The linker's --wrap gives the calls these names.
extern "C" {
int __real_pthread_mutex_lock(pthread_mutex_t* mutex);
int __real_pthread_mutex_unlock(pthread_mutex_t* mutex);
int __wrap_pthread_mutex_lock(pthread_mutex_t* mutex);
int __wrap_pthread_mutex_unlock(pthread_mutex_t* mutex);
}

namespace
{

thread_local std::size_t locks = 0;
thread_local std::size_t unlocks = 0;
thread_local const void* lastLocked = nullptr;
thread_local int nextLockError = 0;
thread_local int nextUnlockError = 0;

} // namespace

int __wrap_pthread_mutex_lock(pthread_mutex_t* mutex)
{
    ++locks;
    if (nextLockError != 0) {
        return std::exchange(nextLockError, 0);
    }
    lastLocked = mutex;
    return __real_pthread_mutex_lock(mutex);
}

int __wrap_pthread_mutex_unlock(pthread_mutex_t* mutex)
{
    ++unlocks;
    if (nextUnlockError != 0) {
        return std::exchange(nextUnlockError, 0);
    }
    return __real_pthread_mutex_unlock(mutex);
}

namespace bdmvtest
{

std::size_t CountMutexLocks()
{
    return locks;
}

std::size_t CountMutexUnlocks()
{
    return unlocks;
}

const void* LastMutexLocked()
{
    return lastLocked;
}

void FailMutexLock(int error)
{
    nextLockError = error;
}

void FailMutexUnlock(int error)
{
    nextUnlockError = error;
}

} // namespace bdmvtest
