/**
 * @file
 * Counts the program's calls of the operating system's mutex functions, and can make them fail.
 *
 * Linking it sends every call of pthread_mutex_lock() and pthread_mutex_unlock() in the program's
 * own code through here. All functions below concern the calling thread alone.
 */
#ifndef TESTS_BD_MUTEXWATCH_H
#define TESTS_BD_MUTEXWATCH_H

#include <cstddef>

namespace bdmvtest
{

/** The number of lock calls so far, failed ones included. */
std::size_t CountMutexLocks();

/** The number of unlock calls so far, failed ones included. */
std::size_t CountMutexUnlocks();

/** The mutex that was locked last. */
const void* LastMutexLocked();

/** Makes the next call of pthread_mutex_lock() do nothing but return @p error. */
void FailMutexLock(int error);

/** Makes the next call of pthread_mutex_unlock() do nothing but return @p error. */
void FailMutexUnlock(int error);

} // namespace bdmvtest

#endif
