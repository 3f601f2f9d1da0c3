#include "output/callbackrecorder.h"

#include <gtest/gtest.h>

namespace deskplayer
{

namespace
{

TEST(CallbackRecorder, FindsACallbackByItsNameAndSomeArguments)
{
    CallbackRecorder recorder;
    recorder.AudioInfo(2);
    recorder.Stepped(45000 * 90, bd::PlayDirectionForward);

    EXPECT_TRUE(recorder.Contains("AudioInfo", {}));
    EXPECT_TRUE(recorder.Contains("AudioInfo", {"number=2"}));
    EXPECT_FALSE(recorder.Contains("AudioInfo", {"number=1"}));
    EXPECT_FALSE(recorder.Contains("VideoInfo", {"number=2"}));
    EXPECT_FALSE(recorder.Contains("Audio", {}));
    EXPECT_TRUE(recorder.Contains("Stepped", {"direction=Forward"}));
    EXPECT_TRUE(recorder.Contains("Stepped", {"direction=Forward", "position=00:01:30.000"}));
    EXPECT_FALSE(recorder.Contains("Stepped", {"direction=Forward", "position=00:01:31.000"}));
}

TEST(CallbackRecorder, WantsAllArgumentsOfTheSameCallback)
{
    CallbackRecorder recorder;
    recorder.SecondaryVideoDisplay(1, false);
    recorder.SecondaryVideoDisplay(2, true);

    EXPECT_FALSE(recorder.Contains("SecondaryVideoDisplay", {"number=1", "shown=true"}));
    EXPECT_TRUE(recorder.Contains("SecondaryVideoDisplay", {"number=2", "shown=true"}));
}

TEST(CallbackRecorder, ForgetsEverythingWhenCleared)
{
    CallbackRecorder recorder;
    EXPECT_TRUE(recorder.IsEmpty());
    EXPECT_EQ(recorder.Text(), "nothing");
    recorder.Paused();
    EXPECT_FALSE(recorder.IsEmpty());

    recorder.Clear();

    EXPECT_TRUE(recorder.IsEmpty());
    EXPECT_FALSE(recorder.Contains("Paused", {}));
}

TEST(CallbackRecorder, ShowsAllCallbacksOnOneLine)
{
    CallbackRecorder recorder;
    recorder.Paused();
    recorder.SecondaryVideoDisplay(2, true);
    EXPECT_EQ(recorder.Text(), "Paused, SecondaryVideoDisplay number=2 shown=true");
}

TEST(CallbackRecorder, ShowsTheFirstAndLastOfManyCallbacks)
{
    CallbackRecorder recorder;
    for (bd::StreamNumberDef number = 1; number <= 40; ++number) {
        recorder.AudioInfo(number);
    }
    EXPECT_EQ(recorder.Text().find("more"), std::string::npos);
    recorder.AudioInfo(41);
    recorder.AudioInfo(42);

    const std::string text = recorder.Text();

    EXPECT_EQ(text.rfind("AudioInfo number=1, ", 0), 0U);
    EXPECT_NE(text.find(", AudioInfo number=20, 2 more, AudioInfo number=23, "), std::string::npos)
        << text;
    EXPECT_EQ(text.substr(text.rfind(", ")), ", AudioInfo number=42");
}

} // namespace
} // namespace deskplayer
