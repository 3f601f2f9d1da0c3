/**
 * @file
 * The groups of benchmarks, and the names by which the tables find their rows.
 */
#ifndef BENCH_BENCHMARKS_H
#define BENCH_BENCHMARKS_H

#include <string>

namespace bench
{

constexpr int ListenerCounts[] = {1, 8, 64, 1024};
constexpr int ThreadCounts[] = {2, 4};

constexpr char FloorName[] = "floor, by hand";
constexpr char LibraryName[] = "this library";

constexpr char BoostName[] = "Boost.Signals2";
constexpr char SigcName[] = "libsigc++, not thread-safe";
constexpr char LockedSigcName[] = "libsigc++ under a mutex";
constexpr char QtName[] = "Qt, direct connections";

constexpr char NoArguments[] = "no arguments";
constexpr char ByReference[] = "a reference";
constexpr char ByValue[] = "AudioInfoType by value";

constexpr char OneList[] = "one list";
constexpr char OwnLists[] = "separate lists";

constexpr char Delivery[] = "delivery alone, by hand";
constexpr char DispatchOff[] = "dispatch, line off";
constexpr char DispatchNull[] = "dispatch, null sink";
constexpr char DispatchQueue[] = "dispatch, queue";
constexpr char WholeOff[] = "create, dispatch, delete; line off";
constexpr char WholeNull[] = "create, dispatch, delete; null sink";
constexpr char WholeQueue[] = "create, dispatch, delete; queue";

constexpr char LogSwitch[] = "the switch alone";
constexpr char LogOff[] = "line off";
constexpr char LogNull[] = "line on, null sink";
constexpr char LogQueue[] = "line on, queue, slow sink";
constexpr char LogQueueNull[] = "line on, queue, null sink";
constexpr char LogVsnprintf[] = "vsnprintf alone";
constexpr char LogSpdlog[] = "plain spdlog, null sink";
constexpr char LogSpdlogQueue[] = "plain spdlog, queue, slow sink";
constexpr char LogSpdlogQueueNull[] = "plain spdlog, queue, null sink";

constexpr char QueueName[] = "bdmv::EventQueue";
constexpr char DequeName[] = "std::deque, mutex, condition variable";
constexpr char LockFreeName[] = "boost::lockfree::queue";
constexpr char ConcurrentName[] = "moodycamel::ConcurrentQueue";
constexpr int ProducerCounts[] = {0, 1, 2}; ///< 0: the delivering thread posts
constexpr int EventsARound = 256;           ///< posted before the producers wait for the delivery

constexpr char PlainName[] = "plain listener";
constexpr char StatusName[] = "StatusListener";
constexpr char RelayName[] = "ListenerRelay, one client";
constexpr char BoxName[] = "BlackBox, clock that answers at once";
constexpr char BoxWithClockName[] = "BlackBox, clock of the system";
constexpr char WatchName[] = "CallbackWatch";
constexpr char QueueFreeName[] = "QueuedListener, places free";
constexpr char QueueTakenName[] = "QueuedListener, places taken";
constexpr char QueueSleepingName[] = "QueuedListener, client sleeps 100 ms";
constexpr char QueueAtOnceName[] = "QueuedListener, client returns at once";
constexpr char QueueWakingName[] = "QueuedListener, thread woken each time";

constexpr char AllocationsCounter[] = "allocations";
constexpr char WaitedCounter[] = "waited";

void RegisterDelivery();
void RegisterQtDelivery();
void RegisterEvents();
void RegisterThreads();
void RegisterLogLines();
void RegisterQueues();
void RegisterClientKit();
void RegisterQueuedListener();

inline std::string DeliveryRow(const std::string& callback, const std::string& subject, int count)
{
    return "delivery/" + callback + "/" + subject + "/" + std::to_string(count);
}

inline std::string EventRow(const std::string& event, const std::string& what)
{
    return "event/" + event + "/" + what;
}

inline std::string ThreadRow(const std::string& lists, const std::string& subject, int threads)
{
    return "threads/" + lists + "/" + subject + "/" + std::to_string(threads);
}

inline std::string QueueRow(const std::string& queue, int producers)
{
    return "queue/" + queue + "/" + std::to_string(producers);
}

inline std::string LogRow(const std::string& what)
{
    return "log/" + what;
}

inline std::string ClientKitRow(const std::string& callback, const std::string& listener)
{
    return "clientkit/" + callback + "/" + listener;
}

} // namespace bench

#endif
