#include "tables.h"

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <string>
#include <vector>

#include "benchmarks.h"

namespace bench
{

namespace
{

constexpr const char* Events[] = {"PlayStartedEvent", "CurrentTimePositionEvent", "PlayItemEvent"};

/** A limit, and the values judged by it. */
class Goal
{
public:
    Goal(const char* text, double limit) : m_Text(text), m_Limit(limit) {}

    /** Judges a value; NaN, which means not measured, is ignored. */
    void Judge(const std::string& where, double value)
    {
        if (std::isnan(value)) {
            return;
        }
        ++m_Judged;
        m_Worst = std::max(m_Worst, value);
        if (value > m_Limit) {
            char text[16];
            std::snprintf(text, sizeof(text), "%.2f", value);
            m_Missed.push_back(where + ": " + text);
        }
    }

    void Print() const
    {
        if (m_Judged == 0) {
            std::printf("  not measured  %s\n", m_Text);
            return;
        }
        std::printf("  %-12s  %s (%zu of %zu within %.2f, worst %.2f)\n",
                    m_Missed.empty() ? "met" : "MISSED", m_Text, m_Judged - m_Missed.size(),
                    m_Judged, m_Limit, m_Worst);
        for (const std::string& missed : m_Missed) {
            std::printf("  %14s%s\n", "", missed.c_str());
        }
    }

private:
    const char* m_Text;
    double m_Limit;
    double m_Worst = 0;
    std::size_t m_Judged = 0;
    std::vector<std::string> m_Missed;
};

/** Prints a time, and its ratio to another. */
void PrintTime(double time, double other)
{
    PrintNumber(11, 1, time);
    PrintNumber(7, 2, time / other);
}

void PrintDelivery(const Report& report, Goal& goal)
{
    for (const char* const callback : {NoArguments, ByReference, ByValue}) {
        std::printf("\nDelivery with %s: ns, × floor\n  %-28s", callback, "listeners");
        for (const int count : ListenerCounts) {
            std::printf("%11d%7s", count, "");
        }
        std::printf("\n");
        for (const char* const subject :
             {FloorName, LibraryName, BoostName, SigcName, LockedSigcName, QtName}) {
            std::printf("  %-28s", subject);
            for (const int count : ListenerCounts) {
                const double floor = report[DeliveryRow(callback, FloorName, count)].cpu;
                const double time = report[DeliveryRow(callback, subject, count)].cpu;
                PrintTime(time, floor);
                if (subject == LibraryName) {
                    goal.Judge(std::string(callback) + " to " + std::to_string(count),
                               time / floor);
                }
            }
            std::printf("\n");
        }
    }
}

void PrintEvents(const Report& report, Goal& allocations, Goal& lineOff)
{
    const double logSwitch = report[LogRow(LogSwitch)].cpu;
    std::printf(
        "\nEvents to one listener: ns, × delivery alone plus one call of the switch\n  %-38s", "");
    for (const char* const event : Events) {
        std::printf("%25s", event);
    }
    std::printf("\n");
    for (const char* const what :
         {Delivery, DispatchOff, DispatchNull, DispatchQueue, WholeOff, WholeNull, WholeQueue}) {
        std::printf("  %-38s       ", what);
        for (const char* const event : Events) {
            const Row row = report[EventRow(event, what)];
            const double alone = report[EventRow(event, Delivery)].cpu + logSwitch;
            PrintTime(row.cpu, alone);
            std::printf("%7s", "");
            if (what == DispatchOff) {
                lineOff.Judge(event, row.cpu / alone);
            }
            allocations.Judge(std::string(event) + ", " + what,
                              report.Largest(EventRow(event, what), AllocationsCounter));
        }
        std::printf("\n");
    }
}

void PrintThreads(const Report& report)
{
    std::printf("\nThreads that each fire at eight listeners: elapsed ns per delivery, × floor,\n"
                "share of time a thread ran, share of time it waited for a processor\n");
    for (const char* const lists : {OneList, OwnLists}) {
        for (const int threads : ThreadCounts) {
            for (const char* const subject : {FloorName, LibraryName}) {
                const Row row = report[ThreadRow(lists, subject, threads)];
                const double floor = report[ThreadRow(lists, FloorName, threads)].wall;
                std::printf("  %d threads, %-20s %-16s", threads, lists, subject);
                PrintTime(row.wall * threads, floor * threads);
                PrintNumber(9, 0, 100 * row.cpu / (row.wall * threads));
                std::printf(" %%");
                PrintNumber(9, 0, 100 * row.Counter(WaitedCounter));
                std::printf(" %%\n");
            }
        }
    }
}

void PrintLog(const Report& report, Goal& queued, Goal& queuedBySpdlog)
{
    std::printf("\nA log line: the caller's CPU ns, × vsnprintf alone, elapsed ns\n");
    const double formatting = report[LogRow(LogVsnprintf)].cpu;
    for (const char* const what : {LogSwitch, LogOff, LogVsnprintf, LogNull, LogQueue, LogQueueNull,
                                   LogSpdlog, LogSpdlogQueue, LogSpdlogQueueNull}) {
        const Row row = report[LogRow(what)];
        std::printf("  %-32s", what);
        PrintTime(row.cpu, formatting);
        PrintNumber(11, 1, row.wall);
        std::printf("\n");
    }
    const auto judge = [&](const char* what, const char* bySpdlog) {
        const double time = report[LogRow(what)].cpu;
        queued.Judge(what, time / formatting);
        queuedBySpdlog.Judge(what, time / report[LogRow(bySpdlog)].cpu);
    };
    judge(LogQueue, LogSpdlogQueue);
    judge(LogQueueNull, LogSpdlogQueueNull);
}

/** Elapsed ns per event: posted, delivered to one listener and destroyed. */
double QueueTime(const Report& report, const std::string& queue, int producers)
{
    const double wall = report[QueueRow(queue, producers)].wall;
    return producers == 0 ? wall : wall * producers / EventsARound;
}

void PrintQueues(const Report& report, Goal& deque, Goal& fastest, Goal& allocations)
{
    std::printf("\nAn event posted, delivered to one listener and destroyed: elapsed ns, × deque\n"
                "  %-40s%18s%18s%18s\n",
                "", "one thread", "1 producer", "2 producers");
    for (const char* const queue : {DequeName, LockFreeName, ConcurrentName, QueueName}) {
        std::printf("  %-40s", queue);
        for (const int producers : ProducerCounts) {
            PrintTime(QueueTime(report, queue, producers), QueueTime(report, DequeName, producers));
        }
        std::printf("\n");
    }
    for (const int producers : ProducerCounts) {
        const std::string where = std::to_string(producers) + " producers";
        allocations.Judge(where,
                          report.Largest(QueueRow(QueueName, producers), AllocationsCounter));
        if (producers == 0) {
            continue;
        }
        const double time = QueueTime(report, QueueName, producers);
        deque.Judge(where, time / QueueTime(report, DequeName, producers));
        fastest.Judge(where, time / std::min(QueueTime(report, LockFreeName, producers),
                                             QueueTime(report, ConcurrentName, producers)));
    }
}

/** A listener of the client kit. */
struct ClientKitSubject {
    const char* name;
    Goal* goal;                    ///< for it; null for none
    double Row::*time = &Row::cpu; ///< wall if the benchmark measures the thread's CPU time itself
};

void PrintClientKit(const Report& report, const std::vector<ClientKitSubject>& subjects)
{
    constexpr const char* Callbacks[] = {NoArguments, ByReference, ByValue};
    std::printf("\nDelivery to one listener: ns, × plain listener\n  %-39s", "");
    for (const char* const callback : Callbacks) {
        std::printf("%25s", callback);
    }
    std::printf("\n");
    for (const ClientKitSubject& subject : subjects) {
        std::printf("  %-39s       ", subject.name);
        for (const char* const callback : Callbacks) {
            const double plain = report[ClientKitRow(callback, PlainName)].cpu;
            const double time = report[ClientKitRow(callback, subject.name)].*subject.time;
            PrintTime(time, plain);
            std::printf("%7s", "");
            if (subject.goal != nullptr) {
                subject.goal->Judge(std::string(subject.name) + ", " + callback, time / plain);
            }
        }
        std::printf("\n");
    }
}

} // namespace

void PrintTables(const Report& report)
{
    Goal delivery("delivery, × floor", 1.10);
    Goal allocations("allocations between Dispatch() and its return", 0);
    Goal lineOff("an event with its line off, × delivery alone plus one call of the switch", 1.15);
    Goal queued("a line into the queue, × vsnprintf alone", 1.5);
    Goal queuedBySpdlog("a line into the queue, × plain spdlog's queue", 1);
    Goal deque("a queue's event, × deque", 0.6);
    Goal fastest("a queue's event, × the faster of the lock-free queues", 1.1);
    Goal queueAllocations("allocations from posting to the end of delivery", 0);
    Goal status("a delivery to StatusListener, × plain listener", 3);
    Goal box("a delivery to BlackBox, × plain listener", 5);
    Goal queue("a delivery to QueuedListener whose thread runs, × plain listener", 5);

    PrintDelivery(report, delivery);
    PrintEvents(report, allocations, lineOff);
    PrintThreads(report);
    PrintLog(report, queued, queuedBySpdlog);
    PrintQueues(report, deque, fastest, queueAllocations);
    PrintClientKit(report, {{PlainName, nullptr},
                            {StatusName, &status},
                            {RelayName, nullptr},
                            {BoxName, &box},
                            {BoxWithClockName, &box},
                            {WatchName, nullptr},
                            {QueueFreeName, &queue, &Row::wall},
                            {QueueTakenName, &queue},
                            {QueueSleepingName, &queue},
                            {QueueAtOnceName, &queue},
                            {QueueWakingName, nullptr, &Row::wall}});

    std::printf("\nGoals\n");
    for (const Goal* goal : {&delivery, &allocations, &lineOff, &queued, &queuedBySpdlog, &deque,
                             &fastest, &queueAllocations, &status, &queue, &box}) {
        goal->Print();
    }
}

} // namespace bench
