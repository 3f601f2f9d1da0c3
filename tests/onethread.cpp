// Part of each test program that is marked SINGLE_THREADED in CMakeLists.txt. It replaces the C
// library's function, so that none of its tests can start a thread.
#include <cstdio>
#include <cstdlib>

#include <pthread.h>

extern "C" int pthread_create(pthread_t*, const pthread_attr_t*, void* (*)(void*), void*)
{
    std::fputs("A test marked SINGLE_THREADED starts a thread.\n", stderr);
    std::abort();
}
