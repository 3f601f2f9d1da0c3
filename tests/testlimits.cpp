// Limits of every test program, so that a test which never ends fails and is named: CPU time,
// because an endless loop need not call anything that a test could count, and the size of files,
// because such a loop may write. Programs that a test starts inherit the latter.

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/time.h>
#include <unistd.h>

#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <string>

namespace
{

/** CPU time of one test, with all its threads. The longest test takes less than a tenth of it. */
constexpr int Seconds = BDMVNAVIGATOR_SECONDS_OF_A_TEST;

/** In bytes. Many times what a test writes, but small for a disk. */
constexpr rlim_t LargestFile = rlim_t{64} << 20;

/** Signal handlers may not compose text, and a test may have redirected standard error. */
char test[256];
int standardError = -1;

template <std::size_t Size> void Write(const char (&text)[Size])
{
    static_cast<void>(!write(standardError, text, Size - 1));
}

void EndTest()
{
    static_cast<void>(!write(standardError, test, std::char_traits<char>::length(test)));
    Write("\n");
    _exit(EXIT_FAILURE);
}

extern "C" void OnTimeUsedUp(int)
{
    Write("\nended: used up the CPU time of a test, so it may never end: ");
    EndTest();
}

extern "C" void OnFileTooLarge(int)
{
    Write("\nended: exceeded the file size of a test: ");
    EndTest();
}

class Limits : public testing::EmptyTestEventListener
{
public:
    Limits()
    {
        standardError = fcntl(STDERR_FILENO, F_DUPFD_CLOEXEC, 0);
        std::signal(SIGPROF, OnTimeUsedUp);
        std::signal(SIGXFSZ, OnFileTooLarge);
        rlimit limit = {};
        getrlimit(RLIMIT_FSIZE, &limit);
        limit.rlim_cur = LargestFile < limit.rlim_max ? LargestFile : limit.rlim_max;
        setrlimit(RLIMIT_FSIZE, &limit);
    }

private:
    void OnTestStart(const testing::TestInfo& info) override
    {
        std::snprintf(test, sizeof test, "%s.%s", info.test_suite_name(), info.name());
        SetTimer(Seconds);
    }

    void OnTestEnd(const testing::TestInfo&) override { SetTimer(0); }

    static void SetTimer(int seconds)
    {
        itimerval timer = {};
        timer.it_value.tv_sec = seconds;
        setitimer(ITIMER_PROF, &timer, nullptr);
    }
};

const bool installed = [] {
    testing::UnitTest::GetInstance()->listeners().Append(new Limits);
    return true;
}();

} // namespace
