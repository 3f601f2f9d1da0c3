/**
 * @file
 * Reads logs in tests.
 */
#ifndef TESTS_DESKPLAYER_FIELDLOG_FIELDLOGKEEPER_H
#define TESTS_DESKPLAYER_FIELDLOG_FIELDLOGKEEPER_H

#include <nlohmann/json.hpp>

#include <string>
#include <utility>
#include <vector>

#include "fieldlog/fieldlogreader.h"
#include "output/argumentsjson.h"

namespace deskplayer
{

/** Keeps what a log contains, one line of text for each. */
class FieldLogKeeper : public RecordListener
{
public:
    std::vector<CallbackRecord> records;

    /** "90 AudioInfo {\"number\":2}", "90 gap lost 17", "0 start 2024-05-31 20:15:00" */
    std::vector<std::string> lines;

    void OnRecord(const CallbackRecord& record) override
    {
        records.push_back(record);
        Add(record.time,
            std::string(NameOf(record.callback.Id())) + " " + ArgumentsJson(record).dump());
    }

    void OnGap(const GapRecord& gap) override
    {
        Add(gap.time, "gap " + gap.cause + (gap.lost ? " " + std::to_string(*gap.lost) : ""));
    }

    void OnStart(const StartRecord& start) override { Add(start.time, "start " + start.wallClock); }

private:
    void Add(Ticks time, const std::string& text)
    {
        lines.push_back(std::to_string(time.count()) + " " + text);
    }
};

using Lines = std::vector<std::string>;

/** What a log of one file contains. */
inline Lines ReadLog(std::string_view log, FieldLogCounts* counts = nullptr)
{
    FieldLogKeeper keeper;
    FieldLogReader reader(keeper);
    reader.Read(log);
    reader.EndFile();
    reader.Finish();
    if (counts != nullptr) {
        *counts = reader.Counts();
    }
    return keeper.lines;
}

} // namespace deskplayer

#endif
