#include "fieldlog/eventlines.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <limits>
#include <map>
#include <random>
#include <regex>
#include <set>
#include <sstream>
#include <string>
#include <vector>

#include "bdmv/bdmvnavigator/allevents.h"
#include "deskplayer/unshownarguments.h"
#include "fieldlogkeeper.h"
#include "kits/clientkit/randomcallbacks.h"
#include "testkit/bench.h"

namespace deskplayer
{

namespace
{

/** The names of the arguments that are absent. */
std::vector<std::string> AbsentNames(const bdmv::Callback& callback, const ArgumentSet& absent)
{
    std::vector<std::string> names;
    std::size_t position = 0;
    callback.VisitArguments([&](const char* name, const auto& /*value*/) {
        if (absent[position++]) {
            names.emplace_back(name);
        }
    });
    return names;
}

std::vector<std::string> ExceptionsOf(const std::string& callback)
{
    const auto found = bdmvtest::InNoLine.find(callback);
    return found == bdmvtest::InNoLine.end() ? std::vector<std::string>() : found->second;
}

/** Random values, among which those at the ends of each type are frequent. */
class Values
{
public:
    explicit Values(unsigned seed) : m_Numbers(seed) {}

    template <typename Value> void Set(Value& value)
    {
        if constexpr (std::is_same_v<Value, bool>) {
            value = m_Numbers() % 2 != 0;
        } else if constexpr (std::is_enum_v<Value>) {
            value = static_cast<Value>(Number<std::int32_t>());
        } else {
            value = Number<Value>();
        }
    }

    template <typename Integer> Integer Number()
    {
        switch (m_Numbers() % 4) {
        case 0:
            return std::numeric_limits<Integer>::max();
        case 1:
            return std::numeric_limits<Integer>::min();
        default:
            return static_cast<Integer>((std::uint64_t{m_Numbers()} << 32) | m_Numbers());
        }
    }

private:
    std::mt19937 m_Numbers;
};

void SetAll(bdmvtest::ScriptablePlaybackContext& context, Values& values)
{
    const auto setStream = [&values](auto& stream) {
        values.Set(stream.number);
        values.Set(stream.count);
    };
    values.Set(context.systemResumeData.size);
    values.Set(context.playingAfterSystemResume);
    values.Set(context.playListId);
    values.Set(context.playItemId);
    for (bd::PlayMode* const mode : {&context.playMode, &context.currentPlayMode}) {
        *mode = bd::PlayMode(static_cast<bd::PlayDirectionDef>(values.Number<std::int32_t>()),
                             static_cast<bd::PlaySpeedDef>(values.Number<std::int32_t>()));
    }
    values.Set(context.triggerReachedTime);
    values.Set(context.triggerTypeByTime);
    values.Set(context.currentChapter);
    values.Set(context.currentPLMarkId);
    values.Set(context.currentPLMarkTime);
    values.Set(context.videoFormat);
    values.Set(context.videoAspectRatio);
    for (auto* const stream :
         {&context.video, &context.audio, &context.ig, &context.rPgTextSt, &context.pgTextSt,
          &context.secondaryVideo, &context.secondaryAudio, &context.pipPgTextSt}) {
        setStream(*stream);
    }
    values.Set(context.secondaryVideoAsync);
    values.Set(context.angleNumber);
    values.Set(context.pgTextStDisplay);
    values.Set(context.secondaryVideoDisplay);
    values.Set(context.secondaryAudioDisplay);
    values.Set(context.pipPgTextStSelect);
    context.uoMask = bdmv::UOMaskTable(values.Number<std::uint64_t>());
    values.Set(context.currentTimePosition);
    values.Set(context.executeButtonTicket);
    values.Set(context.executeButtonId);
    values.Set(context.currentTextSubtitleStyleNumber);
    values.Set(context.numberOfTextSubtitleStyles);
    context.finishedReason =
        static_cast<bdstreaming::FinishedReason>(values.Number<std::uint8_t>() % 2);
    values.Set(context.async2ndVid);
    values.Set(context.async2ndAud);
    values.Set(context.prev2ndVid);
    values.Set(context.prev2ndAud);
}

/** The lines of the journal as the Linux port writes them with the clock of a session. */
std::string LogOf(const std::string& journal)
{
    std::string log;
    std::istringstream stream(journal);
    for (std::string line; std::getline(stream, line);) {
        for (const auto& [tag, level] :
             {std::pair<std::string, std::string>("log 57 5 0: ", "Event"),
              {"log 57 5 1: ", "Event"},
              {"log 57 3 0: ", "Warning"}}) {
            if (line.compare(0, tag.size(), tag) == 0) {
                log += "00:00:01.000000 BdmvNavigator " + level + ": " + line.substr(tag.size()) +
                       "\n";
            }
        }
    }
    return log;
}

std::vector<CallbackRecord> RecordsOf(const std::string& log)
{
    FieldLogKeeper keeper;
    FieldLogReader reader(keeper);
    reader.Read(log);
    reader.EndFile();
    reader.Finish();
    EXPECT_EQ(reader.Counts().foreignLines, 0U) << log;
    EXPECT_EQ(reader.Counts().damagedLines, 0U) << log;
    return keeper.records;
}

TEST(EventLines, OfEveryEventGiveTheCallbacksThatAListenerReceives)
{
    bdmvtest::CallbackKeeper listener;
    bdmvtest::Bench bench{&listener};
    Values values(1);
    for (int round = 0; round < 200; ++round) {
        for (const EventClass& event : AllEvents()) {
            SetAll(bench.context, values);
            listener.callbacks.clear();
            event.make(bench.context)->Dispatch(bench.listeners);
            const std::string log = LogOf(bench.journal.Take());

            const std::vector<CallbackRecord> records = RecordsOf(log);

            ASSERT_EQ(records.size(), listener.callbacks.size()) << log;
            for (std::size_t i = 0; i < records.size(); ++i) {
                const bdmv::Callback& expected = listener.callbacks[i];
                const CallbackRecord& record = records[i];
                ASSERT_EQ(record.callback.Id(), expected.Id()) << log;
                ASSERT_EQ(record.continuesEvent, i > 0) << log;
                ASSERT_EQ(AbsentNames(record.callback, record.absent),
                          ExceptionsOf(NameOf(expected.Id())))
                    << log;
                ASSERT_TRUE(record.absent.any() || record.callback == expected) << log;
                ASSERT_EQ(ArgumentsJson(record),
                          ArgumentsJson({record.time, expected, record.absent}))
                    << log;
            }
        }
    }
}

TEST(EventLines, WithoutTheDiagnosticOfATriggerGiveNoArguments)
{
    const std::vector<CallbackRecord> records =
        RecordsOf("00:00:01.000000 BdmvNavigator Event: Sending Trigger Reached\n");

    ASSERT_EQ(records.size(), 1U);
    EXPECT_EQ(AbsentNames(records[0].callback, records[0].absent),
              (std::vector<std::string>{"type", "time"}));
}

TEST(EventLines, AreSortedAndNoneBeginsWithTheHeadOfAnother)
{
    std::string before;
    for (const EventLine& line : AllEventLines()) {
        const std::string head(line.format.substr(0, line.format.find('%')));
        EXPECT_LT(before, head);
        EXPECT_TRUE(before.empty() || head.compare(0, before.size(), before) != 0) << head;
        before = head;
    }
}

TEST(EventLines, HaveTheFormatsAndCallbacksOfTheDocumentation)
{
    std::ifstream file(BDMVNAVIGATOR_DOCS "/events.md");
    std::set<std::string> documented;
    const std::regex row("\\| `([^`]*)` \\| `([A-Za-z]+)` \\| (.*) \\|");
    std::smatch match;
    for (std::string text; std::getline(file, text);) {
        if (std::regex_match(text, match, row)) {
            documented.insert(match[1].str() + ": " + match[2].str() + ": " + match[3].str());
        }
    }

    std::set<std::string> lines;
    for (const EventLine& line : AllEventLines()) {
        std::string absent;
        for (const std::string& name : line.role == LineRole::AnnouncesInPart
                                           ? std::vector<std::string>{"type", "time"}
                                           : ExceptionsOf(NameOf(line.callback))) {
            absent += (absent.empty() ? "`" : ", `") + name + "`";
        }
        const bool isRevoking = line.role == LineRole::Revokes;
        lines.insert(std::string(line.format) + ": " + NameOf(line.callback) + ": " +
                     (isRevoking       ? "revoked"
                      : absent.empty() ? "all"
                                       : "all but " + absent));
    }
    EXPECT_EQ(documented, lines);
}

struct Damage {
    const char* name;
    const char* text;
};

class DamagedText : public testing::TestWithParam<Damage>
{
};

TEST_P(DamagedText, IsNotRead)
{
    EXPECT_EQ(ReadEventText(GetParam().text).kind, EventTextKind::Damaged);
}

INSTANTIATE_TEST_SUITE_P(
    EventText, DamagedText,
    testing::Values(
        Damage{"NumberBeyondItsArgument", "Sending AngleInfo - angleNr: 256"},
        Damage{"NumberBeyond32Bits", "Sending Playlist - playListId: 4294967296"},
        Damage{"NumberBeyond64Bits", "Sending UOMask - uoMask: 18446744073709551616"},
        Damage{"NegativeNumber", "Sending AngleInfo - angleNr: -1"},
        Damage{"NegativeNumberOfAStream",
               "Sending SecondaryAudioDisplay - audioNr -1, numOfAudios 1, shown: TRUE"},
        Damage{"LeadingZero", "Sending AngleInfo - angleNr: 01"},
        Damage{"NegativeZero", "Sending Finished - reason: -0"},
        Damage{"UnknownReason", "Sending Finished - reason: 2"},
        Damage{"NoNumber", "Sending AngleInfo - angleNr: "},
        Damage{"Sign", "Sending AngleInfo - angleNr: +1"},
        Damage{"TextAfterTheLastValue", "Sending AngleInfo - angleNr: 1 "},
        Damage{"OtherTextBetween", "Sending MarkInfo - markId: 1, tine: 2"},
        Damage{"ValueMissing", "Sending MarkInfo - markId: 1"},
        Damage{"Truth", "Sending SystemResumed - playing: true"},
        Damage{"TruthOfANumber", "Sending PipPgTextStInfo - pgTextStNr: 1, avaliable 2"}),
    [](const testing::TestParamInfo<Damage>& parameter) { return parameter.param.name; });

TEST(EventText, IsOtherIfItIsLongerThanALineWithoutValues)
{
    EXPECT_EQ(ReadEventText("Sending PausedX").kind, EventTextKind::Other);
}

TEST(EventText, IsOtherBeforeAndAfterAllLines)
{
    EXPECT_EQ(ReadEventText("").kind, EventTextKind::Other);
    EXPECT_EQ(ReadEventText("ZZZ").kind, EventTextKind::Other);
}

TEST(EventText, OfANumberShownUnsignedGivesTheSignedEnumerator)
{
    const EventText text =
        ReadEventText("Sending PlayMode - direction: 4294967295, speedIndex: 2147483648");

    ASSERT_EQ(text.kind, EventTextKind::Event);
    const auto* const mode = text.callback->As<bdmv::callbacks::PlayMode>();
    EXPECT_EQ(static_cast<std::int64_t>(mode->direction), -1);
    EXPECT_EQ(static_cast<std::int64_t>(mode->speed), std::numeric_limits<std::int32_t>::min());
}

} // namespace

} // namespace deskplayer
