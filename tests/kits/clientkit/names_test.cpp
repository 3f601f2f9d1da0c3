#include "clientkit/names.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <iterator>
#include <string>
#include <string_view>

#include "testkit/enumerators.h"

namespace bdmv
{
namespace
{

/** How the names of an enumeration follow from its enumerators. */
template <typename Type> struct Enumeration;

template <> struct Enumeration<bd::PlayDirectionDef> {
    static constexpr std::string_view prefix = "PlayDirection";
};
template <> struct Enumeration<bd::PlaySpeedDef> {
    static constexpr std::string_view prefix = "PlaySpeed";
};
template <> struct Enumeration<bd::TriggerType> {
    static constexpr std::string_view prefix = ""; // it has two families of names
};
template <> struct Enumeration<bd::VideoFormatType> {
    static constexpr std::string_view prefix = "VideoFormatType";
};
template <> struct Enumeration<bd::VideoAspectRatioType> {
    static constexpr std::string_view prefix = "VideoAspectRatioType";
};
template <> struct Enumeration<bd::AudioFormatType> {
    static constexpr std::string_view prefix = "AudioFormat";
};
template <> struct Enumeration<bd::AudioSampleRateType> {
    static constexpr std::string_view prefix = "AudioSampleRate";
};
template <> struct Enumeration<bd::AudioBitsPerSamplingType> {
    static constexpr std::string_view prefix = "AudioBitsPerSamplingType";
};
template <> struct Enumeration<bd::AudioChannelType> {
    static constexpr std::string_view prefix = "AudioChannelType";
};
template <> struct Enumeration<bd::UserOperationMaskDef> {
    static constexpr std::string_view prefix = "UserOperation";
};
template <> struct Enumeration<INavControlListener::FinishedReason> {
    static constexpr std::string_view prefix = "";
};

/** The enumerator's name in the source without the prefix of its enumeration; empty without one. */
template <typename Type> std::string DeclaredName(Type value)
{
    std::string_view name = bdmvtest::EnumeratorName(value);
    const std::string_view prefix = Enumeration<Type>::prefix;
    if (name.substr(0, prefix.size()) == prefix) {
        name.remove_prefix(prefix.size());
    }
    return std::string(name.substr(std::min(name.find_first_not_of('_'), name.size())));
}

/** A ratio of two numbers as it is written: 2.21:1 of 2_21x1. */
template <> std::string DeclaredName(bd::VideoAspectRatioType value)
{
    std::string name(bdmvtest::EnumeratorName(value));
    name.erase(0, Enumeration<bd::VideoAspectRatioType>::prefix.size());
    if (value != bd::VideoAspectRatioTypeNoInfo) {
        std::replace(name.begin(), name.end(), 'x', ':');
        std::replace(name.begin(), name.end(), '_', '.');
    }
    return name;
}

template <typename Type> class Names : public testing::Test
{
};

typedef testing::Types<bd::PlayDirectionDef, bd::PlaySpeedDef, bd::TriggerType, bd::VideoFormatType,
                       bd::VideoAspectRatioType, bd::AudioFormatType, bd::AudioSampleRateType,
                       bd::AudioBitsPerSamplingType, bd::AudioChannelType, bd::UserOperationMaskDef,
                       INavControlListener::FinishedReason>
    Enumerations;
TYPED_TEST_SUITE(Names, Enumerations, );

TYPED_TEST(Names, AreThoseOfTheEnumerators)
{
    std::ptrdiff_t count = 0;
    for (int number = -1; number < 64; ++number) {
        const auto value = static_cast<TypeParam>(number);
        const char* const name = NameOf(value);
        EXPECT_EQ(DeclaredName(value), name == nullptr ? "" : name) << number;
        count += name == nullptr ? 0 : 1;
    }

    const EnumeratorNames<TypeParam> names = NamesOf<TypeParam>();
    EXPECT_EQ(count, std::distance(names.begin(), names.end()));
}

TYPED_TEST(Names, AreInOrderOfTheirValues)
{
    const EnumeratorName<TypeParam>* last = nullptr;
    for (const EnumeratorName<TypeParam>& entry : NamesOf<TypeParam>()) {
        EXPECT_TRUE(last == nullptr || last->code < entry.code) << entry.name;
        last = &entry;
    }
}

TYPED_TEST(Names, ArePrintableWithoutQuotesAndBackslashes)
{
    for (const EnumeratorName<TypeParam>& entry : NamesOf<TypeParam>()) {
        const std::string_view name = entry.name;
        EXPECT_FALSE(name.empty());
        EXPECT_TRUE(std::all_of(name.begin(), name.end(), [](char character) {
            return character > ' ' && character < 0x7F && character != '"' && character != '\\';
        })) << name;
    }
}

TYPED_TEST(Names, AreMissingForOtherValues)
{
    EXPECT_EQ(nullptr, NameOf(static_cast<TypeParam>(-1)));
    EXPECT_EQ(nullptr, NameOf(static_cast<TypeParam>(1000)));
}

} // namespace
} // namespace bdmv
