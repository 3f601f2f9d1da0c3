#include <gtest/gtest.h>

#include "disc/bytereader.h"
#include "disc/codes.h"

namespace deskplayer
{

namespace
{

TEST(Codes, GiveTheKindOfEveryCodingType)
{
    for (const std::uint8_t codingType : Bytes{0x01, 0x02, 0x1B, 0x20, 0x24, 0xEA}) {
        EXPECT_EQ(KindOfStream(codingType), StreamKindVideo) << unsigned(codingType);
    }
    for (const std::uint8_t codingType :
         Bytes{0x03, 0x04, 0x80, 0x81, 0x82, 0x83, 0x84, 0x85, 0x86, 0xA1, 0xA2}) {
        EXPECT_EQ(KindOfStream(codingType), StreamKindAudio) << unsigned(codingType);
    }
    for (const std::uint8_t codingType : Bytes{0x90, 0x91}) {
        EXPECT_EQ(KindOfStream(codingType), StreamKindGraphics) << unsigned(codingType);
    }
    EXPECT_EQ(KindOfStream(0x92), StreamKindTextSubtitle);
    EXPECT_EQ(KindOfStream(0x00), StreamKindUnknown);
    EXPECT_EQ(KindOfStream(0xFF), StreamKindUnknown);
}

TEST(Codes, HaveNames)
{
    EXPECT_EQ(CodingTypeName(0x24), "H.265 video");
    EXPECT_EQ(CodingTypeName(0x83), "TrueHD audio");
    EXPECT_EQ(VideoFormatName(4), "1080i");
    EXPECT_EQ(FrameRateName(1), "23.976 Hz");
    EXPECT_EQ(AspectRatioName(2), "4:3");
    EXPECT_EQ(DynamicRangeName(0), "standard");
    EXPECT_EQ(ColourSpaceName(2), "BT.2020");
    EXPECT_EQ(AudioPresentationName(3), "stereo");
    EXPECT_EQ(SampleRateName(5), "192 kHz");
    EXPECT_EQ(CharacterCodeName(1), "UTF-8");
    EXPECT_EQ(SubPathTypeName(7), "picture-in-picture of the same clip");
}

TEST(Codes, AreNamedByNumberIfReserved)
{
    EXPECT_EQ(CodingTypeName(255), "reserved (255)");
    EXPECT_EQ(FrameRateName(5), "reserved (5)");
}

TEST(LanguageName, IsEnglish)
{
    EXPECT_EQ(LanguageName("deu"), "German");
    EXPECT_EQ(LanguageName("ger"), "German");
}

TEST(LanguageName, IsThePrintableCodeOfAnUncommonLanguage)
{
    EXPECT_EQ(LanguageName("nav"), "nav");
    EXPECT_EQ(LanguageName("\x1B[2"), "\\x1B[2");
}

TEST(LanguageName, IsNoLanguageForAnEmptyCode)
{
    EXPECT_EQ(LanguageName(""), "no language");
}

} // namespace

} // namespace deskplayer
