/**
 * @file
 * The rows of the delivery table, the same for every subject.
 */
#ifndef BENCH_DELIVERY_H
#define BENCH_DELIVERY_H

#include <memory>
#include <string>

#include <benchmark/benchmark.h>

#include "benchmarks.h"
#include "listener.h"

namespace bench
{

/**
 * Registers the delivery of three callbacks to each number of listeners.
 *
 * The subjects are created here, before any benchmark runs, while the heap is not fragmented, so
 * that their allocations are contiguous.
 */
template <typename Subject> void RegisterDelivery(const std::string& name)
{
    for (const int count : ListenerCounts) {
        const auto subject = std::make_shared<Subject>();
        for (int i = 0; i < count; ++i) {
            subject->Add(Listeners()[i]);
        }
        const auto row = [&](const std::string& callback, auto deliver) {
            const std::string rowName = DeliveryRow(callback, name, count);
            benchmark::RegisterBenchmark(rowName.c_str(),
                                         [subject, deliver](benchmark::State& state) {
                                             for (auto _ : state) {
                                                 deliver(*subject);
                                             }
                                         });
        };
        row(NoArguments, [](Subject& s) { s.PlayStarted(); });
        row(ByReference, [](Subject& s) { s.CurrentTimePosition(Position); });
        row(ByValue, [](Subject& s) { s.AudioInfoChanged(true, AudioInfo); });
    }
}

} // namespace bench

#endif
