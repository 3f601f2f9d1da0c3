/**
 * @file
 * Watches what the program asks of the operating system's mutexes, and has it refused.
 *
 * Linking it sends every call of pthread_mutex_lock() and pthread_mutex_unlock() in the program's
 * own code through here. Everything below concerns the calling thread alone.
 */
#ifndef TESTS_BD_MUTEXWATCH_H
#define TESTS_BD_MUTEXWATCH_H

#include <cstddef>

namespace bdmvtest
{

/** How often a mutex was locked so far, refusals included. */
std::size_t CountMutexLocks();

/** How often a mutex was unlocked so far, refusals included. */
std::size_t CountMutexUnlocks();

/** The mutex that was locked last. */
const void* LastMutexLocked();

/** Makes the next call of pthread_mutex_lock() do nothing but return @p error. */
void FailMutexLock(int error);

/** Makes the next call of pthread_mutex_unlock() do nothing but return @p error. */
void FailMutexUnlock(int error);

} // namespace bdmvtest

#endif
