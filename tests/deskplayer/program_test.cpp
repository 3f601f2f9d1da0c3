#include "program.h"

#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <chrono>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <map>
#include <nlohmann/json.hpp>
#include <regex>
#include <set>
#include <sstream>
#include <thread>

#include "disc/bytewriter.h"
#include "disc/testdiscs.h"
#include "output/callbacks.h"
#include "session/script.h"

namespace
{

namespace fs = std::filesystem;

const std::string SampleDisc = BDMVNAVIGATOR_SAMPLE_DISC;
const std::string AllEvents = BDMVNAVIGATOR_SESSIONS "/all-events.session";
const std::string Evening = BDMVNAVIGATOR_SESSIONS "/evening.session";

std::vector<std::string> LinesOf(const std::string& text)
{
    std::vector<std::string> lines;
    std::istringstream stream(text);
    for (std::string line; std::getline(stream, line);) {
        lines.push_back(line);
    }
    return lines;
}

std::string LastLine(const std::string& text)
{
    const std::vector<std::string> lines = LinesOf(text);
    return lines.empty() ? "" : lines.back();
}

/** The lines of @p text that @p pattern is not in. */
std::string Without(const std::string& pattern, const std::string& text)
{
    std::string rest;
    for (const std::string& line : LinesOf(text)) {
        if (line.find(pattern) == std::string::npos) {
            rest += line + "\n";
        }
    }
    return rest;
}

std::string ContentOf(const fs::path& path)
{
    std::ifstream file(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
}

/** Wrong usage is explained in one line, nothing is played, and the exit status is 2. */
void ExpectUsageError(const std::vector<std::string>& arguments, const std::string& message)
{
    const ProgramResult result = RunDeskPlayer(arguments);
    EXPECT_EQ(result.status, 2);
    EXPECT_EQ(result.output, "");
    EXPECT_EQ(result.errors, "bdmv-deskplayer: " + message + "\n");
}

/** A folder for the files of a test. */
class ScratchFolder : public testing::Test
{
protected:
    ScratchFolder()
    {
        fs::remove_all(folder);
        fs::create_directories(folder);
    }

    ~ScratchFolder() override { fs::remove_all(folder); }

    /** @return its path */
    std::string WriteFile(const std::string& name, const std::string& content) const
    {
        std::ofstream(folder / name, std::ios::binary) << content;
        return folder / name;
    }

    const fs::path folder =
        fs::temp_directory_path() / ("program-test-" + std::to_string(getpid()));
};

/** A disc of its own for every test, a copy of the sample disc, to be changed. */
class ScratchDisc : public ScratchFolder
{
protected:
    ScratchDisc()
    {
        fs::copy(SampleDisc, disc, fs::copy_options::recursive);
        fs::remove(disc / "BDMV/PLAYLIST/00002.mpls");
    }

    /** Writes over bytes of the play list. */
    void Patch(std::streamoff offset, const std::string& bytes) const
    {
        std::fstream file(playList, std::ios::binary | std::ios::in | std::ios::out);
        file.seekp(offset);
        file << bytes;
    }

    /** Puts the trailer in the place of the film, and has it last so many ticks of 45 kHz. */
    void MakeShort(std::uint32_t ticks) const
    {
        const std::streamoff inTimeOfTheFirstItem = 0x52;
        fs::copy_file(fs::path(SampleDisc) / "BDMV/PLAYLIST/00002.mpls", playList,
                      fs::copy_options::overwrite_existing);
        std::fstream file(playList, std::ios::binary | std::ios::in | std::ios::out);
        file.seekg(inTimeOfTheFirstItem);
        std::uint32_t time = ticks;
        for (int shift = 24; shift >= 0; shift -= 8) {
            time += static_cast<std::uint32_t>(file.get()) << shift;
        }
        file.seekp(inTimeOfTheFirstItem + 4);
        for (int shift = 24; shift >= 0; shift -= 8) {
            file.put(static_cast<char>(time >> shift));
        }
    }

    /** The desk player says in one line what is wrong, plays nothing, and exits with status 3. */
    void ExpectRefused(const std::string& message,
                       const std::vector<std::string>& furtherArguments = {}) const
    {
        std::vector<std::string> arguments = {disc};
        arguments.insert(arguments.end(), furtherArguments.begin(), furtherArguments.end());
        const ProgramResult result = RunDeskPlayer(arguments);
        EXPECT_EQ(result.status, 3);
        EXPECT_EQ(result.output, "");
        EXPECT_EQ(std::count(result.errors.begin(), result.errors.end(), '\n'), 1);
        EXPECT_TRUE(std::regex_search(result.errors, std::regex(message))) << result.errors;
    }

    const fs::path disc = folder / "disc";
    const fs::path playList = disc / "BDMV/PLAYLIST/00001.mpls";
};

// ---------------------------------------------------------------------------------------------
// From start to end

TEST(DeskPlayer, PlaysThePlayListThatIsNamedFromStartToEnd)
{
    const ProgramResult result = RunDeskPlayer({SampleDisc, "--playlist", "2"});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.errors, "");
    EXPECT_EQ(Without("CurrentTimePosition", result.output),
              "00:00:00.000  PlayStarted\n"
              "00:00:00.000  Playlist                    playListId=2\n"
              "00:00:00.000  PlayItem                    playListId=2 playItemId=0 "
              "videoFormat=480i aspectRatio=4:3\n"
              "00:00:00.000  VideoInfo                   number=1\n"
              "00:00:00.000  AudioInfo                   number=1\n"
              "00:00:00.000  AngleInfo                   number=1\n"
              "00:00:00.000  AudioInfoChanged            isPrimary=true format=Ac3 "
              "sampleRate=48000 bitsPerSample=Invalid channels=Stereo pid=4352 channelLayout=0\n"
              "00:00:00.000  UOMask                      forbidden=nothing\n"
              "00:00:00.000  FirstPictureDelivered\n"
              "00:00:00.000  MarkInfo                    playListId=2 markId=0 "
              "time=00:00:00.000\n"
              "00:00:00.000  ChapterNumber               chapter=1\n"
              "00:00:20.000  Finished                    reason=EndOfMedia\n");
    EXPECT_EQ(LinesOf(result.output).size(), 12U + 21U) << "and the position of every second";
}

TEST(DeskPlayer, PlaysTheLongestPlayListAndLeavesAnEndlessStillByItself)
{
    const ProgramResult result =
        RunDeskPlayer({SampleDisc, "--only", "Playlist,StillOn,StillOff,Finished"});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.errors, "");
    EXPECT_EQ(result.output, "00:00:00.000  Playlist                    playListId=1\n"
                             "00:02:53.000  StillOn\n"
                             "00:02:58.000  StillOff\n"
                             "00:02:59.000  StillOn\n"
                             "00:03:02.000  StillOff\n"
                             "00:03:02.000  Finished                    reason=EndOfMedia\n");
}

TEST(DeskPlayer, TakesTheBdmvFolderItselfForADisc)
{
    EXPECT_EQ(RunDeskPlayer({SampleDisc + "/BDMV"}).output, RunDeskPlayer({SampleDisc}).output);
}

TEST(DeskPlayer, PlaysEveryDiscToTheEndOfItsMedia)
{
    std::vector<fs::path> folders = {BDMVNAVIGATOR_TEST_DISCS};
    if (const char* const more = std::getenv("BDMVNAVIGATOR_DISCS")) {
        folders.emplace_back(more);
    }
    int discs = 0;
    for (const fs::path& folder : folders) {
        for (const fs::directory_entry& disc : fs::directory_iterator(folder)) {
            if (!fs::is_directory(disc.path() / "BDMV")) {
                continue;
            }
            SCOPED_TRACE(disc.path().filename());
            const ProgramResult result = RunDeskPlayer({disc.path()});
            EXPECT_EQ(result.status, 0);
            EXPECT_EQ(result.errors, "");
            EXPECT_EQ(LastLine(result.output).substr(sizeof "hh:mm:ss.mmm"),
                      " Finished                    reason=EndOfMedia");
            ++discs;
        }
    }
    EXPECT_GE(discs, 15);
}

TEST_F(ScratchDisc, OfLessThanASecondPlaysAsLongInRealTime)
{
    MakeShort(45 * 250);
    const auto start = std::chrono::steady_clock::now();

    const ProgramResult result =
        RunDeskPlayer({disc, "--realtime", "--only", "PlayStarted,Finished"});

    EXPECT_GE(std::chrono::steady_clock::now() - start, std::chrono::milliseconds(250));
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.output, "00:00:00.000  PlayStarted\n"
                             "00:00:00.250  Finished                    reason=EndOfMedia\n");
}

TEST_F(ScratchDisc, OfTwoHoursPlaysSecondBySecond)
{
    MakeShort(2 * 3600 * 45000);

    const ProgramResult result = RunDeskPlayer({disc, "--only", "CurrentTimePosition,Finished"});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(LinesOf(result.output).size(), 7202U);
    EXPECT_EQ(LastLine(result.output),
              "02:00:00.000  Finished                    reason=EndOfMedia");
}

TEST_F(ScratchDisc, PlaysWhatCanBeReadAndNamesWhatCannot)
{
    fs::copy_file(disc / "BDMV/index.bdmv", disc / "BDMV/PLAYLIST/00003.mpls");

    const ProgramResult result = RunDeskPlayer({disc});

    EXPECT_EQ(result.status, 0);
    EXPECT_TRUE(
        std::regex_search(result.errors, std::regex("left out: .*00003\\.mpls: offset 0: .*INDX")))
        << result.errors;
    EXPECT_EQ(LastLine(result.output),
              "00:03:02.000  Finished                    reason=EndOfMedia");
}

// ---------------------------------------------------------------------------------------------
// Sessions

TEST(DeskPlayerSession, OfAllEventsCallsEveryCallback)
{
    const ProgramResult result = RunDeskPlayer({SampleDisc, "--session", AllEvents});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.errors, "bdmv-deskplayer: " + AllEvents +
                                 ":8: refused at 00:00:02.000: SkipToNextPoint is forbidden by "
                                 "play item 0\n");
    std::set<std::string> called;
    for (const std::string& line : LinesOf(result.output)) {
        const std::string callback = line.substr(sizeof "hh:mm:ss.mmm ");
        called.insert(callback.substr(0, callback.find(' ')));
    }
    std::set<std::string> all;
    for (const deskplayer::CallbackInfo& info : deskplayer::AllCallbacks) {
        all.emplace(info.name);
    }
    EXPECT_EQ(all.size(), 56U);
    EXPECT_EQ(called, all);
}

/** The line of every event, with its values made alike. */
const std::set<std::string> LinesOfEvents = {
    "Sending AngleInfo - angleNr: #",
    "Sending AudioChannelsChanged",
    "Sending AudioInfo - audioNr: #",
    "Sending ButtonActivationBusy",
    "Sending ButtonActivationDone",
    "Sending Chapter - chapterNumber: #",
    "Sending Continued with playmode: dir #, speed # (currentplaymode: dir #, speed #)",
    "Sending CurrentTimePosition - position: #",
    "Sending ExecuteButton - ticket: #, buttonId: #",
    "Sending Finished - reason: #",
    "Sending FirstPictureDeliveredEvent",
    "Sending InteractiveGraphicsActive",
    "Sending InteractiveGraphicsInactive",
    "Sending InteractiveGraphicsInfo - igNr: #",
    "Sending InteractiveGraphicsInvisible",
    "Sending InteractiveGraphicsVisible",
    "Sending JumpOccurred",
    "Sending MarkInfo - markId: #, time: #",
    "Sending Paused",
    "Sending PictureInPictureAvailable",
    "Sending PictureInPictureUnavailable",
    "Sending PipPgTextSelectEvent - pip pick?: #",
    "Sending PipPgTextStInfo - pgTextStNr: #, avaliable #",
    "Sending PlayFailed",
    "Sending PlayItem - playListId: #, playItemId: #, videoFormat #, aspectRatio #",
    "Sending PlayMode - direction: #, speedIndex: #",
    "Sending PlayStarted",
    "Sending Playlist - playListId: #",
    "Sending PopUpMenuAvailable",
    "Sending PopUpMenuUnavailable",
    "Sending PreloadFailed",
    "Sending PresentationGraphicsDisplay - shown: #",
    "Sending PresentationGraphicsInfo - pgTextStNr: #, available: #",
    "Sending ResumeFailed",
    "Sending Resumed",
    "Sending SecondaryAudioAvailable",
    "Sending SecondaryAudioDisplay - audioNr #, numOfAudios #, shown: #",
    "Sending SecondaryAudioInfo - audioNr: #",
    "Sending SecondaryAudioUnavailable",
    "Sending SecondaryVideoDisplay - video Nr #, numofVideos #, async #, shown: #",
    "Sending SecondaryVideoInfo - videoNr: #",
    "Sending Stepped - position: #,dir=#",
    "Sending StillOff",
    "Sending StillOn",
    "Sending Stopped",
    "Sending Suspended",
    "Sending SystemResumeFailed",
    "Sending SystemResumed - playing: #",
    "Sending SystemSuspended - dataSize: #",
    "Sending TextSubtitleStyleInfo - styleNumber: #",
    "Sending TextSubtitleStylesAvailable - numberOfStyles: #",
    "Sending Trigger Reached",
    "Sending Trigger Set",
    "Sending UOMask - uoMask: #",
    "Sending VideoInfo - videoNr: #",
    "Sending ZoomModeSetEvent callback"};

TEST(DeskPlayerSession, OfAllEventsLogsEveryEvent)
{
    const ProgramResult result = RunDeskPlayer(
        {SampleDisc, "--session", AllEvents, "--log", "BdmvNavigator=Event+hifreq|Warning"});

    const std::regex eventLine(".{26} BdmvNavigator Event: (Sending [^(].*)");
    const std::regex value("[0-9]+|TRUE|FALSE");
    std::set<std::string> logged;
    for (const std::string& line : LinesOf(result.errors)) {
        std::smatch match;
        if (std::regex_match(line, match, eventLine)) {
            logged.insert(std::regex_replace(match[1].str(), value, "#"));
        }
    }
    EXPECT_EQ(LinesOfEvents.size(), 56U);
    EXPECT_EQ(logged, LinesOfEvents);
    EXPECT_NE(result.errors.find(" BdmvNavigator Warning: TriggerRead time type="),
              std::string::npos);
}

TEST(DeskPlayerSession, OfAnEveningPlaysToTheEnd)
{
    const ProgramResult result = RunDeskPlayer({SampleDisc, "--session", Evening});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.errors, "bdmv-deskplayer: " + Evening +
                                 ":4: refused at 00:00:02.000: SkipToNextPoint is forbidden by "
                                 "play item 0\n");
    EXPECT_EQ(LastLine(result.output),
              "08:03:35.000  Finished                    reason=EndOfMedia");
}

TEST(DeskPlayerSession, IsTheSameByteForByteEveryTime)
{
    for (const char* const format : {"text", "json", "trace"}) {
        const std::vector<std::string> arguments = {SampleDisc, "--session", AllEvents, "--format",
                                                    format};
        const ProgramResult first = RunDeskPlayer(arguments);
        const ProgramResult second = RunDeskPlayer(arguments);
        EXPECT_NE(first.output, "");
        EXPECT_EQ(first.output, second.output);
        EXPECT_EQ(first.errors, second.errors);
    }
}

TEST_F(ScratchFolder, HasASessionThatCannotBeRead)
{
    const std::string wrong = WriteFile("wrong.session", "play\n  nxt 3\n");
    const ProgramResult result = RunDeskPlayer({SampleDisc, "--session", wrong});
    EXPECT_EQ(result.status, 2);
    EXPECT_EQ(result.output, "");
    EXPECT_EQ(result.errors.rfind("bdmv-deskplayer: " + wrong +
                                      ":2:3: 'nxt' is no command here; expected at, after, play, ",
                                  0),
              0U)
        << result.errors;
    EXPECT_EQ(LinesOf(result.errors).size(), 1U);

    const std::string noTextFile = ": no session that can be read, expected a text file";
    ExpectUsageError({SampleDisc, "--session", "no.session"}, "no.session" + noTextFile);
    ExpectUsageError({SampleDisc, "--session", folder}, folder.string() + noTextFile);

    const std::string tooLong = ": has more than 1048576 bytes, expected a session";
    const std::string longFile = WriteFile("long.session", std::string(1024 * 1024 + 1, '\n'));
    ExpectUsageError({SampleDisc, "--session", longFile}, longFile + tooLong);
    ExpectUsageError({SampleDisc, "--session", "/dev/zero"}, "/dev/zero" + tooLong);
}

TEST_F(ScratchFolder, HasTheLongestSessionThereCanBe)
{
    const std::string script = WriteFile("a.session", std::string(1024 * 1024 - 4, '\n') + "play");

    const ProgramResult result =
        RunDeskPlayer({SampleDisc, "--session", script, "--only", "PlayStarted"});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.output, "00:00:00.000  PlayStarted\n");
}

TEST_F(ScratchFolder, HasASessionOfTwoHours)
{
    const std::string script =
        WriteFile("a.session", "play\nrepeat title\nafter 2h repeat off\nafter 1s stop\n");

    const ProgramResult result = RunDeskPlayer(
        {SampleDisc, "--playlist", "2", "--session", script, "--only", "JumpOccurred,Stopped"});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(LinesOf(result.output).size(), 360U + 1U);
    EXPECT_EQ(LastLine(result.output), "02:00:01.000  Stopped");
}

// ---------------------------------------------------------------------------------------------
// Output

TEST(DeskPlayerOutput, IsOneJsonObjectALine)
{
    const ProgramResult text = RunDeskPlayer({SampleDisc, "--session", AllEvents});
    const ProgramResult json =
        RunDeskPlayer({SampleDisc, "--session", AllEvents, "--format", "json"});

    EXPECT_EQ(json.status, 0);
    const std::vector<std::string> lines = LinesOf(text.output);
    const std::vector<std::string> objects = LinesOf(json.output);
    ASSERT_EQ(objects.size(), lines.size());
    for (std::size_t i = 0; i < lines.size(); ++i) {
        const nlohmann::json object = nlohmann::json::parse(objects[i]);
        const std::string start =
            object.at("time").get<std::string>() + "  " + object.at("callback").get<std::string>();
        EXPECT_EQ((lines[i] + " ").rfind(start + " ", 0), 0U) << lines[i];
    }
}

/** Reads a trace as a viewer does: track by track. */
void ExpectTraceThatAViewerCanShow(const std::string& output)
{
    struct Track {
        double last = 0;
        std::vector<std::string> open;
    };
    std::map<int, Track> tracks;
    const nlohmann::json trace = nlohmann::json::parse(output);
    ASSERT_TRUE(trace.is_array());
    for (const nlohmann::json& event : trace) {
        const std::string phase = event.at("ph");
        if (phase == "M") {
            continue;
        }
        Track& track = tracks[event.at("tid")];
        EXPECT_GE(event.at("ts"), track.last) << event;
        track.last = event.at("ts");
        if (phase == "B") {
            track.open.push_back(event.at("name"));
            EXPECT_EQ(track.open.size(), 1U) << event;
        } else if (phase == "E") {
            ASSERT_FALSE(track.open.empty()) << event;
            EXPECT_EQ(track.open.back(), event.at("name")) << event;
            track.open.pop_back();
        } else {
            EXPECT_EQ(phase, "i") << event;
        }
    }
    EXPECT_GT(tracks.size(), 5U);
    for (const auto& [thread, track] : tracks) {
        EXPECT_TRUE(track.open.empty()) << thread << ": " << testing::PrintToString(track.open);
    }
}

TEST(DeskPlayerOutput, IsATraceWhoseSlicesPairAndWhoseTimesNeverDecrease)
{
    for (const std::string& session : {AllEvents, Evening}) {
        SCOPED_TRACE(session);
        const ProgramResult result =
            RunDeskPlayer({SampleDisc, "--session", session, "--format", "trace"});

        EXPECT_EQ(result.status, 0);
        ExpectTraceThatAViewerCanShow(result.output);
    }
}

TEST(DeskPlayerOutput, IsATraceOfEveryDisc)
{
    for (const fs::directory_entry& disc : fs::directory_iterator(BDMVNAVIGATOR_TEST_DISCS)) {
        if (fs::is_directory(disc.path() / "BDMV")) {
            SCOPED_TRACE(disc.path().filename());
            ExpectTraceThatAViewerCanShow(RunDeskPlayer({disc.path(), "--format", "trace"}).output);
        }
    }
}

TEST_F(ScratchFolder, GetsTheOutputThatIsSentToAFile)
{
    const std::string file = folder / "out.txt";

    const ProgramResult result = RunDeskPlayer({SampleDisc, "--output", file});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.output, "");
    EXPECT_EQ(ContentOf(file), RunDeskPlayer({SampleDisc}).output);
}

TEST_F(ScratchDisc, LeavesTheOutputFileAloneUntilAllThatIsToBeReadWasRead)
{
    const std::string file = WriteFile("precious.txt", "precious");
    const std::string wrong = WriteFile("wrong.session", "nxt");
    fs::copy_file(disc / "BDMV/index.bdmv", disc / "BDMV/PLAYLIST/00003.mpls");
    fs::create_directory(folder / "BDMV");
    const struct {
        int status;
        std::vector<std::string> arguments;
    } faults[] = {{2, {disc, "--format", "x"}},
                  {2, {disc, "--listen", "x"}},
                  {2, {disc, "--only", "x"}},
                  {2, {disc, "--list", "--format", "x"}},
                  {2, {disc, "--log", "x"}},
                  {2, {disc, "--session", wrong}},
                  {2, {disc, "--session", "no.session"}},
                  {3, {"no/such/folder"}},
                  {3, {folder}},
                  {3, {folder, "--list"}},
                  {3, {disc, "--playlist", "7"}},
                  {3, {disc, "--playlist", "3"}},
                  {3, {disc, "--describe", "7"}},
                  {3, {disc, "--describe", "3"}}};
    for (const auto& fault : faults) {
        SCOPED_TRACE(testing::PrintToString(fault.arguments));
        for (const std::string& output : {file, std::string(folder / "new.txt")}) {
            std::vector<std::string> arguments = fault.arguments;
            arguments.insert(arguments.end(), {"--output", output});
            EXPECT_EQ(RunDeskPlayer(arguments).status, fault.status);
        }
        EXPECT_EQ(ContentOf(file), "precious");
        EXPECT_FALSE(fs::exists(folder / "new.txt"));
    }
}

TEST(DeskPlayerOutput, HoldsTheInterfacesAndCallbacksThatAreAskedFor)
{
    EXPECT_EQ(RunDeskPlayer({SampleDisc, "--listen", "control,interactive"}).output,
              "00:00:00.000  PlayStarted\n"
              "00:00:00.000  FirstPictureDelivered\n"
              "00:00:06.000  PopUpMenuAvailable\n"
              "00:02:51.000  PopUpMenuUnavailable\n"
              "00:02:53.000  StillOn\n"
              "00:02:58.000  StillOff\n"
              "00:02:59.000  StillOn\n"
              "00:03:02.000  StillOff\n"
              "00:03:02.000  Finished                    reason=EndOfMedia\n");
    EXPECT_EQ(RunDeskPlayer({SampleDisc, "--only", "PlayStarted,PopUpMenuAvailable,ChapterNumber",
                             "--listen", "control,interactive"})
                  .output,
              "00:00:00.000  PlayStarted\n"
              "00:00:06.000  PopUpMenuAvailable\n");
}

TEST(DeskPlayerOutput, IsRefusedInWordsThatMeanNothing)
{
    ExpectUsageError({SampleDisc, "--format", "xml"},
                     "'xml' is no output format; expected text, json or trace");
    ExpectUsageError({SampleDisc, "--listen", "control,x"},
                     "'x' is no listener interface; expected control, settings, button or "
                     "interactive");
    const ProgramResult result = RunDeskPlayer({SampleDisc, "--only", "PlayItem,Foo"});
    EXPECT_EQ(result.status, 2);
    EXPECT_EQ(result.output, "");
    EXPECT_EQ(
        result.errors.rfind("bdmv-deskplayer: 'Foo' is no callback; expected PlayStarted, ", 0), 0U)
        << result.errors;
}

TEST(DeskPlayerOutput, ThatCannotBeWrittenEndsWithStatus1)
{
    for (const std::vector<std::string>& arguments : std::vector<std::vector<std::string>>{
             {SampleDisc}, {SampleDisc, "--list"}, {SampleDisc, "--describe", "1"}}) {
        const ProgramResult result = RunDeskPlayer(arguments, "/dev/full");
        EXPECT_EQ(result.status, 1);
        EXPECT_EQ(result.errors, "bdmv-deskplayer: standard output: could not be written\n");
    }
    EXPECT_EQ(RunDeskPlayer({"--commands"}, "/dev/full").status, 1);
    EXPECT_EQ(RunDeskPlayer({"--help"}, "/dev/full").status, 1);

    const ProgramResult full = RunDeskPlayer({SampleDisc, "--output", "/dev/full"});
    EXPECT_EQ(full.status, 1);
    EXPECT_EQ(full.errors, "bdmv-deskplayer: /dev/full: could not be written\n");
    const ProgramResult nowhere = RunDeskPlayer({SampleDisc, "--output", "no/such/folder/out"});
    EXPECT_EQ(nowhere.status, 1);
    EXPECT_EQ(nowhere.errors, "bdmv-deskplayer: no/such/folder/out: cannot be written\n");
}

TEST(DeskPlayerOutput, OfLogLinesGoesToStandardError)
{
    const ProgramResult result =
        RunDeskPlayer({SampleDisc, "--playlist", "2", "--log", "BdmvNavigator=Event"});

    const std::vector<std::string> lines = LinesOf(result.errors);
    ASSERT_EQ(lines.size(), 12U);
    const std::string tag = "....-..-.. ..:..:..\\....... BdmvNavigator Event: ";
    EXPECT_TRUE(std::regex_match(lines.front(), std::regex(tag + "Sending PlayStarted")));
    EXPECT_TRUE(std::regex_match(lines.back(), std::regex(tag + "Sending Finished - reason: 0")));
}

// ---------------------------------------------------------------------------------------------
// On a terminal

TEST_F(ScratchDisc, ShowsHowFarItHasComeWhenItTakesLong)
{
    MakeShort(45 * 1500);

    const ProgramResult result =
        RunDeskPlayerOnTerminal({disc, "--realtime", "--output", folder / "out.txt"});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.output, "\r00:00:01.000\r             \r") << "and nothing in the end";
}

TEST_F(ScratchDisc, ShowsNoProgressWithoutATerminal)
{
    MakeShort(45 * 1500);

    const ProgramResult result =
        RunDeskPlayer({disc, "--realtime", "--output", folder / "out.txt"});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.errors, "");
}

TEST_F(ScratchDisc, ShowsNoProgressBesideItsOutput)
{
    MakeShort(45 * 1500);

    const ProgramResult result =
        RunDeskPlayerOnTerminal({disc, "--realtime", "--only", "Finished"});

    EXPECT_EQ(result.output.find("\r0"), std::string::npos) << result.output;
    EXPECT_NE(result.output.find("Finished"), std::string::npos);
}

TEST(DeskPlayerOutput, IsColouredOnATerminalUnlessTheEnvironmentForbidsIt)
{
    const std::vector<std::string> arguments = {SampleDisc, "--only", "Finished"};
    unsetenv("NO_COLOR");
    EXPECT_NE(RunDeskPlayerOnTerminal(arguments).output.find('\x1B'), std::string::npos);
    setenv("NO_COLOR", "1", 1);
    EXPECT_EQ(RunDeskPlayerOnTerminal(arguments).output,
              "00:03:02.000  Finished                    reason=EndOfMedia\r\n");
    unsetenv("NO_COLOR");
    EXPECT_EQ(RunDeskPlayer(arguments).output.find('\x1B'), std::string::npos);
}

// ---------------------------------------------------------------------------------------------
// Usage

TEST(DeskPlayer, ListsThePlayListsOfADisc)
{
    const ProgramResult result = RunDeskPlayer({SampleDisc, "--list"});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.errors, "");
    EXPECT_NE(result.output.find("\n00001   00:02:54.000      6         7       3  "),
              std::string::npos)
        << result.output;
    EXPECT_NE(result.output.find("\n00002   00:00:20.000      1         1       1  "),
              std::string::npos);
}

TEST(DeskPlayer, DescribesAPlayList)
{
    const ProgramResult result = RunDeskPlayer({SampleDisc, "--describe", "2"});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.errors, "");
    EXPECT_NE(result.output.find("00020"), std::string::npos) << "its clip";
}

TEST_F(ScratchDisc, IsListedAsFarAsItCanBeRead)
{
    fs::copy_file(disc / "BDMV/index.bdmv", disc / "BDMV/PLAYLIST/00003.mpls");

    const ProgramResult result = RunDeskPlayer({disc, "--list"});

    EXPECT_EQ(result.status, 3);
    EXPECT_NE(result.output.find("\n00001 "), std::string::npos);
    EXPECT_TRUE(
        std::regex_search(result.output + result.errors, std::regex("00003.*offset 0: .*INDX")))
        << result.output << result.errors;
}

TEST(DeskPlayer, DescribesNoPlayListThatIsNotThere)
{
    const ProgramResult result = RunDeskPlayer({SampleDisc, "--describe", "7"});

    EXPECT_EQ(result.status, 3);
    EXPECT_EQ(result.output, "");
    EXPECT_NE(result.errors.find("PLAYLIST/00007.mpls: "), std::string::npos) << result.errors;
}

TEST(DeskPlayer, ExplainsItself)
{
    const ProgramResult help = RunDeskPlayer({"--help"});
    EXPECT_EQ(help.status, 0);
    EXPECT_EQ(help.errors, "");
    for (const char* const option :
         {"--help", "--version", "--commands", "--playlist", "--list", "--describe", "--session",
          "--realtime", "--remote", "--format", "--output", "--listen", "--only", "--log"}) {
        EXPECT_NE(help.output.find(option), std::string::npos) << option;
    }

    const ProgramResult version = RunDeskPlayer({"--version"});
    EXPECT_EQ(version.status, 0);
    EXPECT_TRUE(
        std::regex_match(version.output, std::regex("bdmv-deskplayer \\d+\\.\\d+\\.\\d+\n")))
        << version.output;

    const ProgramResult commands = RunDeskPlayer({"--commands"});
    EXPECT_EQ(commands.status, 0);
    EXPECT_EQ(LinesOf(commands.output).front(),
              "play                                start at the beginning of the play list");
    EXPECT_EQ(LinesOf(commands.output).back(),
              "fail stream                         have the stream run dry");
}

TEST(DeskPlayer, ExplainsWrongUsageAndExitsWithStatus2)
{
    const std::vector<std::vector<std::string>> wrong = {
        {},
        {"a", "b"},
        {SampleDisc, "--playlist", "100000"},
        {SampleDisc, "--playlist", "-1"},
        {SampleDisc, "--playlist", "first"},
        {SampleDisc, "--describe", "100000"},
        {SampleDisc, "--no-such-option"},
        {SampleDisc, "--session"},
        {SampleDisc, "--log", "NoSuchComponent=Event"}};
    for (const std::vector<std::string>& arguments : wrong) {
        const ProgramResult result = RunDeskPlayer(arguments);
        EXPECT_EQ(result.status, 2);
        EXPECT_EQ(result.output, "");
        EXPECT_NE(result.errors, "");
    }
}

TEST(DeskPlayer, RefusesOptionsThatExcludeEachOther)
{
    const std::vector<std::vector<std::string>> pairs = {{"--list", "--describe", "1"},
                                                         {"--list", "--playlist", "1"},
                                                         {"--list", "--session", Evening},
                                                         {"--list", "--realtime"},
                                                         {"--list", "--remote"},
                                                         {"--describe", "1", "--playlist", "1"},
                                                         {"--describe", "1", "--realtime"},
                                                         {"--describe", "1", "--session", Evening},
                                                         {"--describe", "1", "--remote"},
                                                         {"--remote", "--session", Evening}};
    for (std::vector<std::string> arguments : pairs) {
        SCOPED_TRACE(arguments.front() + " and others");
        arguments.insert(arguments.begin(), SampleDisc);
        const ProgramResult result = RunDeskPlayer(arguments);
        EXPECT_EQ(result.status, 2);
        EXPECT_EQ(result.output, "");
        EXPECT_NE(result.errors.find(" excludes "), std::string::npos) << result.errors;
    }
}

TEST(DeskPlayer, ShowsTheKeysOfTheRemoteAndEndsWithoutAnInput)
{
    const ProgramResult result =
        RunDeskPlayer({SampleDisc, "--remote", "--only", "PlayStarted,Finished"});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.output, "00:00:00.000  PlayStarted\n");
    EXPECT_NE(result.errors.find("space pause, continue"), std::string::npos) << result.errors;
}

TEST(DeskPlayer, RefusesAFolderThatIsNotThere)
{
    const ProgramResult result = RunDeskPlayer({"no/such/folder"});

    EXPECT_EQ(result.status, 3);
    EXPECT_EQ(result.output, "");
    EXPECT_EQ(result.errors, "bdmv-deskplayer: no/such/folder: no disc, expected a folder that "
                             "holds BDMV or is it\n");
}

TEST(DeskPlayer, RefusesAPlayListThatIsNotOnTheDisc)
{
    const ProgramResult result = RunDeskPlayer({SampleDisc, "--playlist", "7"});

    EXPECT_EQ(result.status, 3);
    EXPECT_EQ(result.output, "");
    EXPECT_NE(result.errors.find("PLAYLIST/00007.mpls: "), std::string::npos) << result.errors;
}

// ---------------------------------------------------------------------------------------------
// Spoilt discs

TEST_F(ScratchDisc, IsRefusedWhenThePlayListIsAnotherKindOfFile)
{
    Patch(0, "INDX");
    ExpectRefused("PLAYLIST/00001\\.mpls: offset 0: .*INDX.*MPLS");
}

TEST_F(ScratchDisc, IsRefusedWhenThePlayListIsTruncated)
{
    fs::resize_file(playList, 600);
    ExpectRefused("PLAYLIST/00001\\.mpls: offset \\d+: .*expected");
    ExpectRefused("PLAYLIST/00001\\.mpls: offset \\d+: .*expected", {"--playlist", "1"});
    ExpectRefused("PLAYLIST/00001\\.mpls: offset \\d+: .*expected", {"--describe", "1"});
    ExpectRefused("PLAYLIST/00001\\.mpls: offset \\d+: .*expected", {"--session", Evening});
}

TEST_F(ScratchDisc, IsRefusedWhenThePlayListIsEmpty)
{
    fs::resize_file(playList, 0);
    ExpectRefused("PLAYLIST/00001\\.mpls: offset 0: .*expected");
}

TEST_F(ScratchDisc, IsRefusedWhenThePlayListIsHuge)
{
    fs::resize_file(playList, std::uintmax_t{1} << 40);
    ExpectRefused("PLAYLIST/00001\\.mpls: .*expected");
}

TEST_F(ScratchDisc, IsRefusedWhenThePlayListIsAFolderOrADevice)
{
    fs::remove(playList);
    fs::create_directory(playList);
    ExpectRefused("PLAYLIST.*expected", {"--playlist", "1"});
    fs::remove(playList);
    fs::create_symlink("/dev/zero", playList);
    ExpectRefused("PLAYLIST.*expected", {"--playlist", "1"});
}

TEST_F(ScratchDisc, IsRefusedWhenAPlayItemEndsBeforeItStarts)
{
    const std::streamoff outTimeOfTheFirstItem = 58 + 10 + 18;
    Patch(outTimeOfTheFirstItem, std::string(4, '\0'));
    ExpectRefused("PLAYLIST/00001\\.mpls: offset 86: .*0.*expected");
}

TEST_F(ScratchDisc, IsRefusedWhenTheClipInformationIsSpoilt)
{
    fs::resize_file(disc / "BDMV/CLIPINF/00002.clpi", 100);
    ExpectRefused("CLIPINF/00002\\.clpi: offset \\d+: .*expected");
}

TEST_F(ScratchDisc, IsRefusedWhenThereIsNoPlayList)
{
    fs::remove(playList);
    ExpectRefused("PLAYLIST: .*expected");
}

// ---------------------------------------------------------------------------------------------
// Hostile input

// A sanitizer takes more memory than the program may have.
#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
constexpr bool Sanitized = true;
#elif !defined(__has_feature)
constexpr bool Sanitized = false;
#elif __has_feature(address_sanitizer) || __has_feature(thread_sanitizer)
constexpr bool Sanitized = true;
#else
constexpr bool Sanitized = false;
#endif

/** How long children of this process have computed. */
double SecondsOfChildren()
{
    rusage usage = {};
    getrusage(RUSAGE_CHILDREN, &usage);
    const auto seconds = [](const timeval& time) {
        return static_cast<double>(time.tv_sec) + 1e-6 * static_cast<double>(time.tv_usec);
    };
    return seconds(usage.ru_utime) + seconds(usage.ru_stime);
}

/** Runs in 64 MiB, and says in one line what is wrong before it has computed for a second. */
class HostileInput : public ScratchDisc
{
protected:
    void SetUp() override
    {
        if (Sanitized) {
            GTEST_SKIP() << "sanitizers need more memory";
        }
    }

    static void ExpectFault(const std::vector<std::string>& arguments, int status,
                            const std::string& message)
    {
        SCOPED_TRACE(testing::PrintToString(arguments));
        const double before = SecondsOfChildren();
        const ProgramResult result = RunDeskPlayerInLittleMemory(arguments, 64 * 1024);
        EXPECT_LT(SecondsOfChildren() - before, 1);
        EXPECT_EQ(result.status, status);
        EXPECT_EQ(result.output, "");
        EXPECT_EQ(LinesOf(result.errors).size(), 1U) << result.errors;
        EXPECT_NE(result.errors.find(message), std::string::npos) << result.errors;
    }

    /** Whether the play list is named, looked for or described. */
    void ExpectRefusedPlayList(const std::string& message) const
    {
        ExpectFault({disc}, 3, message);
        ExpectFault({disc, "--playlist", "1"}, 3, message);
        ExpectFault({disc, "--describe", "1"}, 3, message);
    }

    void ExpectRefusedSession(const std::string& session, const std::string& message) const
    {
        ExpectFault({disc, "--session", session}, 2, message);
    }

    static constexpr std::uintmax_t ThreeGibibytes = std::uintmax_t{3} << 30;
};

TEST_F(HostileInput, CanBeAHugePlayList)
{
    fs::resize_file(playList, ThreeGibibytes);
    ExpectRefusedPlayList("PLAYLIST/00001.mpls: has 3221225472 bytes, expected at most 1048576");
}

TEST_F(HostileInput, CanBeHugeClipInformation)
{
    fs::resize_file(disc / "BDMV/CLIPINF/00002.clpi", ThreeGibibytes);
    ExpectFault({disc}, 3, "CLIPINF/00002.clpi: has 3221225472 bytes, expected at most 4194304");
}

TEST_F(HostileInput, CanBeAPipeOrAFolderInThePlaceOfAPlayList)
{
    fs::remove(playList);
    ASSERT_EQ(mkfifo(playList.c_str(), 0600), 0);
    ExpectRefusedPlayList("PLAYLIST/00001.mpls: not a regular file, expected one");
    fs::remove(playList);
    fs::create_directory(playList);
    ExpectRefusedPlayList("PLAYLIST/00001.mpls: not a regular file, expected one");
}

TEST_F(HostileInput, CanClaimMoreThanItHas)
{
    deskplayer::PlayListBytes bytes = deskplayer::DensePlayList();
    bytes.itemCount = 20000;
    deskplayer::WriteBytes(playList, bytes.Make());
    ExpectRefusedPlayList("PLAYLIST/00001.mpls: offset ");
}

TEST_F(HostileInput, CanBeThePlayListThatTakesTheMostMemory)
{
    const deskplayer::Bytes dense = deskplayer::DensePlayList().Make();
    deskplayer::WriteBytes(playList, dense);
    deskplayer::WriteBytes(disc / "BDMV/PLAYLIST/00002.mpls", dense);
    for (const std::vector<std::string>& option :
         {std::vector<std::string>{"--list"}, {"--describe", "1"}, {}}) {
        std::vector<std::string> arguments = {disc};
        arguments.insert(arguments.end(), option.begin(), option.end());
        const ProgramResult result = RunDeskPlayerInLittleMemory(arguments, 64 * 1024);
        EXPECT_EQ(result.status, 0);
        EXPECT_EQ(result.errors, "");
    }
}

TEST_F(HostileInput, CanNameAGreatClipInEveryPlayItem)
{
    using namespace deskplayer;
    PlayItemBytes item;
    item.clip = "00000";
    item.inTime = item.outTime;
    item.streamTable =
        StreamTableBytes({1, 0, 0, 0, 0, 0, 0, 0},
                         Join({StreamEntry(1), StreamAttributesBytes(0x1B, {0x61, 0, 0, 0})}));
    PlayListBytes bytes;
    bytes.itemCount = 1000;
    bytes.items = Repeat(bytes.itemCount, item.Make());
    WriteBytes(playList, bytes.Make());
    const Bytes stream = Join({U16(1), Part8({0x1B, 0x61, 0x30})});
    WriteBytes(disc / "BDMV/CLIPINF/00000.clpi",
               ClipInfoOf(255, Repeat(255, ProgramBytes(255, Repeat(255, stream)))));

    const double before = SecondsOfChildren();
    const ProgramResult result =
        RunDeskPlayerInLittleMemory({disc, "--only", "Finished"}, 64 * 1024);
    EXPECT_LT(SecondsOfChildren() - before, 1);
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.errors, "");
}

TEST_F(HostileInput, CanBeAnEndlessOrSilentSession)
{
    const std::string tooLong = ": has more than 1048576 bytes, expected a session";
    ExpectRefusedSession("/dev/zero", "/dev/zero" + tooLong);
    const std::string huge = WriteFile("huge.session", "");
    fs::resize_file(huge, ThreeGibibytes);
    ExpectRefusedSession(huge, huge + tooLong);
    const std::string silent = folder / "silent.session";
    ASSERT_EQ(mkfifo(silent.c_str(), 0600), 0);
    ExpectRefusedSession(silent, silent + ": nothing comes out of it, expected a session");
}

TEST_F(HostileInput, CanBeASessionOfOneLineOrWord)
{
    std::string words;
    while (words.size() + 2 < deskplayer::LongestScript) {
        words += "a ";
    }
    const std::string line = WriteFile("line.session", words);
    ExpectRefusedSession(line, line + ":1:1: 'a' is no command here");
    const std::string word = WriteFile("word.session", std::string(deskplayer::LongestScript, 'a'));
    ExpectRefusedSession(word, word + ":1:1: 'aaa");
    const std::string late =
        WriteFile("late.session", std::string(deskplayer::LongestScript - 1, '\n') + "x");
    ExpectRefusedSession(late, late + ":1048576:1: 'x' is no command here");
}

TEST_F(ScratchFolder, TakesASessionOutOfAPipe)
{
    const std::string pipe = folder / "pipe.session";
    ASSERT_EQ(mkfifo(pipe.c_str(), 0600), 0);
    std::thread writer([&pipe] { std::ofstream(pipe) << "play\nafter 1s stop\n"; });

    const ProgramResult result =
        RunDeskPlayer({SampleDisc, "--session", pipe, "--only", "Stopped"});

    writer.join();
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.output, "00:00:01.000  Stopped\n");
}

} // namespace
