#include <vector>

#include "eventtest.h"
#include "testkit/describe.h"

namespace
{

typedef Context::Stream Stream;

void HoldsStreams(Context& context)
{
    context.audio = Stream{2, 5};
    context.video = Stream{3, 6};
    context.ig = Stream{4, 7};
    context.angleNumber = 255;
    context.angleCount = 9;
    context.currentTextSubtitleStyleNumber = 254;
    context.numberOfTextSubtitleStyles = 255;
}

void Writes65535And255(Context& context)
{
    context.audio = context.video = context.ig = Stream{65535, 255};
}

void LeavesStreams(Context& context)
{
    HoldsStreams(context);
    context.untouched = {"GetAudioInfo", "GetVideoInfo", "GetIgInfo", "GetAngleInfo"};
}

const Scenario plainScenarios[] = {
    {"AudioInfo", New<bdmv::AudioInfoEvent>(), HoldsStreams,
     Queried("GetAudioInfo(0, 0) -> 2, 5") + Logged("Sending AudioInfo - audioNr: 2") +
         Fired("AudioInfo(2)")},
    {"AudioInfoOf16Bits", New<bdmv::AudioInfoEvent>(), Writes65535And255,
     Queried("GetAudioInfo(0, 0) -> 65535, 255") + Logged("Sending AudioInfo - audioNr: 65535") +
         Fired("AudioInfo(65535)")},
    {"AudioInfoUntouched", New<bdmv::AudioInfoEvent>(), LeavesStreams,
     Queried("GetAudioInfo(0, 0) -> untouched") + Logged("Sending AudioInfo - audioNr: 0") +
         Fired("AudioInfo(0)")},

    {"VideoInfo", New<bdmv::VideoInfoEvent>(), HoldsStreams,
     Queried("GetVideoInfo(0, 0) -> 3, 6") + Logged("Sending VideoInfo - videoNr: 3") +
         Fired("VideoInfo(3)")},
    {"VideoInfoOf16Bits", New<bdmv::VideoInfoEvent>(), Writes65535And255,
     Queried("GetVideoInfo(0, 0) -> 65535, 255") + Logged("Sending VideoInfo - videoNr: 65535") +
         Fired("VideoInfo(65535)")},
    {"VideoInfoUntouched", New<bdmv::VideoInfoEvent>(), LeavesStreams,
     Queried("GetVideoInfo(0, 0) -> untouched") + Logged("Sending VideoInfo - videoNr: 0") +
         Fired("VideoInfo(0)")},

    {"InteractiveGraphicsInfo", New<bdmv::InteractiveGraphicsInfoEvent>(), HoldsStreams,
     Queried("GetIgInfo(0, 0) -> 4, 7") + Logged("Sending InteractiveGraphicsInfo - igNr: 4") +
         Fired("InteractiveGraphicsInfo(4)")},
    {"InteractiveGraphicsInfoOf16Bits", New<bdmv::InteractiveGraphicsInfoEvent>(),
     Writes65535And255,
     Queried("GetIgInfo(0, 0) -> 65535, 255") +
         Logged("Sending InteractiveGraphicsInfo - igNr: 65535") +
         Fired("InteractiveGraphicsInfo(65535)")},
    {"InteractiveGraphicsInfoUntouched", New<bdmv::InteractiveGraphicsInfoEvent>(), LeavesStreams,
     Queried("GetIgInfo(0, 0) -> untouched") + Logged("Sending InteractiveGraphicsInfo - igNr: 0") +
         Fired("InteractiveGraphicsInfo(0)")},

    {"AngleInfo", New<bdmv::AngleInfoEvent>(), HoldsStreams,
     Queried("GetAngleInfo(0, 0) -> 255, 9") + Logged("Sending AngleInfo - angleNr: 255") +
         Fired("AngleInfo(255)")},
    {"AngleInfoUntouched", New<bdmv::AngleInfoEvent>(), LeavesStreams,
     Queried("GetAngleInfo(0, 0) -> untouched") + Logged("Sending AngleInfo - angleNr: 0") +
         Fired("AngleInfo(0)")},

    {"TextSubtitleStyleInfo", New<bdmv::TextSubtitleStyleInfoEvent>(), HoldsStreams,
     Queried("GetCurrentTextSubtitleStyleNumber() -> 254") +
         Logged("Sending TextSubtitleStyleInfo - styleNumber: 254") +
         Fired("TextSubtitleStyleInfo(254)")},
    {"TextSubtitleStylesAvailable", New<bdmv::TextSubtitleStylesAvailableEvent>(), HoldsStreams,
     Queried("GetNumberOfTextSubtitleStyles() -> 255") +
         Logged("Sending TextSubtitleStylesAvailable - numberOfStyles: 255") +
         Fired("TextSubtitleStylesAvailable(255)")},
};

INSTANTIATE_TEST_SUITE_P(PlainStreams, EventScenario, testing::ValuesIn(plainScenarios),
                         EventScenario::Name);

/** A subtitle selection that differs between the two queries for it. */
std::function<void(Context&)> Subtitles(bdmv::INavError::ErrCode result, bool shown, Stream stream)
{
    return [=](Context& context) {
        context.rPgTextSt = Stream{11, 12};
        context.rPgTextStResult = result;
        context.pgTextSt = stream;
        context.pgTextStDisplay = shown;
    };
}

std::string FirstSubtitleQuery(const std::string& result)
{
    return Queried("rGetPgTextStInfo(0, 0) -> 11, 12") +
           Queried("rGetPgTextStInfo returned " + result);
}

const Scenario presentationGraphicsScenarios[] = {
    {"Shown", New<bdmv::PresentationGraphicsInfoEvent>(),
     Subtitles(bdmv::INavError::ErrOk, true, {4, 255}),
     FirstSubtitleQuery("ErrOk") + Queried("GetPgTextStInfo(11, 12) -> 4, 255") +
         Queried("GetPgTextStDisplay() -> true") +
         Logged("Sending PresentationGraphicsInfo - pgTextStNr: 4, available: TRUE") +
         Fired("PresentationGraphicsInfo(4, true)")},
    {"ShownWithOneStream", New<bdmv::PresentationGraphicsInfoEvent>(),
     Subtitles(bdmv::INavError::ErrOk, true, {65535, 1}),
     FirstSubtitleQuery("ErrOk") + Queried("GetPgTextStInfo(11, 12) -> 65535, 1") +
         Queried("GetPgTextStDisplay() -> true") +
         Logged("Sending PresentationGraphicsInfo - pgTextStNr: 65535, available: TRUE") +
         Fired("PresentationGraphicsInfo(65535, true)")},
    {"ShownWithoutStreams", New<bdmv::PresentationGraphicsInfoEvent>(),
     Subtitles(bdmv::INavError::ErrOk, true, {4, 0}),
     FirstSubtitleQuery("ErrOk") + Queried("GetPgTextStInfo(11, 12) -> 4, 0") +
         Queried("GetPgTextStDisplay() -> true") +
         Logged("Sending PresentationGraphicsInfo - pgTextStNr: 4, available: FALSE") +
         Fired("PresentationGraphicsInfo(4, false)")},
    {"Hidden", New<bdmv::PresentationGraphicsInfoEvent>(),
     Subtitles(bdmv::INavError::ErrOk, false, {4, 3}),
     FirstSubtitleQuery("ErrOk") + Queried("GetPgTextStInfo(11, 12) -> 4, 3") +
         Queried("GetPgTextStDisplay() -> false") +
         Logged("Sending PresentationGraphicsInfo - pgTextStNr: 4, available: FALSE") +
         Fired("PresentationGraphicsInfo(4, false)")},
    {"HiddenWithoutStreams", New<bdmv::PresentationGraphicsInfoEvent>(),
     Subtitles(bdmv::INavError::ErrOk, false, {4, 0}),
     FirstSubtitleQuery("ErrOk") + Queried("GetPgTextStInfo(11, 12) -> 4, 0") +
         Queried("GetPgTextStDisplay() -> false") +
         Logged("Sending PresentationGraphicsInfo - pgTextStNr: 4, available: FALSE") +
         Fired("PresentationGraphicsInfo(4, false)")},
    {"NotAllowed", New<bdmv::PresentationGraphicsInfoEvent>(),
     Subtitles(bdmv::INavError::ErrNotAllowed, true, {4, 3}), FirstSubtitleQuery("ErrNotAllowed")},
    {"UntouchedByTheSecondQuery", New<bdmv::PresentationGraphicsInfoEvent>(),
     [](Context& context) {
         Subtitles(bdmv::INavError::ErrOk, true, {4, 3})(context);
         context.untouched = {"GetPgTextStInfo"};
     },
     FirstSubtitleQuery("ErrOk") + Queried("GetPgTextStInfo(11, 12) -> untouched") +
         Queried("GetPgTextStDisplay() -> true") +
         Logged("Sending PresentationGraphicsInfo - pgTextStNr: 11, available: TRUE") +
         Fired("PresentationGraphicsInfo(11, true)")},
    {"Untouched", New<bdmv::PresentationGraphicsInfoEvent>(),
     [](Context& context) {
         Subtitles(bdmv::INavError::ErrOk, true, {4, 3})(context);
         context.untouched = {"rGetPgTextStInfo", "GetPgTextStInfo"};
     },
     Queried("rGetPgTextStInfo(0, 0) -> untouched") + Queried("rGetPgTextStInfo returned ErrOk") +
         Queried("GetPgTextStInfo(0, 0) -> untouched") + Queried("GetPgTextStDisplay() -> true") +
         Logged("Sending PresentationGraphicsInfo - pgTextStNr: 0, available: FALSE") +
         Fired("PresentationGraphicsInfo(0, false)")},
};

INSTANTIATE_TEST_SUITE_P(PresentationGraphicsInfo, EventScenario,
                         testing::ValuesIn(presentationGraphicsScenarios), EventScenario::Name);

/** The picture-in-picture subtitle selection beside the primary one. */
struct PipSubtitle {
    const char* name;
    bool shown;
    bd::UInt8 pgCount;
    bd::UInt8 pipCount;
    bd::StreamNumberDef pipNumber;
    bool available;
};

const PipSubtitle pipSubtitles[] = {
    {"LastOfMore", true, 1, 3, 3, true},
    {"FirstOfMore", true, 1, 3, 1, true},
    {"NumberZero", true, 1, 3, 0, true},
    {"BeyondTheLast", true, 1, 3, 4, false},
    {"AsManyAsPrimary", true, 3, 3, 1, false},
    {"FewerThanPrimary", true, 3, 1, 1, false},
    {"OneMoreThanPrimary", true, 2, 3, 3, true},
    {"NoneAtAll", true, 0, 0, 0, false},
    {"OnlyForPip", true, 0, 1, 1, true},
    {"CountsAbove127", true, 100, 200, 200, true},
    {"PrimaryCountAbove127", true, 200, 100, 1, false},
    {"Most", true, 254, 255, 255, true},
    {"NumberBeyond8Bits", true, 254, 255, 256, false},
    {"NumberAbove32767", true, 1, 3, 65535, false},
    {"Hidden", false, 1, 3, 3, false},
    {"HiddenAndNone", false, 0, 0, 0, false},
};

std::string Flag(bool value)
{
    return value ? "true" : "false";
}

std::vector<Scenario> PipPgTextStInfoScenarios()
{
    std::vector<Scenario> scenarios;
    for (const PipSubtitle& pip : pipSubtitles) {
        const std::string number = std::to_string(pip.pipNumber);
        scenarios.push_back(
            {pip.name, New<bdmv::PipPgTextStInfoEvent>(),
             [&pip](Context& context) {
                 context.pipPgTextSt = Stream{pip.pipNumber, pip.pipCount};
                 context.pgTextSt = Stream{77, pip.pgCount};
                 context.pgTextStDisplay = pip.shown;
             },
             Queried("GetPipPgTextStInfo(0, 0) -> " + number + ", " +
                     std::to_string(pip.pipCount)) +
                 Queried("GetPgTextStInfo(0, 0) -> 77, " + std::to_string(pip.pgCount)) +
                 Queried("GetPgTextStDisplay() -> " + Flag(pip.shown)) +
                 Logged("Sending PipPgTextStInfo - pgTextStNr: " + number + ", avaliable " +
                        (pip.available ? "1" : "0")) +
                 Fired("PipPgTextStInfo(" + number + ", " + Flag(pip.available) + ")")});
    }
    scenarios.push_back({"PrimaryUntouched", New<bdmv::PipPgTextStInfoEvent>(),
                         [](Context& context) {
                             context.pipPgTextSt = Stream{1, 1};
                             context.pgTextSt = Stream{77, 9};
                             context.pgTextStDisplay = true;
                             context.untouched = {"GetPgTextStInfo"};
                         },
                         Queried("GetPipPgTextStInfo(0, 0) -> 1, 1") +
                             Queried("GetPgTextStInfo(0, 0) -> untouched") +
                             Queried("GetPgTextStDisplay() -> true") +
                             Logged("Sending PipPgTextStInfo - pgTextStNr: 1, avaliable 1") +
                             Fired("PipPgTextStInfo(1, true)")});
    scenarios.push_back({"Untouched", New<bdmv::PipPgTextStInfoEvent>(),
                         [](Context& context) {
                             context.pgTextStDisplay = true;
                             context.untouched = {"GetPipPgTextStInfo", "GetPgTextStInfo"};
                         },
                         Queried("GetPipPgTextStInfo(0, 0) -> untouched") +
                             Queried("GetPgTextStInfo(0, 0) -> untouched") +
                             Queried("GetPgTextStDisplay() -> true") +
                             Logged("Sending PipPgTextStInfo - pgTextStNr: 0, avaliable 0") +
                             Fired("PipPgTextStInfo(0, false)")});
    return scenarios;
}

INSTANTIATE_TEST_SUITE_P(PipPgTextStInfo, EventScenario,
                         testing::ValuesIn(PipPgTextStInfoScenarios()), EventScenario::Name);

const Scenario secondaryScenarios[] = {
    {"AudioShown", New<bdmv::SecondaryAudioInfoEvent>(),
     [](Context& context) {
         context.secondaryAudio = Stream{65535, 255};
         context.secondaryAudioDisplay = true;
     },
     Queried("GetSecondaryAudioInfo(0, 0) -> 65535, 255") +
         Logged("Sending SecondaryAudioInfo - audioNr: 65535") +
         Fired("SecondaryAudioInfo(65535)") + Queried("GetSecondaryAudioDisplay() -> true") +
         Logged("Sending ((SecondaryAudioDisplay)) - audioNr 65535, numOfAudios 255, shown: "
                "TRUE") +
         Fired("SecondaryAudioDisplay(65535, true)")},
    {"AudioHidden", New<bdmv::SecondaryAudioInfoEvent>(),
     [](Context& context) {
         context.secondaryAudio = Stream{2, 3};
     },
     Queried("GetSecondaryAudioInfo(0, 0) -> 2, 3") +
         Logged("Sending SecondaryAudioInfo - audioNr: 2") + Fired("SecondaryAudioInfo(2)") +
         Queried("GetSecondaryAudioDisplay() -> false") +
         Logged("Sending ((SecondaryAudioDisplay)) - audioNr 2, numOfAudios 3, shown: FALSE") +
         Fired("SecondaryAudioDisplay(2, false)")},
    {"AudioUntouched", New<bdmv::SecondaryAudioInfoEvent>(),
     [](Context& context) {
         context.secondaryAudio = Stream{2, 3};
         context.secondaryAudioDisplay = true;
         context.untouched = {"GetSecondaryAudioInfo"};
     },
     Queried("GetSecondaryAudioInfo(0, 0) -> untouched") +
         Logged("Sending SecondaryAudioInfo - audioNr: 0") + Fired("SecondaryAudioInfo(0)") +
         Queried("GetSecondaryAudioDisplay() -> true") +
         Logged("Sending ((SecondaryAudioDisplay)) - audioNr 0, numOfAudios 0, shown: TRUE") +
         Fired("SecondaryAudioDisplay(0, true)")},

    {"VideoShownAsync", New<bdmv::SecondaryVideoInfoEvent>(),
     [](Context& context) {
         context.secondaryVideo = Stream{65535, 255};
         context.secondaryVideoAsync = true;
         context.secondaryVideoDisplay = true;
     },
     Queried("GetSecondaryVideoInfo(0, 0, false) -> 65535, 255, true") +
         Logged("Sending SecondaryVideoInfo - videoNr: 65535") +
         Fired("SecondaryVideoInfo(65535)") + Queried("GetSecondaryVideoDisplay() -> true") +
         Logged("Sending ((SecondaryVideoDisplay)) - video Nr 65535, numofVideos 255, async 1, "
                "shown: TRUE") +
         Fired("SecondaryVideoDisplay(65535, true)")},
    {"VideoShown", New<bdmv::SecondaryVideoInfoEvent>(),
     [](Context& context) {
         context.secondaryVideo = Stream{2, 3};
         context.secondaryVideoDisplay = true;
     },
     Queried("GetSecondaryVideoInfo(0, 0, false) -> 2, 3, false") +
         Logged("Sending SecondaryVideoInfo - videoNr: 2") + Fired("SecondaryVideoInfo(2)") +
         Queried("GetSecondaryVideoDisplay() -> true") +
         Logged("Sending ((SecondaryVideoDisplay)) - video Nr 2, numofVideos 3, async 0, shown: "
                "TRUE") +
         Fired("SecondaryVideoDisplay(2, true)")},
    {"VideoHiddenAsync", New<bdmv::SecondaryVideoInfoEvent>(),
     [](Context& context) {
         context.secondaryVideo = Stream{2, 3};
         context.secondaryVideoAsync = true;
     },
     Queried("GetSecondaryVideoInfo(0, 0, false) -> 2, 3, true") +
         Logged("Sending SecondaryVideoInfo - videoNr: 2") + Fired("SecondaryVideoInfo(2)") +
         Queried("GetSecondaryVideoDisplay() -> false") +
         Logged("Sending ((SecondaryVideoDisplay)) - video Nr 2, numofVideos 3, async 1, shown: "
                "FALSE") +
         Fired("SecondaryVideoDisplay(2, false)")},
    {"VideoUntouched", New<bdmv::SecondaryVideoInfoEvent>(),
     [](Context& context) {
         context.secondaryVideo = Stream{2, 3};
         context.secondaryVideoAsync = true;
         context.untouched = {"GetSecondaryVideoInfo"};
     },
     Queried("GetSecondaryVideoInfo(0, 0, false) -> untouched") +
         Logged("Sending SecondaryVideoInfo - videoNr: 0") + Fired("SecondaryVideoInfo(0)") +
         Queried("GetSecondaryVideoDisplay() -> false") +
         Logged("Sending ((SecondaryVideoDisplay)) - video Nr 0, numofVideos 0, async 0, shown: "
                "FALSE") +
         Fired("SecondaryVideoDisplay(0, false)")},
};

INSTANTIATE_TEST_SUITE_P(SecondaryStreams, EventScenario, testing::ValuesIn(secondaryScenarios),
                         EventScenario::Name);

bd::AudioInfoType AudioAttributes()
{
    bd::AudioInfoType info;
    info.format = bd::AudioFormatEac3;
    info.sampleRate = bd::AudioSampleRate_192000;
    info.bitsPerSampling = bd::AudioBitsPerSamplingType24;
    info.channels = bd::AudioChannelTypeOthers;
    info.pid = 65535;
    info.u4AudChannelLayout = 0xFFFFFFFE;
    return info;
}

void HoldsOtherAudio(Context& context)
{
    context.audio = context.secondaryAudio = Stream{9, 9};
}

const Scenario audioInfoChangedScenarios[] = {
    {"Primary", New<bdmv::AudioInfoChangedEvent>(true, AudioAttributes()), HoldsOtherAudio,
     Logged("Sending AudioChannelsChanged") +
         Fired("AudioInfoChanged(true, (AudioFormatEac3, AudioSampleRate_192000, "
               "AudioBitsPerSamplingType24, AudioChannelTypeOthers, 65535, 4294967294))")},
    {"Secondary", New<bdmv::AudioInfoChangedEvent>(false, AudioAttributes()), HoldsOtherAudio,
     Logged("Sending AudioChannelsChanged") +
         Fired("AudioInfoChanged(false, (AudioFormatEac3, AudioSampleRate_192000, "
               "AudioBitsPerSamplingType24, AudioChannelTypeOthers, 65535, 4294967294))")},
    {"Unknown", New<bdmv::AudioInfoChangedEvent>(true, bd::AudioInfoType()), HoldsOtherAudio,
     Logged("Sending AudioChannelsChanged") +
         Fired("AudioInfoChanged(true, (AudioFormatUnknown, AudioSampleRateUnknown, "
               "AudioBitsPerSamplingTypeInvalid, AudioChannelTypeUnknown, 0, 0))")},
};

INSTANTIATE_TEST_SUITE_P(AudioInfoChanged, EventScenario,
                         testing::ValuesIn(audioInfoChangedScenarios), EventScenario::Name);

class StreamInfoEvents : public EventTest
{
};

TEST_F(StreamInfoEvents, PresentationGraphicsInfoContinuesAfterEveryResultButNotAllowed)
{
    for (const int result : {0, 1, 2, 3, 4, 5, 6, 8, -1}) {
        Subtitles(static_cast<bdmv::INavError::ErrCode>(result), true, {4, 3})(context);

        EXPECT_EQ(Dispatch<bdmv::PresentationGraphicsInfoEvent>(),
                  FirstSubtitleQuery(bdmvtest::Describe(context.rPgTextStResult)) +
                      Queried("GetPgTextStInfo(11, 12) -> 4, 3") +
                      Queried("GetPgTextStDisplay() -> true") +
                      Logged("Sending PresentationGraphicsInfo - pgTextStNr: 4, available: TRUE") +
                      Fired("PresentationGraphicsInfo(4, true)"));
    }
}

TEST_F(StreamInfoEvents, SecondaryAudioInfoQueriesTheDisplayAfterTheLastListenerReceivesTheStream)
{
    context.secondaryAudio = Stream{2, 3};
    c.onCallback = [this](const std::string&) {
        context.secondaryAudio = Stream{8, 9};
        context.secondaryAudioDisplay = true;
    };

    EXPECT_EQ(Dispatch<bdmv::SecondaryAudioInfoEvent>(),
              Queried("GetSecondaryAudioInfo(0, 0) -> 2, 3") +
                  Logged("Sending SecondaryAudioInfo - audioNr: 2") +
                  Fired("SecondaryAudioInfo(2)") + Queried("GetSecondaryAudioDisplay() -> true") +
                  Logged("Sending ((SecondaryAudioDisplay)) - audioNr 2, numOfAudios 3, shown: "
                         "TRUE") +
                  Fired("SecondaryAudioDisplay(2, true)"));
}

TEST_F(StreamInfoEvents, SecondaryVideoInfoQueriesTheDisplayAfterTheLastListenerReceivesTheStream)
{
    context.secondaryVideo = Stream{2, 3};
    c.onCallback = [this](const std::string&) {
        context.secondaryVideo = Stream{8, 9};
        context.secondaryVideoAsync = true;
        context.secondaryVideoDisplay = true;
    };

    EXPECT_EQ(Dispatch<bdmv::SecondaryVideoInfoEvent>(),
              Queried("GetSecondaryVideoInfo(0, 0, false) -> 2, 3, false") +
                  Logged("Sending SecondaryVideoInfo - videoNr: 2") +
                  Fired("SecondaryVideoInfo(2)") + Queried("GetSecondaryVideoDisplay() -> true") +
                  Logged("Sending ((SecondaryVideoDisplay)) - video Nr 2, numofVideos 3, async 0, "
                         "shown: TRUE") +
                  Fired("SecondaryVideoDisplay(2, true)"));
}

TEST_F(StreamInfoEvents, SecondaryStreamsAllowListChangesBetweenTheirCallbacks)
{
    context.onQuery = [this](const std::string& operation) {
        if (operation == "GetSecondaryAudioDisplay") {
            listeners.RemoveListener(&b);
        } else if (operation == "GetSecondaryVideoDisplay") {
            listeners.AddListener(&b);
        }
    };

    EXPECT_EQ(Dispatch<bdmv::SecondaryAudioInfoEvent>(),
              Queried("GetSecondaryAudioInfo(0, 0) -> 0, 0") +
                  Logged("Sending SecondaryAudioInfo - audioNr: 0") +
                  Fired("SecondaryAudioInfo(0)") + Queried("GetSecondaryAudioDisplay() -> false") +
                  Logged("Sending ((SecondaryAudioDisplay)) - audioNr 0, numOfAudios 0, shown: "
                         "FALSE") +
                  "A.SecondaryAudioDisplay(0, false)\nC.SecondaryAudioDisplay(0, false)\n");
    EXPECT_EQ(Dispatch<bdmv::SecondaryVideoInfoEvent>(),
              Queried("GetSecondaryVideoInfo(0, 0, false) -> 0, 0, false") +
                  Logged("Sending SecondaryVideoInfo - videoNr: 0") +
                  "A.SecondaryVideoInfo(0)\nC.SecondaryVideoInfo(0)\n" +
                  Queried("GetSecondaryVideoDisplay() -> false") +
                  Logged("Sending ((SecondaryVideoDisplay)) - video Nr 0, numofVideos 0, async 0, "
                         "shown: FALSE") +
                  "A.SecondaryVideoDisplay(0, false)\n"
                  "C.SecondaryVideoDisplay(0, false)\n"
                  "B.SecondaryVideoDisplay(0, false)\n");
}

TEST_F(StreamInfoEvents, AudioInfoChangedKeepsItsOwnCopyOfTheAttributes)
{
    bd::AudioInfoType info = AudioAttributes();
    bdmv::AudioInfoChangedEvent event(context, true, info);
    info = bd::AudioInfoType();

    event.Dispatch(listeners);

    EXPECT_EQ(journal.Take(),
              Logged("Sending AudioChannelsChanged") +
                  Fired("AudioInfoChanged(true, (AudioFormatEac3, AudioSampleRate_192000, "
                        "AudioBitsPerSamplingType24, AudioChannelTypeOthers, 65535, "
                        "4294967294))"));
}

} // namespace
