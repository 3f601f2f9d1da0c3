#include "session/script.h"

#include <gtest/gtest.h>

#include <ctime>

#include "../disc/countingnew.h"

namespace deskplayer
{

namespace
{

using Values = std::vector<std::uint64_t>;

constexpr Ticks Millisecond = std::chrono::milliseconds(1);
constexpr Ticks Second = std::chrono::seconds(1);
constexpr Ticks Hour = std::chrono::hours(1);

enum Command : std::size_t {
    CommandPlay,
    CommandNext,
    CommandPrevious,
    CommandChapter,
    CommandSeek,
    CommandForward,
    CommandForwardFast,
    CommandSubtitleOn,
    CommandSubtitle,
    CommandSubtitleStyle,
    CommandLoop,
    CommandExpectNothing,
    CommandExpect
};

const std::vector<CommandSyntax> Syntaxes = {
    {"play", ""},
    {"chapter next", ""},
    {"chapter previous", ""},
    {"chapter NUMBER", ""},
    {"seek TIME", ""},
    {"forward", ""},
    {"forward fast NUMBER", ""},
    {"subtitle on", ""},
    {"subtitle NUMBER", ""},
    {"subtitle style NUMBER", ""},
    {"loop TIME to TIME times NUMBER", ""},
    {"expect nothing", ""},
    {"expect CALLBACK [ARGUMENT=VALUE ...]", ""},
};

const std::string TimeHelp = "a TIME (such as 1:02:03.5, 02:03, 3.25, 2s, 500ms, 1.5m or 1h)";

std::vector<ScriptStep> Parse(std::string_view text)
{
    return ParseScript(text, "file", Syntaxes);
}

/** The only step of a one-line script. */
ScriptStep ParseLine(std::string_view line)
{
    const std::vector<ScriptStep> steps = Parse(line);
    EXPECT_EQ(steps.size(), 1u);
    return steps.empty() ? ScriptStep() : steps.front();
}

/** The error for @p text, without the name of the file. */
std::string ErrorOf(std::string_view text, const std::vector<CommandSyntax>& syntaxes = Syntaxes)
{
    try {
        ParseScript(text, "file", syntaxes);
    } catch (const ScriptError& error) {
        const std::string what = error.what();
        EXPECT_EQ(what.substr(0, 5), "file:");
        return what.substr(5);
    }
    ADD_FAILURE() << "nothing was thrown";
    return "";
}

/** The value of the TIME @p time. */
Ticks TimeOf(const std::string& time)
{
    const ScriptStep step = ParseLine("seek " + time);
    EXPECT_EQ(step.values.size(), 1u);
    return Ticks(step.values.empty() ? 0 : step.values.front());
}

/** The error for @p time, without the list of what is valid there. */
std::string TimeErrorOf(const std::string& time)
{
    const std::string error = ErrorOf("seek " + time);
    const std::string expected = "; expected " + TimeHelp;
    const std::size_t end = error.find(expected);
    EXPECT_EQ(end + expected.size(), error.size()) << error;
    return error.substr(0, end);
}

std::string Repeat(std::size_t times, const std::string& text)
{
    std::string repeated;
    while (times-- > 0) {
        repeated += text;
    }
    return repeated;
}

TEST(ParseScript, ReadsNothingFromAnEmptyText)
{
    EXPECT_TRUE(Parse("").empty());
}

TEST(ParseScript, IgnoresAByteOrderMarkAtTheStart)
{
    EXPECT_EQ(ParseLine("\xEF\xBB\xBFplay").command, CommandPlay);
    EXPECT_EQ(ErrorOf("\xEF\xBB\xBFplay now"),
              "1:6: unexpected 'now'; expected the end of the line");
    EXPECT_EQ(ErrorOf("play\n\xEF\xBB\xBFplay").substr(0, 4), "2:1:");
}

TEST(ParseScript, ReadsAnExpectation)
{
    using Words = std::vector<std::string>;

    EXPECT_EQ(ParseLine("expect nothing").command, CommandExpectNothing);
    EXPECT_EQ(ParseLine("expect nothing").words, Words());
    EXPECT_EQ(ParseLine("after 1s expect Paused").command, CommandExpect);
    EXPECT_EQ(ParseLine("after 1s expect Paused").words, Words{"Paused"});
    EXPECT_EQ(ParseLine("expect PlayItem a=1 b=x=y  # why").words,
              (Words{"PlayItem", "a=1", "b=x=y"}));
}

TEST(ParseScript, NamesTheProblemOfAnExpectation)
{
    const std::string further =
        "expected an ARGUMENT=VALUE (such as number=2) or the end of the line";

    EXPECT_EQ(ErrorOf("expect"), "1:7: the line ends here; expected nothing or a CALLBACK");
    for (const std::string wrong : {"x", "=x", "x=", "="}) {
        EXPECT_EQ(ErrorOf("expect Paused a=1 " + wrong),
                  "1:19: unexpected '" + wrong + "'; " + further);
    }
    EXPECT_EQ(ErrorOf("expect nothing a=1"),
              "1:16: unexpected 'a=1'; expected the end of the line");
}

TEST(ParseScript, AcceptsOnlyTheGivenCallbacks)
{
    const std::vector<std::string_view> callbacks = {"Paused", "Stopped"};

    EXPECT_EQ(ParseScript("expect Stopped", "file", Syntaxes, callbacks).size(), 1u);
    EXPECT_EQ(ParseScript("expect nothing", "file", Syntaxes, callbacks).size(), 1u);
    try {
        ParseScript("play\nexpect stopped", "file", Syntaxes, callbacks);
        ADD_FAILURE() << "nothing was thrown";
    } catch (const ScriptError& error) {
        EXPECT_STREQ(error.what(), "file:2:8: 'stopped' is not a callback; did you mean Stopped?");
    }
}

TEST(ParseScript, NamesNegativeTimesAndNumbers)
{
    EXPECT_EQ(ErrorOf("after -1s play"), "1:7: '-1s' is negative; expected " + TimeHelp);
    EXPECT_EQ(ErrorOf("chapter -1"), "1:9: '-1' is negative; expected next, previous or a NUMBER");
    EXPECT_EQ(ErrorOf("chapter -x"), "1:9: unexpected '-x'; expected next, previous or a NUMBER");
}

TEST(ParseScript, ReadsOneCommandPerLine)
{
    const auto steps = Parse("chapter next\nplay\n");
    ASSERT_EQ(steps.size(), 2u);
    EXPECT_EQ(steps[0].command, CommandNext);
    EXPECT_EQ(steps[1].command, CommandPlay);
}

TEST(ParseScript, ReportsTheLineOfACommand)
{
    const auto steps = Parse("\n# about\nplay\n\nplay");
    ASSERT_EQ(steps.size(), 2u);
    EXPECT_EQ(steps[0].line, 3u);
    EXPECT_EQ(steps[1].line, 5u);
}

TEST(ParseScript, SkipsCommentsAndBlankLines)
{
    EXPECT_TRUE(Parse("\n \t \n# play\n  #play\n#\n").empty());
}

TEST(ParseScript, EndsALineAtItsComment)
{
    EXPECT_EQ(ParseLine("chapter next# play").command, CommandNext);
}

TEST(ParseScript, AcceptsAnyNumberOfBlanksBetweenWords)
{
    EXPECT_EQ(ParseLine(" \tchapter \t  next\t ").command, CommandNext);
}

TEST(ParseScript, AcceptsCarriageReturnsAtLineEnds)
{
    const auto steps = Parse("play\r\n\r\nchapter next\r\n");
    ASSERT_EQ(steps.size(), 2u);
    EXPECT_EQ(steps[1].command, CommandNext);
    EXPECT_EQ(steps[1].line, 3u);
}

TEST(ParseScript, AcceptsALastLineWithoutALineEnding)
{
    EXPECT_EQ(Parse("play\nplay").size(), 2u);
}

TEST(ParseScript, AcceptsNonAsciiTextInComments)
{
    EXPECT_EQ(Parse("play # \xC3\xA4\xFF").size(), 1u);
}

TEST(ParseScript, GivesNoValuesToACommandWithoutPlaceholders)
{
    EXPECT_EQ(ParseLine("chapter next").values, Values());
}

TEST(ParseScript, GivesTheValuesOfPlaceholdersInOrder)
{
    const ScriptStep step = ParseLine("loop 1s to 2s times 3");
    EXPECT_EQ(step.command, CommandLoop);
    EXPECT_EQ(step.values, (Values{Second.count(), (2 * Second).count(), 3}));
}

TEST(ParseScript, ExcludesTheTimeOfALineFromTheValues)
{
    EXPECT_EQ(ParseLine("at 5s chapter 7").values, Values{7});
    EXPECT_EQ(ParseLine("after 5s chapter 7").values, Values{7});
}

TEST(ParseScript, DistinguishesPatternsThatBeginAlike)
{
    EXPECT_EQ(ParseLine("subtitle on").command, CommandSubtitleOn);
    EXPECT_EQ(ParseLine("subtitle 4").command, CommandSubtitle);
    EXPECT_EQ(ParseLine("subtitle style 4").command, CommandSubtitleStyle);
}

TEST(ParseScript, DistinguishesAPatternFromALongerOne)
{
    EXPECT_EQ(ParseLine("forward").command, CommandForward);
    EXPECT_EQ(ParseLine("forward fast 2").command, CommandForwardFast);
}

TEST(ParseScript, ChoosesTheFirstMatchingPattern)
{
    const auto steps = ParseScript("go 5\n", "file", {{"go TIME", ""}, {"go NUMBER", ""}});
    ASSERT_EQ(steps.size(), 1u);
    EXPECT_EQ(steps[0].command, 0u);
    EXPECT_EQ(steps[0].values, Values{(5 * Second).count()});
}

TEST(ParseScript, ReadsNumbersUpToTheMaximum)
{
    EXPECT_EQ(ParseLine("chapter 0").values, Values{0});
    EXPECT_EQ(ParseLine("chapter 007").values, Values{7});
    EXPECT_EQ(ParseLine("chapter 65535").values, Values{65535});
}

TEST(ParseScript, StartsAtTheStartOfTheSession)
{
    EXPECT_EQ(ParseLine("play").time, Ticks(0));
}

TEST(ParseScript, CarriesOutALineAtTheTimeItNames)
{
    EXPECT_EQ(ParseLine("at 3s play").time, 3 * Second);
}

TEST(ParseScript, CarriesOutALineAtTheTimeOfThePreviousOne)
{
    EXPECT_EQ(Parse("at 3s play\nplay\n")[1].time, 3 * Second);
}

TEST(ParseScript, CarriesOutALineSomeTimeAfterThePreviousOne)
{
    EXPECT_EQ(Parse("at 3s play\nafter 2s play\nafter 2s play\n")[2].time, 7 * Second);
}

TEST(ParseScript, CountsFromTheStartBeforeTheFirstLine)
{
    EXPECT_EQ(ParseLine("after 2s play").time, 2 * Second);
}

TEST(ParseScript, AcceptsTheTimeOfThePreviousLine)
{
    EXPECT_EQ(Parse("at 3s play\nat 3s play\n")[1].time, 3 * Second);
}

TEST(ParseScript, ReadsTimesWithColons)
{
    EXPECT_EQ(TimeOf("1:02:03.5"), Hour + 123 * Second + 500 * Millisecond);
    EXPECT_EQ(TimeOf("00:01:30.500"), 90 * Second + 500 * Millisecond);
    EXPECT_EQ(TimeOf("02:03"), 123 * Second);
    EXPECT_EQ(TimeOf("59:59"), 3599 * Second);
}

TEST(ParseScript, ReadsSecondsWithoutAUnit)
{
    EXPECT_EQ(TimeOf("3.25"), 3250 * Millisecond);
    EXPECT_EQ(TimeOf("0"), Ticks(0));
}

TEST(ParseScript, ReadsTimesWithAUnit)
{
    EXPECT_EQ(TimeOf("2s"), 2 * Second);
    EXPECT_EQ(TimeOf("500ms"), 500 * Millisecond);
    EXPECT_EQ(TimeOf("1.5m"), 90 * Second);
    EXPECT_EQ(TimeOf("1h"), Hour);
}

TEST(ParseScript, ReadsUpToThreeDecimals)
{
    EXPECT_EQ(TimeOf("0.1"), 100 * Millisecond);
    EXPECT_EQ(TimeOf("0.02"), 20 * Millisecond);
    EXPECT_EQ(TimeOf("0.003s"), 3 * Millisecond);
    EXPECT_EQ(TimeOf("0.001h"), 3600 * Millisecond);
    EXPECT_EQ(TimeOf("2.000ms"), 2 * Millisecond);
}

TEST(ParseScript, AcceptsAnyValueOfTheLargestUnitOfATime)
{
    EXPECT_EQ(TimeOf("75:00"), 75 * 60 * Second);
    EXPECT_EQ(TimeOf("90"), 90 * Second);
    EXPECT_EQ(TimeOf("90m"), 90 * 60 * Second);
    EXPECT_EQ(TimeOf("100:00:00"), 100 * Hour);
}

TEST(ParseScript, ReadsTimesUpToTheLongestSession)
{
    EXPECT_EQ(TimeOf("1000h"), LongestSession);
    EXPECT_EQ(TimeOf("1000:00:00.000"), LongestSession);
    EXPECT_EQ(Parse("at 999h play\nafter 1h play\n")[1].time, LongestSession);
}

TEST(ParseScriptRefuses, AnUnknownWord)
{
    EXPECT_EQ(ErrorOf("chapter nxt"), "1:9: unexpected 'nxt'; expected next, previous or a NUMBER");
}

TEST(ParseScriptRefuses, AnUnknownFirstWordAndNamesEveryFirstWordOnce)
{
    EXPECT_EQ(ErrorOf("\n  chaptr next"), "2:3: unexpected 'chaptr'; expected at, after, "
                                          "play, chapter, seek, forward, subtitle, loop or expect");
}

TEST(ParseScriptRefuses, ASecondTimeOnALine)
{
    const std::string commands =
        "; expected play, chapter, seek, forward, subtitle, loop or expect";
    EXPECT_EQ(ErrorOf("at 2s at 3s play"), "1:7: unexpected 'at'" + commands);
    EXPECT_EQ(ErrorOf("after 2s 3s play"), "1:10: unexpected '3s'" + commands);
}

TEST(ParseScriptRefuses, ALineThatEndsTooEarly)
{
    EXPECT_EQ(ErrorOf("chapter  # next\n"),
              "1:8: the line ends here; expected next, previous or a NUMBER");
}

TEST(ParseScriptRefuses, WordsAfterACommand)
{
    EXPECT_EQ(ErrorOf("play now please"), "1:6: unexpected 'now'; expected the end of the line");
}

TEST(ParseScriptRefuses, AWordWhereALineCouldEndAsWell)
{
    EXPECT_EQ(ErrorOf("forward slowly"),
              "1:9: unexpected 'slowly'; expected the end of the line or fast");
}

TEST(ParseScriptRefuses, AWordThatFitsOnlyAnotherCommand)
{
    EXPECT_EQ(ErrorOf("subtitle style on"), "1:16: unexpected 'on'; expected a NUMBER");
}

TEST(ParseScriptRefuses, WordsInTheWrongCase)
{
    EXPECT_EQ(ErrorOf("chapter NEXT"),
              "1:9: unexpected 'NEXT'; expected next, previous or a NUMBER");
}

TEST(ParseScriptRefuses, ThePlaceholderItself)
{
    EXPECT_EQ(ErrorOf("subtitle style NUMBER"), "1:16: unexpected 'NUMBER'; expected a NUMBER");
}

TEST(ParseScriptRefuses, TheFirstOfSeveralWrongLines)
{
    EXPECT_EQ(ErrorOf("play\nplay now\nstop\n").substr(0, 4), "2:6:");
}

TEST(ParseScriptRefuses, AnythingWhenThereAreNoCommands)
{
    EXPECT_EQ(ErrorOf("play", {}), "1:1: unexpected 'play'");
}

TEST(ParseScriptRefuses, WithTheColumnInBytes)
{
    EXPECT_EQ(ErrorOf("\tplay \t now").substr(0, 5), "1:9: ");
    EXPECT_EQ(ErrorOf("chapter \xC3\xA4 5"),
              "1:9: unexpected '\xC3\xA4'; expected next, previous or a NUMBER");
    EXPECT_EQ(ErrorOf("chapter next \xC3\xA4 \xE4").substr(0, 6), "1:14: ");
}

TEST(ParseScriptRefuses, LongWordsCutBetweenTwoCharacters)
{
    const std::string start(39, 'a');
    EXPECT_EQ(ErrorOf("chapter " + start + "\xC3\xA4"),
              "1:9: unexpected '" + start + "...'; expected next, previous or a NUMBER");
}

TEST(ParseScriptRefuses, NumbersAboveTheMaximum)
{
    const std::string expected = " is not between 0 and 65535; expected next, previous or a NUMBER";
    EXPECT_EQ(ErrorOf("chapter 65536"), "1:9: '65536'" + expected);
    EXPECT_EQ(ErrorOf("chapter 4294967297"), "1:9: '4294967297'" + expected);
    EXPECT_EQ(ErrorOf("chapter 18446744073709551617"), "1:9: '18446744073709551617'" + expected);
}

TEST(ParseScriptRefuses, NumbersAboveTheMaximumBeforeWordsInTheTable)
{
    EXPECT_EQ(ErrorOf("subtitle 65536"),
              "1:10: '65536' is not between 0 and 65535; expected on, a NUMBER or style");
}

TEST(ParseScriptRefuses, NumbersWithTrailingCharacters)
{
    EXPECT_EQ(ErrorOf("subtitle style 1.5"),
              "1:16: '1.5' is not a whole number; expected a NUMBER");
    EXPECT_EQ(ErrorOf("subtitle style 0x1"),
              "1:16: '0x1' is not a whole number; expected a NUMBER");
}

TEST(ParseScriptRefuses, NumbersWithASign)
{
    EXPECT_EQ(ErrorOf("subtitle style -1"), "1:16: '-1' is negative; expected a NUMBER");
    EXPECT_EQ(ErrorOf("subtitle style +1"), "1:16: unexpected '+1'; expected a NUMBER");
}

TEST(ParseScriptRefuses, MalformedTimes)
{
    for (const std::string time :
         {"1x", "1:", "1::2", "1:2:3:4", "1:2s", "1.", "1.s", "1.2.3", "1.5:2", "1:-2", "2S",
          "2sec", "1h30m", "1:2.", "0.1234", "0.0001ms", "1.99999999999"}) {
        EXPECT_EQ(TimeErrorOf(time), "1:6: '" + time + "' is not a time");
    }
}

TEST(ParseScriptRefuses, WordsInPlaceOfATime)
{
    for (const std::string time : {"soon", "-", "+1", ".5", ":30", "s"}) {
        EXPECT_EQ(TimeErrorOf(time), "1:6: unexpected '" + time + "'");
    }
}

TEST(ParseScriptRefuses, MinutesAndSecondsOfSixtyOrMoreAfterAColon)
{
    for (const std::string time : {"1:60", "1:60:00", "1:00:60", "0:99999999999"}) {
        EXPECT_EQ(TimeErrorOf(time),
                  "1:6: '" + time + "' is not a time: minutes and seconds must be below 60");
    }
}

TEST(ParseScriptRefuses, TimesFinerThanAMillisecond)
{
    EXPECT_EQ(TimeErrorOf("1.5ms"), "1:6: '1.5ms' is finer than a millisecond");
}

TEST(ParseScriptRefuses, TimesBeyondTheLongestSession)
{
    for (const std::string time :
         {"1000:00:00.001", "60001m", "3600001", "3600000001ms", "4294967295h", "4294967297ms",
          "4294967295:59:59", "18446744073709551617", "99999999999999999999999999h"}) {
        EXPECT_EQ(TimeErrorOf(time), "1:6: '" + time + "' is more than 1000 hours");
    }
}

TEST(ParseScriptRefuses, ASessionThatBecomesTooLong)
{
    EXPECT_EQ(ErrorOf("at 999h play\nafter 1:00:00.001 play\n"),
              "2:7: '1:00:00.001' after 999:00:00.000 is more than 1000 hours");
}

TEST(ParseScriptRefuses, ToGoBackInTime)
{
    EXPECT_EQ(ErrorOf("at 1.5m play\n\nplay\nat 1:29.999 play\n"),
              "4:4: 00:01:29.999 is earlier than line 3; expected at least 00:01:30.000");
}

TEST(ParseScriptRefuses, ALineWithoutATimeAfterAtOrAfter)
{
    EXPECT_EQ(ErrorOf("at"), "1:3: the line ends here; expected " + TimeHelp);
    EXPECT_EQ(ErrorOf("after play"), "1:7: unexpected 'play'; expected " + TimeHelp);
}

TEST(ParseScriptRefuses, ATimeWithoutACommand)
{
    const std::string commands = "expected play, chapter, seek, forward, subtitle, loop or expect";
    EXPECT_EQ(ErrorOf("at 3s"), "1:6: the line ends here; " + commands);
    EXPECT_EQ(ErrorOf("after 3s # play"), "1:9: the line ends here; " + commands);
}

TEST(ParseScriptRefuses, ControlCharacters)
{
    EXPECT_EQ(ErrorOf(std::string_view("pl\0y", 4)),
              "1:3: '\\x00' is a control character; expected text");
    EXPECT_EQ(ErrorOf("play\n play \x7F"), "2:7: '\\x7F' is a control character; expected text");
    EXPECT_EQ(ErrorOf("\x1Fplay"), "1:1: '\\x1F' is a control character; expected text");
}

TEST(ParseScriptRefuses, ControlCharactersInComments)
{
    EXPECT_EQ(ErrorOf("play # \x1B[2J"), "1:8: '\\x1B' is a control character; expected text");
}

TEST(ParseScriptRefuses, CarriageReturnsWithinALine)
{
    EXPECT_EQ(ErrorOf("play\rplay\n"), "1:5: '\\x0D' is a control character; expected text");
    EXPECT_EQ(ErrorOf("play\r\r\n"), "1:5: '\\x0D' is a control character; expected text");
}

TEST(ParseScriptRefuses, LongWordsAndQuotesTheirBeginning)
{
    const std::string forty(40, 'a');
    EXPECT_EQ(ErrorOf("subtitle style " + forty),
              "1:16: unexpected '" + forty + "'; expected a NUMBER");
    EXPECT_EQ(ErrorOf("subtitle style " + forty + "b"),
              "1:16: unexpected '" + forty + "...'; expected a NUMBER");
}

TEST(ParseScriptRefuses, ATextThatIsTooLong)
{
    std::string text(LongestScript, '\n');
    EXPECT_TRUE(Parse(text).empty());
    text += '\n';
    EXPECT_EQ(ErrorOf(text), "1:1: the session has 1048577 bytes; expected at most 1048576");
}

TEST(ParseScriptRefuses, WithAnyFileNameOnOneLine)
{
    EXPECT_STREQ(ScriptError("a\n\x1B", 1, 2, "problem").what(), "a\\x0A\\x1B:1:2: problem");
}

/** The longest possible texts, with as many lines or words as fit. */
std::vector<std::string> LongestTexts()
{
    std::vector<std::string> texts;
    for (const std::string repeated : {"play\n", "play ", "#\n", "at 0 play\n"}) {
        texts.push_back(Repeat(LongestScript / repeated.size(), repeated));
    }
    return texts;
}

void ParseOrRefuse(std::string_view text)
{
    try {
        Parse(text);
    } catch (const ScriptError&) {
    }
}

TEST(ParseScript, ReadsTheLongestTextsPromptly)
{
    for (const std::string& text : LongestTexts()) {
        const std::clock_t before = std::clock();
        ParseOrRefuse(text);
        EXPECT_LT((std::clock() - before) / CLOCKS_PER_SEC, 20) << text.substr(0, 10);
    }
}

TEST(ParseScript, UsesMemoryInProportionToTheText)
{
    for (const std::string& text : LongestTexts()) {
        const std::size_t before = AllocatedBytes();
        ParseOrRefuse(text);
        EXPECT_LT(AllocatedBytes() - before, 200 * text.size()) << text.substr(0, 10);
    }
}

} // namespace

} // namespace deskplayer
