#include "session/commands.h"

#include <algorithm>
#include <iterator>

namespace deskplayer
{

namespace
{

typedef const std::vector<std::uint64_t>& Values;

constexpr std::uint64_t SlowSteps = 5;
constexpr std::uint64_t FastSteps = 12;

/** @param steps above normal speed; negative for below it */
bd::PlayMode ModeOf(bd::PlayDirectionDef direction, std::int64_t steps)
{
    return bd::PlayMode(direction,
                        static_cast<bd::PlaySpeedDef>(std::int64_t{bd::PlaySpeedNormal} + steps));
}

Outcome PlayFast(DeskParts& desk, bd::PlayDirectionDef direction, std::uint64_t steps)
{
    if (steps == 0 || steps > FastSteps) {
        return Outcome::Refused("fast speeds are numbered 1 to " + std::to_string(FastSteps));
    }
    return desk.Navigator().SetPlayMode(ModeOf(direction, static_cast<std::int64_t>(steps)));
}

Outcome PlaySlowly(DeskParts& desk, bd::PlayDirectionDef direction, std::uint64_t steps)
{
    if (steps == 0 || steps > SlowSteps) {
        return Outcome::Refused("slow speeds are numbered 1 to " + std::to_string(SlowSteps));
    }
    return desk.Navigator().SetPlayMode(ModeOf(direction, -static_cast<std::int64_t>(steps)));
}

bd::ZoomRectangleDef RectangleOf(Values values, std::size_t first)
{
    return {static_cast<bd::UInt16>(values[first]), static_cast<bd::UInt16>(values[first + 1]),
            static_cast<bd::UInt16>(values[first + 2]), static_cast<bd::UInt16>(values[first + 3])};
}

/** The number after the selected one, or 1 after the last. */
template <typename Number>
std::uint64_t NextOf(DeskParts& desk, void (PlaybackContext::*get)(Number*, bd::UInt8*))
{
    Number number = 0;
    bd::UInt8 count = 0;
    (desk.Navigator().Context().*get)(&number, &count);
    return number < count ? number + 1U : 1U;
}

} // namespace

const std::vector<Command>& Commands()
{
    static const std::vector<Command> commands = {
        // Playback
        {{"play", "start at the beginning of the play list"},
         [](DeskParts& d, Values) { return d.Navigator().Play(); }},
        {{"stop", "end playback"}, [](DeskParts& d, Values) { return d.Navigator().Stop(); }},
        {{"pause", "pause playback"}, [](DeskParts& d, Values) { return d.Navigator().Pause(); }},
        {{"continue", "continue after a pause"},
         [](DeskParts& d, Values) { return d.Navigator().Continue(); }},
        {{"step", "show the next picture while paused"},
         [](DeskParts& d, Values) { return d.Navigator().Step(); }},
        {{"forward", "play forward at normal speed"},
         [](DeskParts& d, Values) {
             return d.Navigator().SetPlayMode(ModeOf(bd::PlayDirectionForward, 0));
         }},
        {{"forward fast NUMBER", "play fast, at speed 1 to 12"},
         [](DeskParts& d, Values v) { return PlayFast(d, bd::PlayDirectionForward, v[0]); }},
        {{"forward slow NUMBER", "play in slow motion, at speed 1 to 5"},
         [](DeskParts& d, Values v) { return PlaySlowly(d, bd::PlayDirectionForward, v[0]); }},
        {{"backward", "play backward at normal speed"},
         [](DeskParts& d, Values) {
             return d.Navigator().SetPlayMode(ModeOf(bd::PlayDirectionBackward, 0));
         }},
        {{"backward fast NUMBER", "play backward fast, at speed 1 to 12"},
         [](DeskParts& d, Values v) { return PlayFast(d, bd::PlayDirectionBackward, v[0]); }},
        {{"backward slow NUMBER", "play backward in slow motion, at speed 1 to 5"},
         [](DeskParts& d, Values v) { return PlaySlowly(d, bd::PlayDirectionBackward, v[0]); }},
        {{"still off", "leave a still"},
         [](DeskParts& d, Values) { return d.Navigator().EndStill(); }},
        {{"suspend", "suspend playback, as a title does when it calls a menu"},
         [](DeskParts& d, Values) { return d.Navigator().Suspend(); }},
        {{"resume", "resume suspended playback"},
         [](DeskParts& d, Values) { return d.Navigator().Resume(); }},

        // Position
        {{"seek TIME", "go to a time of the play list"},
         [](DeskParts& d, Values v) { return d.Navigator().SearchTime(Ticks(v[0])); }},
        {{"chapter next", "go to the next chapter"},
         [](DeskParts& d, Values) { return d.Navigator().SkipToNextChapter(); }},
        {{"chapter previous", "go to the start of this chapter or of the previous one"},
         [](DeskParts& d, Values) { return d.Navigator().SkipToPreviousChapter(); }},
        {{"chapter NUMBER", "go to a chapter"},
         [](DeskParts& d, Values v) { return d.Navigator().SearchChapter(v[0]); }},

        // Repeat and triggers
        {{"repeat a", "set the start of an A-B repeat"},
         [](DeskParts& d, Values) { return d.Navigator().SetPointA(); }},
        {{"repeat b", "set the end of an A-B repeat, and repeat from A to B"},
         [](DeskParts& d, Values) { return d.Navigator().SetPointB(); }},
        {{"repeat ab off", "end the A-B repeat"},
         [](DeskParts& d, Values) { return d.Navigator().EndABRepeat(); }},
        {{"repeat chapter", "repeat this chapter"},
         [](DeskParts& d, Values) { return d.Navigator().RepeatChapter(); }},
        {{"repeat title", "repeat the play list"},
         [](DeskParts& d, Values) { return d.Navigator().RepeatTitle(); }},
        {{"repeat off", "end the repeat of the chapter or play list"},
         [](DeskParts& d, Values) { return d.Navigator().EndChapterTitleRepeat(); }},
        {{"trigger TIME", "notify listeners when playback reaches a time of the play list"},
         [](DeskParts& d, Values v) { return d.Navigator().SetTrigger(Ticks(v[0])); }},

        // Streams
        {{"audio NUMBER", "select an audio stream"},
         [](DeskParts& d, Values v) { return d.Navigator().SelectAudio(v[0]); }},
        {{"audio next", "select the next audio stream"},
         [](DeskParts& d, Values) {
             return d.Navigator().SelectAudio(NextOf(d, &PlaybackContext::GetAudioInfo));
         }},
        {{"subtitle on", "show subtitles"},
         [](DeskParts& d, Values) { return d.Navigator().ShowSubtitles(true); }},
        {{"subtitle off", "hide subtitles"},
         [](DeskParts& d, Values) { return d.Navigator().ShowSubtitles(false); }},
        {{"subtitle next", "select the next subtitle stream"},
         [](DeskParts& d, Values) {
             return d.Navigator().SelectSubtitle(NextOf(d, &PlaybackContext::GetPgTextStInfo));
         }},
        {{"subtitle style NUMBER", "select the style of text subtitles"},
         [](DeskParts& d, Values v) { return d.Navigator().SelectStyle(v[0]); }},
        {{"subtitle NUMBER", "select a subtitle stream"},
         [](DeskParts& d, Values v) { return d.Navigator().SelectSubtitle(v[0]); }},
        {{"angle NUMBER", "select an angle"},
         [](DeskParts& d, Values v) { return d.Navigator().SelectAngle(v[0]); }},
        {{"angle next", "select the next angle"},
         [](DeskParts& d, Values) {
             return d.Navigator().SelectAngle(NextOf(d, &PlaybackContext::GetAngleInfo));
         }},
        {{"pip on", "show the secondary video"},
         [](DeskParts& d, Values) { return d.Navigator().ShowSecondaryVideo(true); }},
        {{"pip off", "hide the secondary video"},
         [](DeskParts& d, Values) { return d.Navigator().ShowSecondaryVideo(false); }},
        {{"pip audio on", "turn the secondary audio on"},
         [](DeskParts& d, Values) { return d.Navigator().ShowSecondaryAudio(true); }},
        {{"pip audio off", "turn the secondary audio off"},
         [](DeskParts& d, Values) { return d.Navigator().ShowSecondaryAudio(false); }},
        {{"pip audio NUMBER", "select a secondary audio stream"},
         [](DeskParts& d, Values v) { return d.Navigator().SelectSecondaryAudio(v[0]); }},
        {{"pip subtitle on", "use the subtitles of the picture-in-picture"},
         [](DeskParts& d, Values) { return d.Navigator().PickPipSubtitle(true); }},
        {{"pip subtitle off", "use the subtitles of the primary video"},
         [](DeskParts& d, Values) { return d.Navigator().PickPipSubtitle(false); }},
        {{"pip subtitle NUMBER", "select a subtitle stream of the picture-in-picture"},
         [](DeskParts& d, Values v) { return d.Navigator().SelectPipSubtitle(v[0]); }},
        {{"pip NUMBER", "select a secondary video stream"},
         [](DeskParts& d, Values v) { return d.Navigator().SelectSecondaryVideo(v[0]); }},
        {{"zoom off", "show the whole picture"},
         [](DeskParts& d, Values) {
             return d.Navigator().Zoom({WholePicture, WholePicture, 0});
         }},
        {{"zoom NUMBER NUMBER NUMBER NUMBER",
          "enlarge a part of the picture of 1920 x 1080: left, top, width, height"},
         [](DeskParts& d, Values v) {
             return d.Navigator().Zoom({RectangleOf(v, 0), WholePicture, 0});
         }},

        // The menu
        {{"menu on", "open the pop-up menu"},
         [](DeskParts& d, Values) { return d.Navigator().OpenPopUpMenu(); }},
        {{"menu off", "close the pop-up menu"},
         [](DeskParts& d, Values) { return d.Navigator().ClosePopUpMenu(); }},
        {{"button previous", "select the button above"},
         [](DeskParts& d, Values) { return d.Navigator().SelectPreviousButton(); }},
        {{"button next", "select the button below"},
         [](DeskParts& d, Values) { return d.Navigator().SelectNextButton(); }},
        {{"button activate", "activate the selected button"},
         [](DeskParts& d, Values) { return d.Navigator().ActivateButton(); }},
        {{"button activate NUMBER", "select a button and activate it"},
         [](DeskParts& d, Values v) { return d.Navigator().SelectAndActivateButton(v[0]); }},
        {{"button NUMBER", "select a button"},
         [](DeskParts& d, Values v) { return d.Navigator().SelectButton(v[0]); }},

        // The system
        {{"standby", "send the system to standby"},
         [](DeskParts& d, Values) { return d.Navigator().GoToStandby(); }},
        {{"wake", "wake up with the stored resume data"},
         [](DeskParts& d, Values) { return d.Navigator().WakeUp(d.ResumeData()); }},
        {{"wake without data", "wake up without resume data"},
         [](DeskParts& d, Values) { return d.Navigator().WakeUp({}); }},

        // Failures
        {{"fail play", "make the next play fail"},
         [](DeskParts& d, Values) {
             d.Navigator().FailNextPlay();
             return Outcome::Done();
         }},
        {{"fail resume", "make the next resume fail"},
         [](DeskParts& d, Values) {
             d.Navigator().FailNextResume();
             return Outcome::Done();
         }},
        {{"fail preload", "make preloading fail"},
         [](DeskParts& d, Values) { return d.Navigator().FailPreload(); }},
        {{"fail stream", "make the stream run out of data"},
         [](DeskParts& d, Values) { return d.Navigator().Starve(); }},
    };
    return commands;
}

const std::vector<CommandSyntax>& CommandSyntaxes()
{
    static const std::vector<CommandSyntax> syntaxes = [] {
        std::vector<CommandSyntax> all;
        std::transform(Commands().begin(), Commands().end(), std::back_inserter(all),
                       [](const Command& command) { return command.syntax; });
        all.push_back({"expect nothing", "fail if there were callbacks since the last command"});
        all.push_back({"expect CALLBACK [ARGUMENT=VALUE ...]",
                       "fail unless there was such a callback since the last command"});
        return all;
    }();
    return syntaxes;
}

bool IsExpectation(const ScriptStep& step)
{
    return step.command >= Commands().size();
}

} // namespace deskplayer
