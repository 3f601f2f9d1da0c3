// What the reader of recordings refuses, and with which message.

#include <gtest/gtest.h>

#include "keptrecords.h"

namespace deskplayer
{
namespace
{

std::string MessageOf(const std::string& text)
{
    try {
        RecordsOf(text);
    } catch (const RecordingError& error) {
        return error.what();
    }
    return "nothing";
}

std::string MessageOfArguments(const std::string& callback, const std::string& arguments)
{
    return MessageOf(R"({"ticks":0,"arguments":)" + arguments + R"(,"callback":")" + callback +
                     "\"}");
}

TEST(MalformedRecording, IsRefusedWithItsLineAndColumn)
{
    const std::string good = R"({"ticks":1,"callback":"Paused","arguments":{}})";

    EXPECT_EQ(MessageOf(good + "\n" + good + "\n{\"ticks\":1"),
              "test:3:10: not JSON: unexpected end of input; expected '}'");
    EXPECT_EQ(MessageOf("\n"), "test:1:1: not JSON: unexpected end of input; expected '[', '{', or "
                               "a literal");
    EXPECT_EQ(MessageOf("{\"ticks\":1,x"),
              "test:1:12: not JSON: invalid literal; last read: '1,x'; expected string literal");
}

TEST(MalformedRecording, ShowsOddBytesAsEscapeSequences)
{
    EXPECT_EQ(MessageOf("\x7F"), "test:1:1: not JSON: invalid literal; last read: '\\x7F'");
    EXPECT_EQ(MessageOf(std::string("\0", 1)),
              "test:1:1: not JSON: unexpected end of input; expected '[', '{', or a literal");
}

TEST(MalformedRecording, IsAnObjectWithoutItsMembers)
{
    EXPECT_EQ(MessageOf("[]"), "test:1:1: unexpected array; expected an object");
    EXPECT_EQ(MessageOf("{}"), "test:1:1: missing member 'ticks'");
    EXPECT_EQ(MessageOf(R"(  {"ticks":1})"), "test:1:3: missing member 'callback'");
    EXPECT_EQ(MessageOf(R"({"ticks":1,"callback":"Paused"})"),
              "test:1:1: missing member 'arguments'");
    EXPECT_EQ(MessageOf(R"({"ticks":1,"gap":{}})"), "test:1:18: missing member 'cause'");
    EXPECT_EQ(MessageOf(R"({"ticks":1,"start":{}})"), "test:1:20: missing member 'wallClock'");
    EXPECT_EQ(MessageOfArguments("ZoomModeSet", R"({"clip":{"x":1,"y":2,"width":3}})"),
              "test:1:32: missing member 'height'");
}

TEST(MalformedRecording, HasAMemberTwice)
{
    const std::string message = "; expected each member once";

    EXPECT_EQ(MessageOf(R"({"ticks":1,"ticks":1,"callback":"Paused","arguments":{}})"),
              "test:1:12: repeated member 'ticks'" + message);
    EXPECT_EQ(MessageOf(R"({ "ticks" : 12 , "callback":"Paused", "arguments":{}, "ticks":1})"),
              "test:1:55: repeated member 'ticks'" + message);
    EXPECT_EQ(MessageOfArguments("AngleInfo", R"({"number":1,"number":1})"),
              "test:1:36: repeated member 'number'" + message);
    EXPECT_EQ(
        MessageOfArguments("ZoomModeSet", R"({"clip":{"x":1,"y":2,"width":3,"height":4,"y":2}})"),
        "test:1:66: repeated member 'y'" + message);
    EXPECT_EQ(MessageOf(R"({"unknown":[{"a":1,"a":2}],"ticks":1})"),
              "test:1:20: repeated member 'a'" + message);
    EXPECT_EQ(MessageOf(R"({"a\n":1,"a\u000a":2})"),
              "test:1:10: repeated member 'a\\x0A'" + message);
    EXPECT_EQ(
        MessageOf("{\"" + std::string(1000, 'a') + "\":1,\"" + std::string(1000, 'a') + "\":1"),
        "test:1:1007: repeated member '" + std::string(160, 'a') + "'" + message);
}

TEST(MalformedRecording, MayHaveTheSameMemberInDifferentObjects)
{
    const KeptRecords read = RecordsOf(
        R"({"ticks":1,"a":[{"b":1},{"b":2}],"c":{"a":3,"b":4},"callback":"Paused","arguments":{}})");

    EXPECT_EQ(read.callbacks.size(), 1U);
}

TEST(MalformedRecording, HasAWrongType)
{
    EXPECT_EQ(MessageOf(R"({"ticks":"1"})"),
              "test:1:10: unexpected \"1\"; expected an integer from 0 to 18446744073709551615");
    EXPECT_EQ(MessageOf(R"({"ticks":-1})"),
              "test:1:10: unexpected -1; expected an integer from 0 to 18446744073709551615");
    EXPECT_EQ(MessageOf(R"({"ticks":1.5})"),
              "test:1:10: unexpected 1.5; expected an integer from 0 to 18446744073709551615");
    EXPECT_EQ(MessageOf(R"({"ticks":1, "callback" : 2})"),
              "test:1:26: unexpected 2; expected a string");
    EXPECT_EQ(MessageOf(R"({"ticks":1,"callback":"Paused","arguments":[]})"),
              "test:1:44: unexpected array; expected an object");
    EXPECT_EQ(MessageOfArguments("SystemResumed", R"({"playing":0})"),
              "test:1:35: unexpected 0; expected true or false");
    EXPECT_EQ(MessageOfArguments("ZoomModeSet",
                                 R"({"clip":{"x":1,"y":2,"width":3,"height":4},"delay":true})"),
              "test:1:75: unexpected true; expected an integer from 0 to 4294967295");
    EXPECT_EQ(MessageOfArguments("UOMask", R"({"forbidden":"Stop"})"),
              "test:1:37: unexpected \"Stop\"; expected an array of strings");
    EXPECT_EQ(MessageOfArguments("UOMask", R"({"forbidden":["Stop",1]})"),
              "test:1:37: unexpected array; expected an array of strings");
}

TEST(MalformedRecording, HasANumberOutOfRange)
{
    EXPECT_EQ(MessageOf(R"({"ticks":18446744073709551616})"),
              "test:1:10: unexpected 1.8446744073709552e+19; expected an integer from 0 to "
              "18446744073709551615");
    EXPECT_EQ(MessageOf(R"({"ticks":1e999})"),
              "test:1:15: not JSON: number overflow parsing '1e999'");
    EXPECT_EQ(MessageOfArguments("AngleInfo", R"({"number":256})"),
              "test:1:34: unexpected 256; expected an integer from 0 to 255");
    EXPECT_EQ(MessageOfArguments("Playlist", R"({"playListId":4294967296})"),
              "test:1:38: unexpected 4294967296; expected an integer from 0 to 4294967295");
    EXPECT_EQ(MessageOfArguments("CurrentTimePosition", R"({"position":18446744073709551615})"),
              "test:1:36: unexpected 18446744073709551615; expected an integer from 0 to "
              "18446744073709551614");
    EXPECT_EQ(MessageOfArguments("ExecuteButton", R"({"commands":65536})"),
              "test:1:36: unexpected 65536; expected an integer from 0 to 65535");
}

TEST(MalformedRecording, HasAnUnknownName)
{
    EXPECT_EQ(MessageOf(R"({"ticks":1,"callback":"Pause"})"),
              "test:1:23: unexpected \"Pause\"; expected the name of a callback");
    const std::string expected =
        "; expected a name, or in quotes the number of a value without a name";
    for (const std::string value : {"forward", "0", "+5", "05", "", "2147483648", "-0", "5 "}) {
        EXPECT_EQ(MessageOfArguments("PlayMode", R"({"direction":")" + value + "\"}"),
                  "test:1:37: unexpected \"" + value + "\"" + expected);
    }
    for (const std::string value : {"64", "-1", "Stopp"}) {
        EXPECT_EQ(MessageOfArguments("UOMask", R"({"forbidden":[")" + value + "\"]}"),
                  "test:1:37: unexpected array; expected names of user operations, not '" + value +
                      "'");
    }
}

TEST(MalformedRecording, HasAnArgumentOfAnotherCallback)
{
    EXPECT_EQ(MessageOfArguments("AngleInfo", R"({"number":1,"chapter":2})"),
              "test:1:46: unexpected 2; expected an argument of AngleInfo");
    EXPECT_EQ(MessageOfArguments("Paused", R"({"number":1})"),
              "test:1:34: unexpected 1; expected an argument of Paused");
}

TEST(MalformedRecording, HasAMalformedBlock)
{
    const std::string expected = "; expected two hexadecimal digits per byte, in lower case";
    for (const std::string value : {"0", "000", "0G", "A5", "0x", "\xC3\xA4"}) {
        EXPECT_EQ(MessageOfArguments("SystemSuspended", R"({"data":")" + value + "\"}"),
                  "test:1:32: unexpected \"" + value + "\"" + expected);
    }
    EXPECT_EQ(MessageOfArguments("SystemSuspended", R"({"data":"0000","size":1})"),
              "test:1:46: unexpected 1; expected at least 2, the bytes in 'data'");
}

TEST(MalformedRecording, ContradictsItself)
{
    EXPECT_EQ(MessageOf(R"({"ticks":45000,"time":"00:00:00.999","callback":"Paused",)"
                        R"("arguments":{}})"),
              "test:1:23: unexpected \"00:00:00.999\"; expected \"00:00:01.000\"");
    EXPECT_EQ(MessageOf(R"({"ticks":1,"callback":"Paused","interface":"button","arguments":{}})"),
              "test:1:44: unexpected \"button\"; expected \"control\"");
}

TEST(MalformedRecording, HasACauseThatCannotBeWritten)
{
    for (const std::string cause : {R"(a\"b)", R"(a\\b)", R"(a\nb)", "\xC3\xA4", "\x7F"}) {
        EXPECT_NE(MessageOf(R"({"ticks":1,"gap":{"cause":")" + cause + "\"}}")
                      .find("; expected printable ASCII without quotes and backslashes"),
                  std::string::npos)
            << cause;
    }
}

TEST(MalformedRecording, HasAStartOfTheWrongType)
{
    EXPECT_EQ(MessageOf(R"({"ticks":1,"start":5})"), "test:1:20: unexpected 5; expected an object");
    EXPECT_EQ(MessageOf(R"({"ticks":1,"start":{"wallClock":5}})"),
              "test:1:33: unexpected 5; expected a string");
}

TEST(MalformedRecording, HasAWallClockThatCannotBeWritten)
{
    EXPECT_EQ(MessageOf(R"({"ticks":1,"start":{"wallClock":"20:15\n"}})"),
              "test:1:33: unexpected \"20:15\\x5Cn\"; expected printable ASCII without quotes and "
              "backslashes");
}

TEST(MalformedRecording, HasTagsThatAreNoTexts)
{
    const std::string line = R"({"ticks":1,"callback":"Paused","arguments":{},"tags":)";

    EXPECT_EQ(MessageOf(line + "5}"), "test:1:54: unexpected 5; expected an object of strings");
    EXPECT_EQ(MessageOf(line + R"({"device":["a"]}})"),
              "test:1:64: unexpected array; expected a string");
}

TEST(MalformedRecording, IsNestedTooDeeply)
{
    const std::string deepest = std::string(7, '[') + std::string(7, ']');

    EXPECT_EQ(MessageOf(R"({"ticks":1,"tags":)" + deepest + "}"),
              "test:1:1: missing member 'callback'");
    EXPECT_EQ(MessageOf(R"({"ticks":1,"tags":[[)" + deepest + "]]}"),
              "test:1:27: nested too deeply; expected at most 8 levels");
    EXPECT_EQ(MessageOf(std::string(1000000, '[')),
              "test:1:10: nested too deeply; expected at most 8 levels");
}

TEST(MalformedRecording, HasTooManyValues)
{
    std::string values = "0";
    for (int i = 0; i < 100000; ++i) {
        values += ",{}";
    }

    EXPECT_EQ(MessageOf("[" + values + "]"),
              "test:1:3001: too many values; expected at most a few hundred");
}

TEST(MalformedRecording, HasALineThatIsTooLong)
{
    EXPECT_EQ(MessageOf(std::string(LongestRecordLine + 1, ' ') + "\n"),
              "test:1: line too long; expected at most 1048576 bytes");
}

TEST(MalformedRecording, ShowsOnlyTheBeginningOfLongValues)
{
    const std::string expected =
        "test:1:23: unexpected \"" + std::string(39, 'a') + "...; expected the name of a callback";

    EXPECT_EQ(MessageOf(R"({"ticks":1,"callback":")" + std::string(100000, 'a') + "\"}"), expected);
    EXPECT_LT(MessageOf("{\"" + std::string(100000, 'a')).size(), 200U);
}

TEST(MalformedRecording, CannotBeReadAtAll)
{
    for (const std::ios::iostate state : {std::ios::badbit, std::ios::failbit}) {
        std::istringstream stream;
        stream.setstate(state);
        RecordingReader reader(stream, "test");
        KeptRecords records;

        try {
            reader.Next(records);
            ADD_FAILURE();
        } catch (const RecordingError& error) {
            EXPECT_STREQ(error.what(), "test: cannot read recording");
        }
    }
}

} // namespace
} // namespace deskplayer
