#include "summary/summarywriter.h"

#include <nlohmann/json.hpp>

#include "output/argumentsjson.h"
#include "text/names.h"
#include "text/timetext.h"

namespace deskplayer
{

namespace
{

using nlohmann::ordered_json;

ordered_json TimeJson(Ticks time)
{
    return {{"ticks", time.count()}, {"time", TimeText(time)}};
}

ordered_json GapsJson(const RecordingSummary& summary)
{
    ordered_json gaps = ordered_json::array();
    for (const GapSummary& gap : summary.gaps) {
        ordered_json object = {{"cause", gap.cause}, {"count", gap.count}};
        if (gap.lost) {
            object["lost"] = *gap.lost;
        }
        object["first"] = TimeJson(gap.first);
        object["last"] = TimeJson(gap.last);
        gaps.push_back(std::move(object));
    }
    return gaps;
}

ordered_json LastCallbackJson(const RecordingSummary& summary)
{
    if (!summary.lastCallback) {
        return nullptr;
    }
    const CallbackRecord& last = *summary.lastCallback;
    return {{"at", TimeJson(last.time)},
            {"callback", NameOf(last.callback.Id())},
            {"arguments", ArgumentsJson(last)}};
}

ordered_json WaitsJson(const RecordingSummary& summary)
{
    ordered_json longest = ordered_json::array();
    for (const Wait& wait : summary.longestWaits) {
        longest.push_back({{"wait", TimeJson(wait.duration)},
                           {"at", TimeJson(wait.time)},
                           {"after", NameOf(wait.after)},
                           {"before", NameOf(wait.before)}});
    }
    return {{"measured", summary.waits}, {"longest", std::move(longest)}};
}

ordered_json StatesJson(const RecordingSummary& summary)
{
    ordered_json states = ordered_json::array();
    for (std::size_t state = 0; state < summary.states.size(); ++state) {
        const Periods& periods = summary.states[state];
        if (periods.count > 0) {
            states.push_back({{"state", SummaryStateNames[state]},
                              {"total", TimeJson(periods.total)},
                              {"count", periods.count}});
        }
    }
    return states;
}

ordered_json OperationsJson(const RecordingSummary& summary)
{
    ordered_json operations = ordered_json::array();
    for (std::size_t bit = 0; bit < summary.operations.size(); ++bit) {
        const OperationSummary& operation = summary.operations[bit];
        if (operation.forbidden.count > 0) {
            operations.push_back(
                {{"operation", NameOrNumber(static_cast<bd::UserOperationMaskDef>(bit))},
                 {"total", TimeJson(operation.forbidden.total)},
                 {"count", operation.forbidden.count},
                 {"forbiddenAtEnd", operation.forbiddenAtEnd
                                        ? ordered_json(*operation.forbiddenAtEnd)
                                        : ordered_json()}});
        }
    }
    return operations;
}

ordered_json CallbacksJson(const RecordingSummary& summary)
{
    ordered_json kinds = ordered_json::array();
    for (std::size_t id = 0; id < summary.callbackKinds.size(); ++id) {
        const CallbackSummary& kind = summary.callbackKinds[id];
        if (kind.count > 0) {
            kinds.push_back({{"callback", NameOf(static_cast<bdmv::CallbackId>(id))},
                             {"count", kind.count},
                             {"first", TimeJson(kind.first)},
                             {"last", TimeJson(kind.last)}});
        }
    }
    return kinds;
}

} // namespace

void WriteSummaryAsJson(std::ostream& stream, const RecordingSummary& summary)
{
    ordered_json object;
    if (!summary.wallClock.empty()) {
        object["wallClock"] = summary.wallClock;
    }
    object["begin"] = TimeJson(summary.begin);
    object["end"] = TimeJson(summary.end);
    object["duration"] = TimeJson(summary.duration);
    object["callbacks"] = summary.callbacks;
    if (summary.log) {
        object["foreignLines"] = summary.log->foreignLines;
        object["damagedLines"] = summary.log->damagedLines;
    }
    object["gaps"] = GapsJson(summary);
    object["lastCallback"] = LastCallbackJson(summary);
    if (summary.log) {
        object["waits"] = WaitsJson(summary);
    }
    object["states"] = StatesJson(summary);
    object["forbiddenOperations"] = OperationsJson(summary);
    object["callbackKinds"] = CallbacksJson(summary);
    stream << object.dump() << '\n';
}

} // namespace deskplayer
