#include <gtest/gtest.h>

#include <cstddef>
#include <cstdint>
#include <type_traits>

#include "bd/constants.h"
#include "bd/types.h"
#include "kevro/kevro_types.h"

namespace
{

template <typename Type, typename Expected> constexpr bool Is = std::is_same_v<Type, Expected>;

bd::AudioInfoType SomeAudioInfo()
{
    bd::AudioInfoType info;
    info.format = bd::AudioFormatEac3;
    info.sampleRate = bd::AudioSampleRate_48000;
    info.bitsPerSampling = bd::AudioBitsPerSamplingType24;
    info.channels = bd::AudioChannelType5_1;
    info.pid = 0x1100;
    info.u4AudChannelLayout = 0x0000003F;
    return info;
}

void ExpectSomeAudioInfo(const bd::AudioInfoType& info)
{
    EXPECT_EQ(bd::AudioFormatEac3, info.format);
    EXPECT_EQ(bd::AudioSampleRate_48000, info.sampleRate);
    EXPECT_EQ(bd::AudioBitsPerSamplingType24, info.bitsPerSampling);
    EXPECT_EQ(bd::AudioChannelType5_1, info.channels);
    EXPECT_EQ(0x1100, info.pid);
    EXPECT_EQ(0x0000003Fu, info.u4AudChannelLayout);
}

bd::ZOOM_PARAM_Def SomeZoom()
{
    return {{1, 2, 3, 4}, {5, 6, 7, 8}, 9};
}

/** Whether == and != both treat two values as equal. */
template <typename Value> void ExpectEqual(const Value& left, const Value& right)
{
    EXPECT_TRUE(left == right);
    EXPECT_FALSE(left != right);
}

/** Changes the members of a copy one by one: each change alone makes the copy differ. */
template <typename Value, typename... Changes>
void ExpectEachToDiffer(const Value& original, Changes... changes)
{
    int number = 0;
    const auto expectToDiffer = [&](auto change) {
        Value changed = original;
        change(changed);
        EXPECT_FALSE(changed == original) << "change " << number;
        EXPECT_TRUE(changed != original) << "change " << number;
        ++number;
    };
    (expectToDiffer(changes), ...);
}

} // namespace

TEST(PlatformTypes, HaveTheirExactWidths)
{
    EXPECT_TRUE((Is<KEVRO_Bool, std::int32_t>));
    EXPECT_TRUE((Is<KEVRO_UInt8, std::uint8_t>));
    EXPECT_TRUE((Is<KEVRO_UInt16, std::uint16_t>));
    EXPECT_TRUE((Is<KEVRO_UInt32, std::uint32_t>));
    EXPECT_TRUE((Is<KEVRO_UInt64, std::uint64_t>));
    EXPECT_TRUE((Is<KEVRO_Int32, std::int32_t>));
    EXPECT_TRUE((Is<KEVRO_Int64, std::int64_t>));
    EXPECT_TRUE((Is<KEVRO_TimeCode, std::int64_t>));
}

TEST(BaseTypes, AreThePlatformsTypes)
{
    EXPECT_TRUE((Is<bd::UInt8, KEVRO_UInt8>));
    EXPECT_TRUE((Is<bd::UInt16, KEVRO_UInt16>));
    EXPECT_TRUE((Is<bd::UInt32, KEVRO_UInt32>));
    EXPECT_TRUE((Is<bd::UInt64, KEVRO_UInt64>));
    EXPECT_TRUE((Is<bd::Int32, KEVRO_Int32>));
    EXPECT_TRUE((Is<bd::Int64, KEVRO_Int64>));
}

TEST(Identifiers, OfEightBits)
{
    EXPECT_TRUE((Is<bd::SubPlayItemIdDef, bd::UInt8>));
    EXPECT_TRUE((Is<bd::AngleNumberDef, bd::UInt8>));
    EXPECT_TRUE((Is<bd::AngleIdDef, bd::UInt8>));
    EXPECT_TRUE((Is<bd::PageId, bd::UInt8>));
    EXPECT_TRUE((Is<bd::UserStyleNumber, bd::UInt8>));
    EXPECT_TRUE((Is<bd::SoundIdDef, bd::UInt8>));
}

TEST(Identifiers, OfSixteenBits)
{
    EXPECT_TRUE((Is<bd::PlayItemIdDef, bd::UInt16>));
    EXPECT_TRUE((Is<bd::SubPathIdDef, bd::UInt16>));
    EXPECT_TRUE((Is<bd::PlayListMarkIdDef, bd::UInt16>));
    EXPECT_TRUE((Is<bd::ChapterNumberDef, bd::UInt16>));
    EXPECT_TRUE((Is<bd::TitleNumberDef, bd::UInt16>));
    EXPECT_TRUE((Is<bd::MovieObjectIdDef, bd::UInt16>));
    EXPECT_TRUE((Is<bd::StreamNumberDef, bd::UInt16>));
    EXPECT_TRUE((Is<bd::ButtonId, bd::UInt16>));
    EXPECT_TRUE((Is<bd::ButtonNumber, bd::UInt16>));
    EXPECT_TRUE((Is<bd::Pid, bd::UInt16>));
}

TEST(Identifiers, OfThirtyTwoBits)
{
    EXPECT_TRUE((Is<bd::Pts, bd::UInt32>));
    EXPECT_TRUE((Is<bd::Spn, bd::UInt32>));
    EXPECT_TRUE((Is<bd::PlayListIdDef, bd::UInt32>));
    EXPECT_TRUE((Is<bd::ClipInfoIdDef, bd::UInt32>));
    EXPECT_TRUE((Is<bd::ServiceRequestId, bd::UInt32>));
}

TEST(Identifiers, OfSixtyFourBits)
{
    EXPECT_TRUE((Is<bd::TimePosition, bd::UInt64>));
}

TEST(Constants, TimePositionNoneIsAllOnes)
{
    EXPECT_TRUE((Is<decltype(bd::TimePositionNone), const bd::TimePosition>));
    EXPECT_EQ(UINT64_MAX, bd::TimePositionNone);
}

TEST(AudioInfoType, IsAllZeroByDefault)
{
    alignas(bd::AudioInfoType) unsigned char dirty[sizeof(bd::AudioInfoType)];
    for (unsigned char& byte : dirty) {
        byte = 0xA5;
    }
    const bd::AudioInfoType* const info = new (dirty) bd::AudioInfoType;

    EXPECT_EQ(bd::AudioFormatUnknown, info->format);
    EXPECT_EQ(bd::AudioSampleRateUnknown, info->sampleRate);
    EXPECT_EQ(bd::AudioBitsPerSamplingTypeInvalid, info->bitsPerSampling);
    EXPECT_EQ(bd::AudioChannelTypeUnknown, info->channels);
    EXPECT_EQ(0, info->pid);
    EXPECT_EQ(0u, info->u4AudChannelLayout);
}

TEST(AudioInfoType, HasItsFieldsInOrder)
{
    EXPECT_TRUE((Is<decltype(bd::AudioInfoType::format), bd::AudioFormatType>));
    EXPECT_TRUE((Is<decltype(bd::AudioInfoType::sampleRate), bd::AudioSampleRateType>));
    EXPECT_TRUE((Is<decltype(bd::AudioInfoType::bitsPerSampling), bd::AudioBitsPerSamplingType>));
    EXPECT_TRUE((Is<decltype(bd::AudioInfoType::channels), bd::AudioChannelType>));
    EXPECT_TRUE((Is<decltype(bd::AudioInfoType::pid), bd::Pid>));
    EXPECT_TRUE((Is<decltype(bd::AudioInfoType::u4AudChannelLayout), bd::UInt32>));

    EXPECT_EQ(0u, offsetof(bd::AudioInfoType, format));
    EXPECT_EQ(4u, offsetof(bd::AudioInfoType, sampleRate));
    EXPECT_EQ(8u, offsetof(bd::AudioInfoType, bitsPerSampling));
    EXPECT_EQ(12u, offsetof(bd::AudioInfoType, channels));
    EXPECT_EQ(16u, offsetof(bd::AudioInfoType, pid));
    EXPECT_EQ(20u, offsetof(bd::AudioInfoType, u4AudChannelLayout));
    EXPECT_EQ(24u, sizeof(bd::AudioInfoType));
}

TEST(AudioInfoType, CopiesFieldForField)
{
    const bd::AudioInfoType info = SomeAudioInfo();

    ExpectSomeAudioInfo(bd::AudioInfoType(info));
}

TEST(AudioInfoType, IsEqualWhenAllMembersAre)
{
    ExpectEqual(SomeAudioInfo(), SomeAudioInfo());
    ExpectEqual(bd::AudioInfoType(), bd::AudioInfoType());
}

TEST(AudioInfoType, DiffersWhenAnyMemberDiffers)
{
    typedef bd::AudioInfoType Value;
    ExpectEachToDiffer(
        SomeAudioInfo(), [](Value& value) { value.format = bd::AudioFormatAc3; },
        [](Value& value) { value.sampleRate = bd::AudioSampleRate_96000; },
        [](Value& value) { value.bitsPerSampling = bd::AudioBitsPerSamplingType16; },
        [](Value& value) { value.channels = bd::AudioChannelTypeStereo; },
        [](Value& value) { value.pid = 0x1101; },
        [](Value& value) { value.u4AudChannelLayout = 0x0001003F; });
}

TEST(AudioInfoType, IsEqualWhateverItsPaddingContains)
{
    alignas(bd::AudioInfoType) unsigned char dirty[sizeof(bd::AudioInfoType)];
    for (unsigned char& byte : dirty) {
        byte = 0xA5;
    }

    ExpectEqual(*new (dirty) bd::AudioInfoType, bd::AudioInfoType());
}

TEST(AudioInfoType, CopyIsUnaffectedByLaterChangesToTheSource)
{
    bd::AudioInfoType info = SomeAudioInfo();
    const bd::AudioInfoType copy = info;
    info = bd::AudioInfoType();

    ExpectSomeAudioInfo(copy);
}

TEST(ZoomRectangleDef, HasItsFieldsInOrder)
{
    EXPECT_TRUE((Is<decltype(bd::ZoomRectangleDef::X), bd::UInt16>));
    EXPECT_TRUE((Is<decltype(bd::ZoomRectangleDef::Y), bd::UInt16>));
    EXPECT_TRUE((Is<decltype(bd::ZoomRectangleDef::Width), bd::UInt16>));
    EXPECT_TRUE((Is<decltype(bd::ZoomRectangleDef::Height), bd::UInt16>));

    EXPECT_EQ(0u, offsetof(bd::ZoomRectangleDef, X));
    EXPECT_EQ(2u, offsetof(bd::ZoomRectangleDef, Y));
    EXPECT_EQ(4u, offsetof(bd::ZoomRectangleDef, Width));
    EXPECT_EQ(6u, offsetof(bd::ZoomRectangleDef, Height));
    EXPECT_EQ(8u, sizeof(bd::ZoomRectangleDef));
}

TEST(ZoomRectangleDef, IsEqualWhenAllMembersAre)
{
    ExpectEqual(bd::ZoomRectangleDef{1, 2, 3, 4}, bd::ZoomRectangleDef{1, 2, 3, 4});
}

TEST(ZoomRectangleDef, DiffersWhenAnyMemberDiffers)
{
    typedef bd::ZoomRectangleDef Value;
    ExpectEachToDiffer(
        Value{1, 2, 3, 4}, [](Value& value) { value.X = 0; }, [](Value& value) { value.Y = 0; },
        [](Value& value) { value.Width = 0; }, [](Value& value) { value.Height = 0; });
}

TEST(ZoomParam, HasItsFieldsInOrder)
{
    EXPECT_TRUE((Is<decltype(bd::ZOOM_PARAM_Def::rClipRectangle), bd::ZoomRectangleDef>));
    EXPECT_TRUE((Is<decltype(bd::ZOOM_PARAM_Def::rDestRectangle), bd::ZoomRectangleDef>));
    EXPECT_TRUE((Is<decltype(bd::ZOOM_PARAM_Def::u4Delay), bd::UInt32>));

    EXPECT_EQ(0u, offsetof(bd::ZOOM_PARAM_Def, rClipRectangle));
    EXPECT_EQ(8u, offsetof(bd::ZOOM_PARAM_Def, rDestRectangle));
    EXPECT_EQ(16u, offsetof(bd::ZOOM_PARAM_Def, u4Delay));
    EXPECT_EQ(20u, sizeof(bd::ZOOM_PARAM_Def));
}

TEST(ZoomParam, CopyIsUnaffectedByLaterChangesToTheSource)
{
    bd::ZOOM_PARAM_Def zoom = SomeZoom();
    const bd::ZOOM_PARAM_Def copy = zoom;
    zoom = bd::ZOOM_PARAM_Def();

    EXPECT_TRUE(copy == SomeZoom());
}

TEST(ZoomParam, IsEqualWhenAllMembersAre)
{
    ExpectEqual(SomeZoom(), SomeZoom());
}

TEST(ZoomParam, DiffersWhenAnyMemberDiffers)
{
    typedef bd::ZOOM_PARAM_Def Value;
    ExpectEachToDiffer(
        SomeZoom(),
        [](Value& value) {
            value.rClipRectangle = {0, 2, 3, 4};
        },
        [](Value& value) {
            value.rDestRectangle = {5, 6, 7, 0};
        },
        [](Value& value) { value.u4Delay = 0; });
}

TEST(Trigger, IsOneTriggerType)
{
    EXPECT_TRUE((Is<decltype(bd::Trigger::triggerType), bd::TriggerType>));
    EXPECT_EQ(4u, sizeof(bd::Trigger));
}

TEST(Trigger, IsEqualWhenItsTypeIs)
{
    ExpectEqual(bd::Trigger{bd::TRIGGER_B}, bd::Trigger{bd::TRIGGER_B});
}

TEST(Trigger, DiffersWhenItsTypeDiffers)
{
    ExpectEachToDiffer(bd::Trigger{bd::TRIGGER_B},
                       [](bd::Trigger& value) { value.triggerType = bd::TRIGGER_A; });
}

TEST(BDMarkDef, IsEqualWhenAllMembersAre)
{
    ExpectEqual(bd::BDMarkDef{90000, 2}, bd::BDMarkDef{90000, 2});
}

TEST(BDMarkDef, DiffersWhenAnyMemberDiffers)
{
    typedef bd::BDMarkDef Value;
    ExpectEachToDiffer(
        Value{90000, 2}, [](Value& value) { value.time += bd::TimePosition{1} << 32; },
        [](Value& value) { value.chpNo = 3; });
}

TEST(BDMarkDef, HasItsFieldsInOrder)
{
    EXPECT_TRUE((Is<decltype(bd::BDMarkDef::time), bd::TimePosition>));
    EXPECT_TRUE((Is<decltype(bd::BDMarkDef::chpNo), bd::UInt16>));

    EXPECT_EQ(0u, offsetof(bd::BDMarkDef, time));
    EXPECT_EQ(8u, offsetof(bd::BDMarkDef, chpNo));
    // The padding after the chapter depends on how the target aligns 64-bit members.
    EXPECT_EQ(8u + alignof(bd::BDMarkDef), sizeof(bd::BDMarkDef));
}

TEST(DataBlockDef, HasItsFieldsInOrder)
{
    EXPECT_TRUE((Is<decltype(bd::DataBlockDef::pData), bd::UInt8*>));
    EXPECT_TRUE((Is<decltype(bd::DataBlockDef::size), bd::UInt32>));

    EXPECT_EQ(0u, offsetof(bd::DataBlockDef, pData));
    EXPECT_EQ(sizeof(void*), offsetof(bd::DataBlockDef, size));
    EXPECT_EQ(2 * sizeof(void*), sizeof(bd::DataBlockDef));
}

TEST(DataBlockDef, IsEqualWhenAddressAndSizeAre)
{
    bd::UInt8 bytes[2] = {};
    ExpectEqual(bd::DataBlockDef{bytes, 2}, bd::DataBlockDef{bytes, 2});
    ExpectEqual(bd::DataBlockDef{nullptr, 0}, bd::DataBlockDef{nullptr, 0});
}

TEST(DataBlockDef, DiffersWhenAnyMemberDiffers)
{
    typedef bd::DataBlockDef Value;
    bd::UInt8 bytes[2] = {};
    ExpectEachToDiffer(
        Value{bytes, 1}, [&](Value& value) { value.pData = bytes + 1; },
        [](Value& value) { value.size = 2; });
}

TEST(DataBlockDef, DiffersFromABlockOfEqualBytesElsewhere)
{
    bd::UInt8 bytes[2] = {7, 7};

    EXPECT_TRUE((bd::DataBlockDef{bytes, 1} != bd::DataBlockDef{bytes + 1, 1}));
}

TEST(ValueStructures, AreCopiedAsBytes)
{
    EXPECT_TRUE(std::is_trivially_copyable_v<bd::AudioInfoType>);
    EXPECT_TRUE(std::is_trivially_copyable_v<bd::ZoomRectangleDef>);
    EXPECT_TRUE(std::is_trivially_copyable_v<bd::ZOOM_PARAM_Def>);
    EXPECT_TRUE(std::is_trivially_copyable_v<bd::Trigger>);
    EXPECT_TRUE(std::is_trivially_copyable_v<bd::BDMarkDef>);
    EXPECT_TRUE(std::is_trivially_copyable_v<bd::DataBlockDef>);
    EXPECT_TRUE(std::is_trivially_copyable_v<bd::PlayMode>);
}

TEST(PlayMode, IsForwardAtNormalSpeedByDefault)
{
    const bd::PlayMode mode;

    EXPECT_EQ(bd::PlayDirectionForward, mode.Direction());
    EXPECT_EQ(bd::PlaySpeedNormal, mode.Speed());
}

TEST(PlayMode, HoldsItsDirectionAndSpeed)
{
    const bd::PlayMode mode(bd::PlayDirectionBackward, bd::PlaySpeedFast3);

    EXPECT_EQ(bd::PlayDirectionBackward, mode.Direction());
    EXPECT_EQ(bd::PlaySpeedFast3, mode.Speed());
}

TEST(PlayMode, CopyHoldsTheSame)
{
    bd::PlayMode mode(bd::PlayDirectionBackward, bd::PlaySpeedSlow2);
    const bd::PlayMode copy(mode);
    mode = bd::PlayMode();

    EXPECT_EQ(bd::PlayDirectionBackward, copy.Direction());
    EXPECT_EQ(bd::PlaySpeedSlow2, copy.Speed());
}

TEST(PlayMode, IsEqualWhenDirectionAndSpeedAre)
{
    const bd::PlayMode mode(bd::PlayDirectionBackward, bd::PlaySpeedFast1);

    EXPECT_TRUE(mode == bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedFast1));
    EXPECT_FALSE(mode != bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedFast1));
}

TEST(PlayMode, DiffersWhenOnlyTheDirectionDiffers)
{
    const bd::PlayMode mode(bd::PlayDirectionBackward, bd::PlaySpeedFast1);

    EXPECT_FALSE(mode == bd::PlayMode(bd::PlayDirectionForward, bd::PlaySpeedFast1));
    EXPECT_TRUE(mode != bd::PlayMode(bd::PlayDirectionForward, bd::PlaySpeedFast1));
}

TEST(PlayMode, DiffersWhenOnlyTheSpeedDiffers)
{
    const bd::PlayMode mode(bd::PlayDirectionBackward, bd::PlaySpeedFast1);

    EXPECT_FALSE(mode == bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedFast2));
    EXPECT_TRUE(mode != bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedFast2));
}
