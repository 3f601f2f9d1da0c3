#include "bd/threadmutex.h"

#include <system_error>

#include "kevro/kevro_osa.h"

namespace bd
{

namespace
{

[[noreturn]] void Throw(int error, const char* what)
{
    throw std::system_error(error, std::generic_category(), what);
}

} // namespace

void ThreadMutex::ThrowHeldAlready()
{
    Throw(static_cast<int>(std::errc::resource_deadlock_would_occur),
          "bd::ThreadMutex: the calling thread holds it already");
}

void ThreadMutex::ThrowRefused(int error)
{
    Throw(error, "bd::ThreadMutex: not acquired");
}

void ThreadMutex::ReportNotHeld()
{
    Assert("the calling thread holds the mutex it releases", __FILE__, __LINE__);
}

void ThreadMutex::ReportNotReleased()
{
    Assert("pthread_mutex_unlock(&m_Mutex) == 0", __FILE__, __LINE__);
}

} // namespace bd
