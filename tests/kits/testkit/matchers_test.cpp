// The matchers for callbacks, and the texts of their failures.

#include "testkit/matchers.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace
{

namespace callbacks = bdmv::callbacks;
using bdmvtest::CallbackMatcher;
using bdmvtest::Has;
using bdmvtest::Is;
using bdmvtest::IsA;
using testing::Gt;

const bdmv::Callback Item =
    callbacks::PlayItem{800, 1, bd::VideoFormatType1080p, bd::VideoAspectRatioType16x9};

std::string DescriptionOf(const CallbackMatcher& matcher)
{
    return testing::DescribeMatcher<const bdmv::Callback&>(matcher);
}

std::string NegatedDescriptionOf(const CallbackMatcher& matcher)
{
    return testing::DescribeMatcher<const bdmv::Callback&>(matcher, true);
}

std::string ExplanationOf(const CallbackMatcher& matcher, const bdmv::Callback& callback)
{
    testing::StringMatchResultListener listener;
    matcher.MatchAndExplain(callback, &listener);
    return listener.str();
}

TEST(IsMatcher, ComparesTheCallbackAndItsArguments)
{
    EXPECT_THAT(Item, Is(Item));
    EXPECT_THAT(bdmv::Callback(callbacks::Playlist{800}), Is(callbacks::Playlist{800}));
    EXPECT_THAT(bdmv::Callback(callbacks::Playlist{800}), Not(Is(callbacks::Playlist{801})));
    EXPECT_THAT(bdmv::Callback(callbacks::Paused()), Not(Is(callbacks::Stopped())));
}

TEST(IsMatcher, ComparesBytesWhereverTheyAre)
{
    const bd::UInt8 one[] = {1, 2, 3};
    const bd::UInt8 same[] = {1, 2, 3};
    const bd::UInt8 other[] = {1, 2, 4};
    const bdmv::Callback suspended = callbacks::SystemSuspended{one, 3};
    EXPECT_THAT(suspended, Is(callbacks::SystemSuspended{same, 3}));
    EXPECT_THAT(suspended, Not(Is(callbacks::SystemSuspended{other, 3})));
    EXPECT_THAT(suspended, Not(Is(callbacks::SystemSuspended{same, 2})));
    EXPECT_THAT(suspended, Not(Is(callbacks::SystemSuspended{nullptr, 3})));
}

TEST(IsMatcher, ComparesAllBitsOfAMask)
{
    // Bit 0 belongs to no operation that has a name.
    const bdmv::Callback reserved = callbacks::UOMask{bdmv::UOMaskTable(1)};
    EXPECT_THAT(reserved, Not(Is(callbacks::UOMask{bdmv::UOMaskTable(0)})));
}

TEST(IsMatcher, DescribesTheExpectedCallback)
{
    EXPECT_EQ(DescriptionOf(Is(callbacks::Playlist{800})), "is Playlist(playListId=800)");
    EXPECT_EQ(NegatedDescriptionOf(Is(callbacks::Paused())), "isn't Paused()");
}

TEST(IsMatcher, NamesTheArgumentsThatDiffer)
{
    EXPECT_EQ(ExplanationOf(Is(callbacks::PlayItem{800, 2, bd::VideoFormatType480i,
                                                   bd::VideoAspectRatioType16x9}),
                            Item),
              "which differs in playItemId, videoFormat");
    EXPECT_EQ(ExplanationOf(Is(callbacks::Paused()), Item), "");
}

TEST(IsAMatcher, ComparesTheKindAlone)
{
    EXPECT_THAT(Item, IsA(bdmv::CallbackPlayItem));
    EXPECT_THAT(Item, Not(IsA(bdmv::CallbackPlaylist)));
}

TEST(IsAMatcher, NamesTheKind)
{
    EXPECT_EQ(DescriptionOf(IsA(bdmv::CallbackPlayItem)), "is PlayItem");
    EXPECT_EQ(NegatedDescriptionOf(IsA(bdmv::CallbackPlayItem)), "isn't PlayItem");
}

TEST(HasMatcher, ComparesOneArgument)
{
    EXPECT_THAT(Item, Has(&callbacks::PlayItem::playListId, 800));
    EXPECT_THAT(Item, Not(Has(&callbacks::PlayItem::playListId, 801)));
    EXPECT_THAT(Item, Not(Has(&callbacks::Playlist::playListId, 800)));
}

TEST(HasMatcher, TakesMatchers)
{
    EXPECT_THAT(Item, Has(&callbacks::PlayItem::playListId, Gt(799u)));
    EXPECT_THAT(Item, Not(Has(&callbacks::PlayItem::playListId, Gt(800u))));
}

TEST(HasMatcher, CombinesWithOthers)
{
    EXPECT_THAT(Item, AllOf(Has(&callbacks::PlayItem::playItemId, 1),
                            Has(&callbacks::PlayItem::videoFormat, bd::VideoFormatType1080p)));
}

TEST(HasMatcher, NamesTheArgumentAndItsEnumerator)
{
    EXPECT_EQ(DescriptionOf(Has(&callbacks::PlayItem::videoFormat, bd::VideoFormatType480i)),
              "is PlayItem whose videoFormat is equal to VideoFormatType480i");
    EXPECT_EQ(NegatedDescriptionOf(Has(&callbacks::PlayItem::videoFormat, bd::VideoFormatType480i)),
              "isn't PlayItem whose videoFormat is equal to VideoFormatType480i");
    EXPECT_EQ(ExplanationOf(Has(&callbacks::PlayItem::videoFormat, bd::VideoFormatType480i), Item),
              "whose videoFormat is VideoFormatType1080p");
    EXPECT_EQ(ExplanationOf(Has(&callbacks::Playlist::playListId, 800), Item), "");
}

TEST(HasMatcher, AddsWhatTheInnerMatcherExplains)
{
    const auto isEven = testing::ResultOf([](bd::PlayListIdDef id) { return id % 2 == 0; }, true);
    EXPECT_EQ(
        ExplanationOf(Has(&callbacks::Playlist::playListId, isEven), callbacks::Playlist{791}),
        "whose playListId is 791, which is mapped by the given callable to false "
        "(of type bool)");
    EXPECT_EQ(ExplanationOf(Has(&callbacks::Playlist::playListId, 800), callbacks::Playlist{791}),
              "whose playListId is 791");
}

TEST(HasMatcher, FindsTheNameWhereverTheArgumentIs)
{
    EXPECT_EQ(DescriptionOf(Has(&callbacks::MarkInfo::markId, 3)),
              "is MarkInfo whose markId is equal to 3");
    EXPECT_EQ(DescriptionOf(Has(&callbacks::MarkInfo::time, 45000)),
              "is MarkInfo whose time is equal to 45000");
}

TEST(HasMatcher, ShowsSmallNumbersAsNumbers)
{
    EXPECT_EQ(DescriptionOf(Has(&callbacks::TextSubtitleStylesAvailable::numberOfStyles, 65)),
              "is TextSubtitleStylesAvailable whose numberOfStyles is equal to 65");
}

TEST(HasMatcher, TellsAStructureFromItsFirstMember)
{
    EXPECT_EQ(DescriptionOf(Has(&callbacks::AudioInfoChanged::info, bd::AudioInfoType())),
              "is AudioInfoChanged whose argument is equal to (AudioFormatUnknown, "
              "AudioSampleRateUnknown, AudioBitsPerSamplingTypeInvalid, AudioChannelTypeUnknown, "
              "0, 0)");
}

TEST(Matchers, MatchASequence)
{
    const std::vector<bdmv::Callback> received = {callbacks::PlayStarted(),
                                                  callbacks::Playlist{800}, Item};
    EXPECT_THAT(received,
                testing::ElementsAre(Is(callbacks::PlayStarted()), IsA(bdmv::CallbackPlaylist),
                                     Has(&callbacks::PlayItem::playItemId, 1)));
    testing::StringMatchResultListener listener;
    const testing::Matcher<const std::vector<bdmv::Callback>&> two = testing::ElementsAre(
        Is(callbacks::PlayStarted()), Is(callbacks::Playlist{801}), IsA(bdmv::CallbackPlayItem));
    EXPECT_FALSE(two.MatchAndExplain(received, &listener));
    EXPECT_EQ(listener.str(), "whose element #1 doesn't match, which differs in playListId");
    EXPECT_EQ(testing::PrintToString(received),
              "{ PlayStarted(), Playlist(playListId=800), PlayItem(playListId=800, playItemId=1, "
              "videoFormat=1080p, aspectRatio=16:9) }");
}

} // namespace
