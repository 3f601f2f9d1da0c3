#include "output/tags.h"

#include <gtest/gtest.h>

#include <sstream>
#include <stdexcept>
#include <string>
#include <vector>

#include "output/jsonoutput.h"

namespace deskplayer
{
namespace
{

namespace callbacks = bdmv::callbacks;

std::string MessageOf(const std::vector<std::string>& texts)
{
    try {
        ParseTags(texts);
    } catch (const std::invalid_argument& error) {
        return error.what();
    }
    return "nothing";
}

TEST(Tags, AreReadFromNamesAndValues)
{
    EXPECT_EQ(ParseTags({}), Tags());
    EXPECT_EQ(ParseTags({"firmware=2.1", "device=box 7"}),
              (Tags{{"device", "box 7"}, {"firmware", "2.1"}}));
}

TEST(Tags, MayHaveEmptyValuesAndEqualsSignsInThem)
{
    EXPECT_EQ(ParseTags({"a=", "b=c=d"}), (Tags{{"a", ""}, {"b", "c=d"}}));
}

TEST(Tags, NeedANameAndAnEqualsSign)
{
    EXPECT_EQ(MessageOf({"device"}), "'device' is not a tag; expected NAME=VALUE");
    EXPECT_EQ(MessageOf({"=7"}), "'=7' is not a tag; expected NAME=VALUE");
    EXPECT_EQ(MessageOf({""}), "'' is not a tag; expected NAME=VALUE");
}

TEST(Tags, HaveDifferentNames)
{
    EXPECT_EQ(MessageOf({"device=7", "firmware=1", "device=8"}), "tag 'device' given twice");
}

TEST(Tags, AreUtf8)
{
    EXPECT_EQ(ParseTags({"ger\xC3\xA4t=\xE2\x82\xAC"}), (Tags{{"ger\xC3\xA4t", "\xE2\x82\xAC"}}));
    EXPECT_EQ(MessageOf({"device=\xE9"}), "tag 'device=\\xE9' is not valid UTF-8");
    EXPECT_EQ(MessageOf({"d\xC3=7"}), "tag 'd\\xC3=7' is not valid UTF-8");
}

TEST(Tags, HaveALimitedLength)
{
    const std::size_t longest = LongestTags - std::string(R"({"a":""})").size();
    EXPECT_EQ(MessageOf({"a=" + std::string(longest, 'x')}), "nothing");
    EXPECT_EQ(MessageOf({"a=" + std::string(longest + 1, 'x')}),
              "tags too long: 4097 bytes of JSON; expected at most 4096");
}

TEST(Tags, AreSortedByNameInJson)
{
    EXPECT_EQ(TagsJson({{"b", "1"}, {"a\"", "\n"}, {"C", ""}}), R"({"C":"","a\"":"\n","b":"1"})");
}

/** What an output with tags writes of a pause, a gap and a start that have others. */
std::string Written(const Tags& ofOutput, const Tags& ofRecords)
{
    std::ostringstream stream;
    const VirtualClock clock;
    JsonOutput output(stream, clock, OutputFilter(), ofOutput);
    RecordListener& listener = output;
    CallbackRecord record = {Ticks(1), callbacks::Paused{}, {}};
    record.tags = ofRecords;
    listener.OnRecord(record);
    listener.OnGap({Ticks(2), "lost", 3, ofRecords});
    listener.OnStart({Ticks(4), "20:15", ofRecords});
    return stream.str();
}

std::string Expected(const std::string& tags)
{
    return R"({"ticks":1,"time":"00:00:00.000","interface":"control","callback":"Paused",)"
           R"("arguments":{})" +
           tags + "}\n" + R"({"ticks":2,"gap":{"lost":3,"cause":"lost"})" + tags + "}\n" +
           R"({"ticks":4,"start":{"wallClock":"20:15"})" + tags + "}\n";
}

TEST(Tags, AreTheLastMemberOfEveryObject)
{
    EXPECT_EQ(Written({{"b", "1"}, {"a", "2"}}, {}), Expected(R"(,"tags":{"a":"2","b":"1"})"));
}

TEST(Tags, OfARecordAreWrittenWithIt)
{
    EXPECT_EQ(Written({}, {{"a", "2"}}), Expected(R"(,"tags":{"a":"2"})"));
}

TEST(Tags, OfTheOutputReplaceThoseOfARecord)
{
    EXPECT_EQ(Written({{"b", "new"}, {"c", "3"}}, {{"a", "1"}, {"b", "old"}}),
              Expected(R"(,"tags":{"a":"1","b":"new","c":"3"})"));
}

TEST(Tags, AreNoMemberIfThereAreNone)
{
    EXPECT_EQ(Written({}, {}), Expected(""));
}

TEST(Tags, OfOneRecordAreNotThoseOfTheNext)
{
    std::ostringstream stream;
    const VirtualClock clock;
    JsonOutput output(stream, clock, OutputFilter());
    RecordListener& listener = output;
    listener.OnStart({Ticks(1), "20:15", {{"a", "1"}}});
    listener.OnStart({Ticks(1), "20:15"});

    EXPECT_EQ(stream.str(), R"({"ticks":1,"start":{"wallClock":"20:15"},"tags":{"a":"1"}})"
                            "\n"
                            R"({"ticks":1,"start":{"wallClock":"20:15"}})"
                            "\n");
}

} // namespace
} // namespace deskplayer
