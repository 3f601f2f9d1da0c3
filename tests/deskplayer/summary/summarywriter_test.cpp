#include "summary/summarywriter.h"

#include <gtest/gtest.h>

#include <nlohmann/json.hpp>
#include <sstream>
#include <string>

#include "records.h"

namespace deskplayer
{

namespace
{

RecordingSummary OneOfEverything()
{
    Summarizer summarizer;
    summarizer.OnStart({Seconds(0), "May 31 20:15:00"});
    summarizer.OnRecord(At(0, callbacks::PlayStarted{}));
    summarizer.OnRecord(At(1, Forbidding({bd::UserOperationChapterSearch})));
    summarizer.OnRecord(At(4, callbacks::SecondaryAudioInfo{1}));
    summarizer.OnRecord(ContinuingAt(Seconds(4) + std::chrono::milliseconds(250),
                                     callbacks::SecondaryAudioDisplay{1, true}));
    summarizer.OnGap({Seconds(5), "lost", 17});
    summarizer.OnGap({Seconds(6), "restart", {}});
    summarizer.OnRecord(At(8, callbacks::SecondaryAudioDisplay{1, false}));
    RecordingSummary summary = summarizer.Summary();
    summary.log = LogSummary{3, 2};
    return summary;
}

std::string TextOf(const RecordingSummary& summary)
{
    std::ostringstream stream;
    WriteSummary(stream, summary);
    return stream.str();
}

std::string JsonOf(const RecordingSummary& summary)
{
    std::ostringstream stream;
    WriteSummaryAsJson(stream, summary);
    return stream.str();
}

TEST(SummaryText, HasATableForEachSubject)
{
    EXPECT_EQ(TextOf(OneOfEverything()), R"(Recording
  wall clock     May 31 20:15:00
  begin          00:00:00.000
  end            00:00:08.000
  duration       00:00:08.000
  callbacks      5
  foreign lines  3
  damaged lines  2

Gaps
  cause    count  lost  first         last
  lost         1    17  00:00:05.000  00:00:05.000
  restart      1     -  00:00:06.000  00:00:06.000

Last callback
  00:00:08.000  SecondaryAudioDisplay  number=1 shown=false

Longest waits within events, of 1
  wait          at            after               before
  00:00:00.250  00:00:04.000  SecondaryAudioInfo  SecondaryAudioDisplay

States of playback
  state           total   share  count
  Playing  00:00:04.250  53.1 %      1
  Unknown  00:00:03.750  46.9 %      1

Forbidden user operations
  operation             total  count  at the end
  ChapterSearch  00:00:03.250      1  unknown

Callbacks
  callback               count  first         last
  PlayStarted                1  00:00:00.000  00:00:00.000
  SecondaryAudioInfo         1  00:00:04.000  00:00:04.000
  UOMask                     1  00:00:01.000  00:00:01.000
  SecondaryAudioDisplay      2  00:00:04.250  00:00:08.000
)");
}

TEST(SummaryText, SaysWhatThereIsNoneOf)
{
    EXPECT_EQ(TextOf({}), R"(Recording
  begin      00:00:00.000
  end        00:00:00.000
  duration   00:00:00.000
  callbacks  0

Gaps
  none

Last callback
  none

States of playback
  none

Forbidden user operations
  none

Callbacks
  none
)");
}

TEST(SummaryText, HasNoShareOfNoTime)
{
    Summarizer summarizer;
    summarizer.OnRecord(At(5, callbacks::Paused{}));

    EXPECT_NE(TextOf(summarizer.Summary()).find("Paused  00:00:00.000  0.0 %      1\n"),
              std::string::npos);
}

TEST(SummaryText, SaysWhatIsForbiddenAtTheEnd)
{
    Summarizer summarizer;
    summarizer.OnRecord(At(0, Forbidding({bd::UserOperationChapterSearch})));
    summarizer.OnRecord(At(2, callbacks::Paused{}));
    EXPECT_NE(TextOf(summarizer.Summary()).find("00:00:02.000      1  forbidden\n"),
              std::string::npos);
    EXPECT_NE(JsonOf(summarizer.Summary()).find("\"forbiddenAtEnd\":true"), std::string::npos);

    summarizer.OnRecord(At(3, Forbidding({})));
    EXPECT_NE(TextOf(summarizer.Summary()).find("00:00:03.000      1  permitted\n"),
              std::string::npos);
    EXPECT_NE(JsonOf(summarizer.Summary()).find("\"forbiddenAtEnd\":false"), std::string::npos);
}

TEST(SummaryJson, IsOneObjectOnOneLine)
{
    EXPECT_EQ(
        JsonOf(OneOfEverything()),
        R"({"wallClock":"May 31 20:15:00","begin":{"ticks":0,"time":"00:00:00.000"},)"
        R"("end":{"ticks":360000,"time":"00:00:08.000"},"duration":{"ticks":360000,"time":"00:00:08.000"},)"
        R"("callbacks":5,"foreignLines":3,"damagedLines":2,"gaps":[)"
        R"({"cause":"lost","count":1,"lost":17,"first":{"ticks":225000,"time":"00:00:05.000"},)"
        R"("last":{"ticks":225000,"time":"00:00:05.000"}},)"
        R"({"cause":"restart","count":1,"first":{"ticks":270000,"time":"00:00:06.000"},)"
        R"("last":{"ticks":270000,"time":"00:00:06.000"}}],)"
        R"("lastCallback":{"at":{"ticks":360000,"time":"00:00:08.000"},"callback":"SecondaryAudioDisplay",)"
        R"("arguments":{"number":1,"shown":false}},)"
        R"("waits":{"measured":1,"longest":[{"wait":{"ticks":11250,"time":"00:00:00.250"},)"
        R"("at":{"ticks":180000,"time":"00:00:04.000"},"after":"SecondaryAudioInfo","before":"SecondaryAudioDisplay"}]},)"
        R"("states":[{"state":"Playing","total":{"ticks":191250,"time":"00:00:04.250"},"count":1},)"
        R"({"state":"Unknown","total":{"ticks":168750,"time":"00:00:03.750"},"count":1}],)"
        R"("forbiddenOperations":[{"operation":"ChapterSearch","total":{"ticks":146250,"time":"00:00:03.250"},)"
        R"("count":1,"forbiddenAtEnd":null}],)"
        R"("callbackKinds":[)"
        R"({"callback":"PlayStarted","count":1,"first":{"ticks":0,"time":"00:00:00.000"},)"
        R"("last":{"ticks":0,"time":"00:00:00.000"}},)"
        R"({"callback":"SecondaryAudioInfo","count":1,"first":{"ticks":180000,"time":"00:00:04.000"},)"
        R"("last":{"ticks":180000,"time":"00:00:04.000"}},)"
        R"({"callback":"UOMask","count":1,"first":{"ticks":45000,"time":"00:00:01.000"},)"
        R"("last":{"ticks":45000,"time":"00:00:01.000"}},)"
        R"({"callback":"SecondaryAudioDisplay","count":2,"first":{"ticks":191250,"time":"00:00:04.250"},)"
        R"("last":{"ticks":360000,"time":"00:00:08.000"}}]})"
        "\n");
}

TEST(SummaryJson, LeavesOutWhatOnlyALogHas)
{
    const auto json = nlohmann::json::parse(JsonOf({}));

    EXPECT_TRUE(json.at("lastCallback").is_null());
    for (const char* const member : {"wallClock", "foreignLines", "damagedLines", "waits"}) {
        EXPECT_EQ(json.count(member), 0U) << member;
    }
    for (const char* const member : {"gaps", "states", "forbiddenOperations", "callbackKinds"}) {
        EXPECT_EQ(json.at(member), nlohmann::json::array()) << member;
    }
}

} // namespace

} // namespace deskplayer
