// The log switch: its configuration texts, their meaning, and the refusal of unreadable ones.
#include <array>
#include <string>
#include <utility>
#include <vector>

#include <gtest/gtest.h>

#include "kevro/kevro_log.h"
#include "kevro_linux.h"

extern "C" bool ConfigureFromC(const char* text);

namespace
{

using Name = std::pair<KEVRO_UInt32, const char*>;

const std::vector<Name> ComponentNames = {
    {32, "BdavArchiver"},
    {33, "BdavDiscManager"},
    {34, "BdavEditor"},
    {35, "BdavInformation"},
    {36, "BdavNavigator"},
    {37, "BdavReplicator"},
    {38, "BdavSystem"},
    {39, "BdavFactory"},
    {40, "BdavDatabase"},
    {41, "Common"},
    {43, "FileManager"},
    {44, "ImageProcessor"},
    {45, "Scheduler"},
    {46, "Streamer"},
    {47, "Decoder"},
    {48, "StreamGateway"},
    {49, "StreamParser"},
    {50, "IgDecoder"},
    {51, "PgDecoder"},
    {52, "TsDecoder"},
    {53, "Reader"},
    {54, "Test"},
    {55, "BdmvDiscManager"},
    {56, "BdmvInformation"},
    {57, "BdmvNavigator"},
    {58, "BdmvSystem"},
    {59, "BdmvFactory"},
    {60, "BdmvDatabase"},
    {61, "BdmvUserEventManager"},
    {62, "BdmvHdmv"},
    {63, "BdmvCommandProcessor"},
    {64, "BdmvModuleManager"},
    {65, "BdmvCache"},
    {66, "BdmvJavaModule"},
    {67, "JpiConnector"},
    {68, "JbiConnector"},
    {69, "BdioSystem"},
    {70, "BdioDiscRecognition"},
    {71, "BdioVfs"},
    {72, "BdSystem"},
    {73, "Bdj"},
    {74, "BdmvBdjAdapter"},
    {75, "Jpi"},
    {77, "JbiGraphics"},
    {78, "JbiIo"},
    {79, "JbiMedia"},
    {80, "JbiMisc"},
    {81, "JbiOsa"},
    {82, "JbiTi"},
};

const std::vector<Name> LevelNames = {
    {0, "Method"}, {1, "Interface"}, {2, "Exception"}, {3, "Warning"}, {4, "State"},
    {5, "Event"},  {6, "Info"},      {7, "Free1"},     {8, "Free2"},   {9, "Free3"},
    {10, "Free4"}, {11, "Default"},  {12, "Runtime"},  {13, "Fatal"},
};

constexpr KEVRO_UInt32 Exception = 2;
constexpr KEVRO_UInt32 Warning = 3;
constexpr KEVRO_UInt32 Event = 5;
constexpr KEVRO_UInt32 Info = 6;
constexpr KEVRO_UInt32 Fatal = 13;
constexpr KEVRO_UInt32 LevelCount = 14;

constexpr KEVRO_UInt32 Common = 41;
constexpr KEVRO_UInt32 BdmvNavigator = 57;
constexpr KEVRO_UInt32 Jpi = 75;

const std::vector<KEVRO_UInt32> NamelessComponents = {0,  1,  31,         42,        76,
                                                      83, 84, 0x7FFFFFFF, 0xFFFFFFFF};

bool IsOn(KEVRO_UInt32 component, KEVRO_UInt32 level, KEVRO_Bool hiFreq = 0)
{
    return KEVRO_Log_IsEnabled(component, static_cast<KEVRO_Int32>(level), hiFreq) != 0;
}

/** The levels of a component that are on: bit n for level n, bit n + 16 for high frequency. */
KEVRO_UInt32 LevelsOf(KEVRO_UInt32 component)
{
    KEVRO_UInt32 levels = 0;
    for (KEVRO_UInt32 level = 0; level < LevelCount; ++level) {
        levels |= KEVRO_UInt32{IsOn(component, level, 0)} << level;
        levels |= KEVRO_UInt32{IsOn(component, level, 1)} << (level + 16);
    }
    return levels;
}

constexpr KEVRO_UInt32 Bit(KEVRO_UInt32 level)
{
    return KEVRO_UInt32{1} << level;
}
constexpr KEVRO_UInt32 DefaultLevels = Bit(Exception) | Bit(Warning) | Bit(Fatal);
constexpr KEVRO_UInt32 AllLevels = 0x3FFF;

std::string Configure(const std::string& text)
{
    std::array<char, 256> message;
    message.fill('#');
    const bool taken = KEVRO_Log_Configure(text.c_str(), message.data(), message.size());
    EXPECT_EQ(taken, message[0] == '\0') << text;
    return message.data();
}

KEVRO_UInt32 g_LevelsBeforeConstructors = 0;

__attribute__((constructor(101))) void LookBeforeConstructors()
{
    g_LevelsBeforeConstructors = LevelsOf(BdmvNavigator);
}

class LogSwitch : public testing::Test
{
protected:
    LogSwitch() { Configure("*=Exception|Warning|Fatal"); }
    ~LogSwitch() override { Configure("*=Exception|Warning|Fatal"); }
};

TEST(LogSwitchAtStart, IsOnForExceptionWarningAndFatalOfEveryComponent)
{
    for (KEVRO_UInt32 component = 0; component < 100; ++component) {
        EXPECT_EQ(LevelsOf(component), DefaultLevels) << component;
    }
}

TEST(LogSwitchAtStart, HasItsDefaultBeforeConstructorsRun)
{
    EXPECT_EQ(g_LevelsBeforeConstructors, DefaultLevels);
}

TEST_F(LogSwitch, SwitchesEachLevelOfEachComponentSeparately)
{
    for (const Name& component : ComponentNames) {
        for (const Name& level : LevelNames) {
            const std::string text = std::string(component.second) + "=" + level.second;
            const KEVRO_UInt32 bit = Bit(level.first);

            ASSERT_EQ(Configure(text), "");
            for (KEVRO_UInt32 other = 30; other < 90; ++other) {
                ASSERT_EQ(LevelsOf(other), other == component.first ? bit : 0) << text;
            }
            ASSERT_EQ(Configure(text + "+hifreq"), "");
            for (KEVRO_UInt32 other = 30; other < 90; ++other) {
                ASSERT_EQ(LevelsOf(other), other == component.first ? bit | bit << 16 : 0) << text;
            }
        }
    }
}

TEST_F(LogSwitch, TakesAnyNonZeroValueForHighFrequency)
{
    Configure("BdmvNavigator=Event+hifreq,Jpi=Event");
    for (const KEVRO_Bool hiFreq : {1, 2, -1, 0x100}) {
        EXPECT_TRUE(IsOn(BdmvNavigator, Event, hiFreq)) << hiFreq;
        EXPECT_FALSE(IsOn(Jpi, Event, hiFreq)) << hiFreq;
    }
}

TEST_F(LogSwitch, GivesHighFrequencyOnlyToTheLevelBeforeIt)
{
    Configure("BdmvNavigator=Event+hifreq|Warning");
    EXPECT_EQ(LevelsOf(BdmvNavigator), Bit(Event) | Bit(Event) << 16 | Bit(Warning));
}

TEST_F(LogSwitch, TakesAStarForAllLevels)
{
    Configure("Jpi=*,Common=*+hifreq");
    EXPECT_EQ(LevelsOf(Jpi), AllLevels);
    EXPECT_EQ(LevelsOf(Common), AllLevels | AllLevels << 16);
}

TEST_F(LogSwitch, AppliesOnlyTheStarToNumbersWithoutAName)
{
    Configure("BdmvNavigator=Event,*=Fatal+hifreq");
    for (const KEVRO_UInt32 component : NamelessComponents) {
        EXPECT_EQ(LevelsOf(component), Bit(Fatal) | Bit(Fatal) << 16) << component;
    }
    Configure("BdmvNavigator=Event");
    for (const KEVRO_UInt32 component : NamelessComponents) {
        EXPECT_EQ(LevelsOf(component), 0U) << component;
    }
}

TEST_F(LogSwitch, IsOffForALevelOutsideTheList)
{
    Configure("*=*+hifreq");
    for (const KEVRO_UInt32 level : {14U, 15U, 16U, 17U, 31U, 32U, 37U, 0xFFFFFFFFU}) {
        EXPECT_FALSE(IsOn(BdmvNavigator, level, 0)) << level;
        EXPECT_FALSE(IsOn(BdmvNavigator, level, 1)) << level;
    }
}

TEST_F(LogSwitch, IsOffForEverythingAfterAnEmptyText)
{
    for (const char* text : {"", " \t "}) {
        Configure("*=*+hifreq");
        EXPECT_EQ(Configure(text), "");
        for (KEVRO_UInt32 component = 0; component < 100; ++component) {
            EXPECT_EQ(LevelsOf(component), 0U) << component;
        }
    }
}

TEST_F(LogSwitch, AppliesAStarOnlyToComponentsNotInTheText)
{
    for (const char* text : {"*=Fatal,Jpi=Event", "Jpi=Event,*=Fatal"}) {
        Configure(text);
        EXPECT_EQ(LevelsOf(Jpi), Bit(Event)) << text;
        EXPECT_EQ(LevelsOf(BdmvNavigator), Bit(Fatal)) << text;
    }
}

TEST_F(LogSwitch, AddsUpTheEntriesOfAComponent)
{
    Configure("Jpi=Event,*=Fatal,Jpi=Info,*=Warning");
    EXPECT_EQ(LevelsOf(Jpi), Bit(Event) | Bit(Info));
    EXPECT_EQ(LevelsOf(Common), Bit(Fatal) | Bit(Warning));
}

TEST_F(LogSwitch, IgnoresBlanksAroundWords)
{
    EXPECT_EQ(Configure(" Jpi = Event + hifreq | Info ,\t* = Fatal "), "");
    EXPECT_EQ(LevelsOf(Jpi), Bit(Event) | Bit(Event) << 16 | Bit(Info));
    EXPECT_EQ(LevelsOf(Common), Bit(Fatal));
}

TEST_F(LogSwitch, RefusesAnUnreadableTextWithTheWordItsPositionAndWhatWasExpected)
{
    const std::vector<std::pair<const char*, const char*>> refusals = {
        {"Foo=Event", R"("Foo" at character 1: expected a component or *)"},
        {"jpi=Event", R"("jpi" at character 1: expected a component or *; did you mean Jpi?)"},
        {"BdmvNavigtor=Event",
         R"("BdmvNavigtor" at character 1: expected a component or *; did you mean BdmvNavigator?)"},
        {"Jpi=Evnt", R"("Evnt" at character 5: expected a level or *; did you mean Event?)"},
        {"Jpi=Event|Loud", R"("Loud" at character 11: expected a level or *)"},
        {"*=Fatal, Jpi = Loud", R"("Loud" at character 16: expected a level or *)"},
        {"Jpi=HighFrequency", R"("HighFrequency" at character 5: expected a level or *)"},
        {"Jpi=5", R"("5" at character 5: expected a level or *)"},
        {"57=Event", R"("57" at character 1: expected a component or *)"},
        {"Jpi=Event+fast", R"("fast" at character 11: expected hifreq)"},
        {"Jpi=Event+", R"(nothing at character 11: expected hifreq)"},
        {"Jpi=Event+hifreq+hifreq",
         R"("Event+hifreq+hifreq" at character 5: expected at most one + after a level)"},
        {"Jpi", R"("Jpi" at character 1: expected COMPONENT=LEVEL[|LEVEL...])"},
        {"Jpi=Event=Info",
         R"("Jpi=Event=Info" at character 1: expected COMPONENT=LEVEL[|LEVEL...])"},
        {"Jpi=", R"(nothing at character 5: expected a level or *)"},
        {"Jpi=Event|", R"(nothing at character 11: expected a level or *)"},
        {"=Event", R"(nothing at character 1: expected a component or *)"},
        {"Jpi=Event,", R"(nothing at character 11: expected a component or *)"},
        {",", R"(nothing at character 1: expected a component or *)"},
        {"Jpi=Event;Bdj=Info",
         R"("Jpi=Event;Bdj=Info" at character 1: expected COMPONENT=LEVEL[|LEVEL...])"},
        {"\x1B[2J=Event", R"("\x1B[2J" at character 1: expected a component or *)"},
    };
    Configure("Jpi=Event+hifreq,*=Info");
    for (const auto& refusal : refusals) {
        EXPECT_EQ(Configure(refusal.first), refusal.second);
        EXPECT_EQ(LevelsOf(Jpi), Bit(Event) | Bit(Event) << 16) << refusal.first;
        EXPECT_EQ(LevelsOf(Common), Bit(Info)) << refusal.first;
        EXPECT_EQ(LevelsOf(42), Bit(Info)) << refusal.first;
    }
}

TEST_F(LogSwitch, TruncatesTheMessageToFit)
{
    char message[8] = "#######";
    EXPECT_FALSE(KEVRO_Log_Configure("Foo=Event", message, 6));
    EXPECT_STREQ(message, "\"Foo\"");
    EXPECT_EQ(message[6], '#');
}

TEST_F(LogSwitch, NeedsNoBufferForTheMessage)
{
    char untouched = '#';
    EXPECT_FALSE(KEVRO_Log_Configure("Foo=Event", nullptr, 0));
    EXPECT_FALSE(KEVRO_Log_Configure("Foo=Event", nullptr, 100));
    EXPECT_FALSE(KEVRO_Log_Configure("Foo=Event", &untouched, 0));
    EXPECT_EQ(untouched, '#');
    EXPECT_TRUE(KEVRO_Log_Configure("Jpi=Event", nullptr, 0));
}

TEST_F(LogSwitch, RefusesANullText)
{
    char message[64] = "";
    EXPECT_FALSE(KEVRO_Log_Configure(nullptr, message, sizeof(message)));
    EXPECT_STREQ(message, "no text");
    EXPECT_EQ(LevelsOf(Jpi), DefaultLevels);
}

TEST_F(LogSwitch, CanBeConfiguredFromC)
{
    EXPECT_TRUE(ConfigureFromC("Jpi=Event"));
    EXPECT_EQ(LevelsOf(Jpi), Bit(Event));
    EXPECT_FALSE(ConfigureFromC("Jpi"));
}

} // namespace
