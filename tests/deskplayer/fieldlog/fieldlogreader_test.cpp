#include "fieldlog/fieldlogreader.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "fieldlogkeeper.h"

namespace deskplayer
{

namespace
{

/** A line with the clock of a session. */
std::string At(const std::string& time, const std::string& text, const char* level = "Event")
{
    return time + " BdmvNavigator " + level + ": " + text + "\n";
}

std::string AtZero(const std::string& text)
{
    return At("00:00:00.000000", text);
}

const std::string Lost = "00:00:01.000000 Common Warning: lines lost: 17\n";
const std::string Day = "2024-05-31 ";

TEST(FieldLog, TakesTheTimeOfASessionAsItIs)
{
    EXPECT_EQ(
        ReadLog(At("00:00:10.000022", "Sending Paused") + At("00:01:00.000000", "Sending Stopped")),
        (Lines{"450001 Paused {}", "2700000 Stopped {}"}));
}

TEST(FieldLog, CountsFromTheFirstLineOfAWallClockAndKeepsItsTime)
{
    EXPECT_EQ(ReadLog(At(Day + "20:15:00.500000", "Sending Paused") +
                      At(Day + "20:15:02.000000", "Sending Stopped")),
              (Lines{"0 start 2024-05-31 20:15:00.500000", "0 Paused {}", "67500 Stopped {}"}));
}

TEST(FieldLog, MayBeCutAnywhere)
{
    const std::string log =
        At("00:00:10.000000", "Sending AudioInfo - audioNr: 2") + Lost + AtZero("Sending Stopped");
    const Lines whole = ReadLog(log);
    for (std::size_t cut = 0; cut <= log.size(); ++cut) {
        FieldLogKeeper keeper;
        FieldLogReader reader(keeper);
        reader.Read(std::string_view(log).substr(0, cut));
        reader.Read(std::string_view(log).substr(cut));
        reader.EndFile();
        reader.Finish();
        ASSERT_EQ(keeper.lines, whole) << cut;
    }
}

TEST(FieldLog, OmitsACallbackThatIsRevoked)
{
    EXPECT_EQ(ReadLog(AtZero("Sending PictureInPictureUnavailable") + "a foreign line\n" +
                      AtZero("Not send unavailable for async 2nd video") +
                      AtZero("Sending SecondaryAudioUnavailable") +
                      AtZero("Not send unavailable for async 2nd audio")),
              Lines());
}

TEST(FieldLog, KeepsACallbackThatTheNextLineDoesNotRevoke)
{
    EXPECT_EQ(ReadLog(AtZero("Sending PictureInPictureUnavailable") +
                      AtZero("Not send unavailable for async 2nd audio") +
                      AtZero("Sending SecondaryAudioUnavailable") + AtZero("Sending Paused") +
                      AtZero("Not send unavailable for async 2nd audio")),
              (Lines{"0 PictureInPictureUnavailable {}", "0 SecondaryAudioUnavailable {}",
                     "0 Paused {}"}));
}

TEST(FieldLog, KeepsTheRevocableCallbackAtItsEnd)
{
    EXPECT_EQ(ReadLog(AtZero("Sending PictureInPictureUnavailable")),
              (Lines{"0 PictureInPictureUnavailable {}"}));
}

TEST(FieldLog, LeavesARevocableCallbackToTheGapAfterIt)
{
    EXPECT_EQ(ReadLog(AtZero("Sending PictureInPictureUnavailable") + Lost),
              (Lines{"45000 gap lost 17"}));
}

TEST(FieldLog, CompletesATriggerByTheDiagnosticLine)
{
    const std::string diagnostic =
        At("00:00:00.000000", "TriggerRead time type=6,time = 90", "Warning");
    const std::string type = ReadLog(diagnostic).at(0);

    EXPECT_EQ(ReadLog(AtZero("Sending Trigger Reached") + diagnostic), (Lines{type}));
    EXPECT_NE(type.find("\"time\":90"), std::string::npos) << type;
    EXPECT_EQ(ReadLog(AtZero("Sending Trigger Reached") + AtZero("Sending Paused") + diagnostic),
              (Lines{"0 TriggerTimeReached {}", "0 Paused {}", type}));
    EXPECT_EQ(ReadLog(AtZero("Sending Trigger Reached") + Lost),
              (Lines{"0 TriggerTimeReached {}", "45000 gap lost 17"}));
}

TEST(FieldLog, SkipsAndCountsForeignLines)
{
    FieldLogCounts counts;
    EXPECT_EQ(ReadLog("hello\n\n" + AtZero("Sending Paused") + AtZero("Sending something else") +
                          "00:00:00.000000 BdmvNavigator State: Sending Paused\n"
                          "00:00:00.000000 BdmvSystem Event: Sending Paused\n"
                          "00:00:00.000000 Common Warning: lines lost: many\n"
                          "00:00:00.000000 Common Warning: lines lost: 1 or 2\n"
                          "00:00:00.000000 Common Event: lines lost: 1\n"
                          "00:00:00.000000 Reader Warning: lines lost: 1\n",
                      &counts),
              (Lines{"0 Paused {}"}));
    EXPECT_EQ(counts.callbacks, 1U);
    EXPECT_EQ(counts.foreignLines, 9U);
    EXPECT_EQ(counts.damagedLines, 0U);
}

TEST(FieldLog, SkipsALineWithoutAComponentOrALevel)
{
    EXPECT_EQ(ReadLog("00:00:00.000000  Event: Sending Paused\n"
                      "00:00:00.000000 BdmvNavigator : Sending Paused\n"),
              Lines());
}

TEST(FieldLog, HasAGapForADamagedLine)
{
    FieldLogCounts counts;
    EXPECT_EQ(ReadLog(AtZero("Sending PictureInPictureUnavailable") +
                          AtZero("Sending AngleInfo - angleNr: 256"),
                      &counts),
              (Lines{"0 PictureInPictureUnavailable {}", "0 gap damaged 1"}));
    EXPECT_EQ(counts.damagedLines, 1U);
}

TEST(FieldLog, AcceptsNumbersOfComponentAndLevelAndCarriageReturns)
{
    EXPECT_EQ(ReadLog("00:00:00.000000 57 5: Sending Paused\r\n"), (Lines{"0 Paused {}"}));
}

TEST(FieldLog, UndoesEscapes)
{
    EXPECT_EQ(ReadLog(AtZero("Sending\\x20Paused")), (Lines{"0 Paused {}"}));
}

/** A line of the system's log that has this length, because the name of its host is long. */
std::string LineOfLength(std::size_t length)
{
    const std::string before = "2024-05-31T20:15:00Z ";
    const std::string after = " player[1]: BdmvNavigator Event: Sending Paused";
    return before + std::string(length - before.size() - after.size(), 'h') + after + "\n";
}

TEST(FieldLog, SkipsALineThatIsTooLong)
{
    FieldLogCounts counts;
    EXPECT_EQ(ReadLog(LineOfLength(FieldLogReader::LongestLine + 1), &counts), Lines());
    EXPECT_EQ(counts.foreignLines, 1U);
    EXPECT_EQ(ReadLog(LineOfLength(FieldLogReader::LongestLine), &counts),
              (Lines{"0 start 2024-05-31T20:15:00Z", "0 Paused {}"}));
    EXPECT_EQ(counts.foreignLines, 0U);
}

TEST(FieldLog, SkipsALineThatBecomesTooLongInParts)
{
    FieldLogKeeper keeper;
    FieldLogReader reader(keeper);
    const std::string part(FieldLogReader::LongestLine, ' ');
    for (int parts = 0; parts < 3; ++parts) {
        reader.Read(part);
    }
    reader.Read(AtZero("Sending Paused") + AtZero("Sending Stopped"));

    EXPECT_EQ(keeper.lines, (Lines{"0 Stopped {}"}));
    EXPECT_EQ(reader.Counts().foreignLines, 1U);
}

TEST(FieldLog, HasAGapForATruncatedLastLine)
{
    const std::string line = AtZero("Sending Playlist - playListId: 800");

    EXPECT_EQ(ReadLog(AtZero("Sending Paused") + line.substr(0, line.size() - 1)),
              (Lines{"0 Paused {}", "0 gap truncated"}));
    EXPECT_EQ(ReadLog(std::string(FieldLogReader::LongestLine + 1, ' ')),
              (Lines{"0 gap truncated"}));
}

TEST(FieldLog, ContinuesInTheNextFile)
{
    FieldLogKeeper keeper;
    FieldLogReader reader(keeper);
    reader.Read(AtZero("Sending PictureInPictureUnavailable"));
    reader.EndFile();
    reader.Read(AtZero("Not send unavailable for async 2nd video"));
    reader.EndFile();
    reader.Finish();

    EXPECT_EQ(keeper.lines, Lines());
}

TEST(FieldLog, HasARestartWhereTheTimeOfTheSessionGoesBack)
{
    EXPECT_EQ(ReadLog(At("00:00:10.000000", "Sending Stopped") +
                      At("00:00:09.999999", "Sending PlayStarted")),
              (Lines{"450000 Stopped {}", "900000 gap restart", "900000 PlayStarted {}"}));
}

std::string FromProcess(const std::string& process, const std::string& second)
{
    return "May 31 20:15:" + second + " box " + process + ": BdmvNavigator Event: Sending Paused\n";
}

TEST(FieldLog, HasARestartWhereTheProcessChanges)
{
    EXPECT_EQ(ReadLog(FromProcess("player[1]", "00") + FromProcess("player[1]", "01") +
                      FromProcess("player[2]", "02")),
              (Lines{"0 start May 31 20:15:00", "0 Paused {}", "45000 Paused {}",
                     "90000 gap restart", "90000 start May 31 20:15:02", "90000 Paused {}"}));
}

TEST(FieldLog, HasARestartWhereTheSystemWasBootedAgain)
{
    for (const std::string boot : {"-- Boot 8d2c --\n", "-- Reboot --\n"}) {
        EXPECT_EQ(ReadLog(boot + FromProcess("player[1]", "00") + boot + boot +
                          FromProcess("player[1]", "02")),
                  (Lines{"0 start May 31 20:15:00", "0 Paused {}", "90000 gap restart",
                         "90000 start May 31 20:15:02", "90000 Paused {}"}));
    }
}

TEST(FieldLog, HasAGapWhereTheWallClockJumps)
{
    EXPECT_EQ(
        ReadLog(At("1970-01-01 00:00:10.000000", "Sending Paused") +
                At("2024-05-31 20:15:00.000000", "Sending Stopped") +
                At("2024-05-31 19:15:00.000000", "Sending PlayStarted") +
                At("2024-06-01 19:15:00.000000", "Sending Paused")),
        (Lines{"0 start 1970-01-01 00:00:10.000000", "0 Paused {}", "0 gap clock",
               "0 start 2024-05-31 20:15:00.000000", "0 Stopped {}", "0 gap clock",
               "0 start 2024-05-31 19:15:00.000000", "0 PlayStarted {}", "3888000000 Paused {}"}));
}

TEST(FieldLog, HasNoGapWhereThreadsWroteInAnotherOrder)
{
    EXPECT_EQ(ReadLog(At(Day + "20:15:01.000000", "Sending Paused") +
                      At(Day + "20:15:00.000000", "Sending Stopped") +
                      At(Day + "20:15:02.000000", "Sending PlayStarted")),
              (Lines{"0 start 2024-05-31 20:15:01.000000", "0 Paused {}", "0 Stopped {}",
                     "45000 PlayStarted {}"}));
}

TEST(FieldLog, WithoutYearsContinuesInJanuary)
{
    const std::string rest = " box player[1]: BdmvNavigator Event: Sending Paused\n";
    EXPECT_EQ(
        ReadLog("Dec 31 23:59:59" + rest + "Jan  1 00:00:00" + rest + "Jan  1 00:00:01" + rest),
        (Lines{"0 start Dec 31 23:59:59", "0 Paused {}", "45000 Paused {}", "90000 Paused {}"}));
}

TEST(FieldLog, ChangesItsKindOfTimeWithAGap)
{
    EXPECT_EQ(ReadLog(At("00:00:10.000000", "Sending Paused") +
                      At(Day + "20:15:00.000000", "Sending Stopped")),
              (Lines{"450000 Paused {}", "450000 gap clock",
                     "450000 start 2024-05-31 20:15:00.000000", "450000 Stopped {}"}));
}

TEST(FieldLog, OfTheJournalIsReadFromJson)
{
    EXPECT_EQ(ReadLog(R"({"__REALTIME_TIMESTAMP":"1717186500123456",)"
                      R"("MESSAGE":"BdmvNavigator Event: Sending Paused"})"
                      "\n"),
              (Lines{"0 start 2024-05-31T20:15:00.123456Z", "0 Paused {}"}));
}

TEST(FieldLog, OfAnotherKindIsReadByAPattern)
{
    FieldLogKeeper keeper;
    FieldLogReader reader(keeper, PrefixPattern("[{time}] {text}"));
    reader.Read("[  1.0] Sending Paused\n[  2.0] Sending Stopped\n[0.5] Sending Paused\n" +
                AtZero("Sending Paused"));
    reader.Finish();

    EXPECT_EQ(keeper.lines,
              (Lines{"0 Paused {}", "45000 Stopped {}", "67500 gap restart", "67500 Paused {}"}));
    EXPECT_EQ(reader.Counts().foreignLines, 1U);
}

/** Whether each callback of a log continues the event of the one before. */
std::string Continuations(const std::string& log)
{
    FieldLogKeeper keeper;
    FieldLogReader reader(keeper);
    reader.Read(log);
    reader.Finish();
    std::string flags;
    for (const CallbackRecord& record : keeper.records) {
        flags += record.continuesEvent ? '+' : '-';
    }
    return flags;
}

const std::string Item =
    AtZero("Sending PlayItem - playListId: 1, playItemId: 0, videoFormat 6, aspectRatio 3");
const std::string ItemVideo = AtZero("Send available for async 2nd video");
const std::string ItemAudio = AtZero("Send unavailable for 2nd audio");

TEST(FieldLog, ShowsWhichCallbacksContinueAnEvent)
{
    EXPECT_EQ(Continuations(Item + "a foreign line\n" + ItemVideo + ItemAudio + Item + Item),
              "-++--");
    EXPECT_EQ(Continuations(AtZero("Sending Trigger Reached") +
                            At("00:00:00.000000", "TriggerRead time type=6,time = 90", "Warning")),
              "-");
}

TEST(FieldLog, ContinuesNoEventWhoseFirstLineIsMissing)
{
    EXPECT_EQ(Continuations(ItemVideo + ItemAudio), "--");
    EXPECT_EQ(Continuations(AtZero("Sending PlayMode - direction: 0, speedIndex: 0") + ItemVideo),
              "--");
}

TEST(FieldLog, ContinuesNoEventAfterAnotherOne)
{
    EXPECT_EQ(Continuations(Item + AtZero("Sending Paused") + ItemVideo), "---");
    EXPECT_EQ(
        Continuations(Item + AtZero("For normal play notify async pip available") + ItemVideo),
        "---");
}

TEST(FieldLog, ContinuesNoEventAfterAGap)
{
    EXPECT_EQ(Continuations(Item + Lost + At("00:00:01.000000", "Send unavailable for 2nd audio")),
              "--");
}

TEST(FieldLog, NeverExceedsTheLargestTime)
{
    std::string log;
    for (int i = 0; i < 20000; ++i) {
        log += At("99999:00:00.000000", "Sending Paused") + AtZero("Sending Stopped");
    }
    EXPECT_EQ(ReadLog(log).back(), "72057594037927936 Stopped {}");
}

} // namespace

} // namespace deskplayer
