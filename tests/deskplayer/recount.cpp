#include "recount.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <map>
#include <ostream>
#include <set>

#include "programtest.h"

using nlohmann::json;

namespace
{

/** Something that lasts for periods. */
struct Lasting {
    std::uint64_t total = 0; ///< ticks
    std::uint64_t count = 0;

    friend bool operator==(const Lasting& left, const Lasting& right)
    {
        return left.total == right.total && left.count == right.count;
    }
    friend void PrintTo(const Lasting& lasting, std::ostream* stream)
    {
        *stream << lasting.total << " ticks in " << lasting.count;
    }
};

/** What the lines of JSON of a recording amount to. */
class Recount
{
public:
    std::map<std::string, Lasting> states;
    std::map<std::string, Lasting> operations;
    std::map<std::string, std::uint64_t> callbacks;
    std::map<std::string, std::uint64_t> gaps;
    std::set<std::string> forbidden; ///< at the end
    json lastCallback;

    explicit Recount(const json& lines)
    {
        for (const json& line : lines) {
            if (line.contains("gap")) {
                ++gaps[line["gap"]["cause"]];
                m_Mode = "Forward Normal";
                m_Mask.clear();
                Become("Unknown");
            }
            const std::uint64_t passed = m_Begun ? line["ticks"].get<std::uint64_t>() - m_Time : 0;
            m_Time = line["ticks"];
            m_Begun = true;
            states[m_State].total += passed;
            for (const std::string& operation : forbidden) {
                operations[operation].total += passed;
            }
            if (line.contains("callback")) {
                lastCallback = line;
                ++callbacks[line["callback"]];
                Follow(line["callback"], line["arguments"]);
            }
        }
        states.erase("");
    }

private:
    void Follow(const std::string& callback, const json& arguments)
    {
        static const std::map<std::string, std::string> into = {{"PlayStarted", "Playing"},
                                                                {"Continued", "Playing"},
                                                                {"Paused", "Paused"},
                                                                {"StillOn", "Still"},
                                                                {"Suspended", "Suspended"},
                                                                {"SystemSuspended", "Standby"},
                                                                {"Stopped", "Stopped"},
                                                                {"Finished", "Stopped"},
                                                                {"PlayFailed", "Stopped"},
                                                                {"ResumeFailed", "Stopped"},
                                                                {"SystemResumeFailed", "Stopped"}};
        const std::string before = m_Plain;
        if (into.count(callback) != 0) {
            m_Plain = into.at(callback);
        } else if (callback == "StillOff" && m_Plain == "Still") {
            m_Plain = "Playing";
        } else if (callback == "Resumed") {
            m_Plain = m_Suspended;
        } else if (callback == "SystemResumed") {
            m_Plain = arguments["playing"].get<bool>() ? "Playing" : "Stopped";
        } else if (callback == "PlayMode") {
            m_Mode = arguments["direction"].get<std::string>() + " " +
                     arguments["speed"].get<std::string>();
        } else if (callback == "UOMask") {
            m_Mask = arguments["forbidden"].get<std::set<std::string>>();
        }
        if (callback == "Suspended") {
            m_Suspended = before;
        }
        if (m_Plain == "Stopped") {
            m_Mode = "Forward Normal";
            m_Mask.clear();
        }
        Become(m_Plain);
    }

    void Become(const std::string& plain)
    {
        m_Plain = plain;
        const std::string state =
            plain == "Playing" && m_Mode != "Forward Normal" ? "TrickPlay" : plain;
        if (state != m_State) {
            m_State = state;
            ++states[state].count;
        }
        const std::set<std::string> now = plain == "Standby" ? std::set<std::string>() : m_Mask;
        for (const std::string& operation : now) {
            operations[operation].count += forbidden.count(operation) == 0 ? 1 : 0;
        }
        forbidden = now;
    }

    bool m_Begun = false;
    std::uint64_t m_Time = 0;
    std::string m_Plain = "Unknown"; ///< the state, whatever the play mode
    std::string m_State;
    std::string m_Suspended = "Playing";
    std::string m_Mode = "Forward Normal";
    std::set<std::string> m_Mask;
};

/** The members `total` and `count` of the objects of an array, by the member @p name. */
std::map<std::string, Lasting> LastingIn(const json& objects, const char* name)
{
    std::map<std::string, Lasting> lasting;
    for (const json& object : objects) {
        lasting[object.at(name)] = {object.at("total").at("ticks"), object.at("count")};
    }
    return lasting;
}

std::map<std::string, std::uint64_t> CountsIn(const json& objects, const char* name)
{
    std::map<std::string, std::uint64_t> counts;
    for (const json& object : objects) {
        counts[object.at(name)] = object.at("count");
    }
    return counts;
}

} // namespace

json ParseLines(const std::string& text)
{
    json lines = json::array();
    for (const std::string& line : LinesOf(text)) {
        lines.push_back(json::parse(line));
    }
    return lines;
}

void ExpectAgreement(const json& summary, const json& lines)
{
    const Recount recount(lines);
    EXPECT_EQ(LastingIn(summary.at("states"), "state"), recount.states);
    EXPECT_EQ(LastingIn(summary.at("forbiddenOperations"), "operation"), recount.operations);
    std::uint64_t ofAllStates = 0;
    for (const auto& state : recount.states) {
        ofAllStates += state.second.total;
    }
    EXPECT_EQ(summary.at("duration").at("ticks"), ofAllStates);
    EXPECT_EQ(CountsIn(summary.at("callbackKinds"), "callback"), recount.callbacks);
    EXPECT_EQ(CountsIn(summary.at("gaps"), "cause"), recount.gaps);
    std::set<std::string> forbidden;
    for (const json& operation : summary.at("forbiddenOperations")) {
        if (operation.at("forbiddenAtEnd") == true) {
            forbidden.insert(operation.at("operation").get<std::string>());
        }
    }
    EXPECT_EQ(forbidden, recount.forbidden);
    const json& last = summary.at("lastCallback");
    EXPECT_EQ(last.at("callback"), recount.lastCallback["callback"]);
    EXPECT_EQ(last.at("at").at("ticks"), recount.lastCallback["ticks"]);
    EXPECT_EQ(last.at("arguments"), recount.lastCallback["arguments"]);
    EXPECT_EQ(summary.at("begin").at("ticks"), lines.front()["ticks"]);
    EXPECT_EQ(summary.at("end").at("ticks"), lines.back()["ticks"]);
}
