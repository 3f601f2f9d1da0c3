// Tags of recordings.

#include <gtest/gtest.h>

#include "keptrecords.h"

namespace deskplayer
{
namespace
{

const std::string Callback = R"({"ticks":1,"time":"00:00:00.000","interface":"control",)"
                             R"("callback":"Paused","arguments":{})";
const std::string Gap = R"({"ticks":2,"gap":{"cause":"lost"})";
const std::string Start = R"({"ticks":3,"start":{"wallClock":"20:15"})";

TEST(TagsOfARecording, AreRead)
{
    const std::string tags = R"(,"tags":{"device":"7","firmware":""}})"
                             "\n";
    const KeptRecords read = RecordsOf(Callback + tags + Gap + tags + Start + tags);

    const Tags expected = {{"device", "7"}, {"firmware", ""}};
    EXPECT_EQ(read.callbacks.at(0).tags, expected);
    EXPECT_EQ(read.gaps.at(0).tags, expected);
    EXPECT_EQ(read.starts.at(0).tags, expected);
}

TEST(TagsOfARecording, AreWrittenAgainByteForByte)
{
    const std::string odd = R"(,"tags":{"Z":"\"\\\u0000\n\u001f","a":"/)"
                            "\x7F\xC3\xA4\xF0\x9F\x93\xBA"
                            R"(","b":""}})"
                            "\n";
    const std::string recording = Callback + odd + Callback + "}\n" + Gap + odd + Start + odd;

    EXPECT_EQ(WrittenAgain(recording), recording);
}

TEST(TagsOfARecording, AreSortedWhenTheyAreWrittenAgain)
{
    EXPECT_EQ(WrittenAgain(Gap + R"(,"tags":{"b":"1","a":"2"}})"),
              Gap + R"(,"tags":{"a":"2","b":"1"}})"
                    "\n");
}

} // namespace
} // namespace deskplayer
