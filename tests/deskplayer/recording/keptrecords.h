/**
 * @file
 * Reads recordings and keeps or writes their records.
 */
#ifndef TESTS_DESKPLAYER_RECORDING_KEPTRECORDS_H
#define TESTS_DESKPLAYER_RECORDING_KEPTRECORDS_H

#include <sstream>
#include <string>
#include <vector>

#include "output/jsonoutput.h"
#include "recording/recordingreader.h"

namespace deskplayer
{

/** Keeps every record; of a block only the size, because its bytes do not last. */
struct KeptRecords : RecordListener {
    std::vector<CallbackRecord> callbacks;
    std::vector<GapRecord> gaps;
    std::vector<StartRecord> starts;

    void OnRecord(const CallbackRecord& record) override { callbacks.push_back(record); }
    void OnGap(const GapRecord& gap) override { gaps.push_back(gap); }
    void OnStart(const StartRecord& start) override { starts.push_back(start); }
};

inline void ReadAll(const std::string& text, RecordListener& listener)
{
    std::istringstream stream(text);
    RecordingReader reader(stream, "test");
    while (reader.Next(listener)) {
    }
}

inline KeptRecords RecordsOf(const std::string& text)
{
    KeptRecords records;
    ReadAll(text, records);
    return records;
}

/** The recording as it is written again. */
inline std::string WrittenAgain(const std::string& text)
{
    std::ostringstream stream;
    const VirtualClock clock;
    JsonOutput output(stream, clock, OutputFilter());
    ReadAll(text, output);
    return stream.str();
}

} // namespace deskplayer

#endif
