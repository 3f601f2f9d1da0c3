#include "session/remotestatus.h"

#include "navigator/permission.h"
#include "text/names.h"
#include "text/timetext.h"

namespace deskplayer
{

namespace
{

bool HasPosition(Status status)
{
    return status == Status::Playing || status == Status::Paused || status == Status::Still ||
           status == Status::Suspended;
}

std::string Seconds(Ticks time)
{
    const std::string text = TimeText(time);
    return text.substr(0, text.rfind('.'));
}

std::string NumberOf(std::size_t number, std::size_t count)
{
    return std::to_string(number) + " of " + std::to_string(count);
}

} // namespace

std::string PlaybackSummary(DeskParts& desk)
{
    SimulatedNavigator& navigator = desk.Navigator();
    std::string line = StatusName(navigator.CurrentStatus());
    if (!HasPosition(navigator.CurrentStatus())) {
        return line;
    }
    PlaybackContext& context = navigator.Context();
    const bd::PlayMode mode = context.GetPlayMode();
    if (mode != bd::PlayMode()) {
        line += "  " + NameOrNumber(mode.Direction()) + " " + NameOrNumber(mode.Speed());
    }
    const TimeLine& timeLine = navigator.LoadedList().timeLine;
    line += "  " + Seconds(Ticks(context.GetCurrentTimePosition())) + " of " +
            Seconds(timeLine.duration);
    if (context.GetCurrentChapter() != 0) {
        line += "  chapter " + NumberOf(context.GetCurrentChapter(), timeLine.chapters.size());
    }
    return line;
}

std::string SelectionSummary(DeskParts& desk)
{
    SimulatedNavigator& navigator = desk.Navigator();
    if (!HasPosition(navigator.CurrentStatus())) {
        return "";
    }
    PlaybackContext& context = navigator.Context();
    std::string line;
    const auto add = [&line](const std::string& part) {
        line += (line.empty() ? "" : "  ") + part;
    };
    const auto addStream = [&add](const char* kind, PlaybackContext::NumberAndCount chosen,
                                  bool shown) {
        if (chosen.second != 0) {
            add(std::string(kind) + " " + (shown ? NumberOf(chosen.first, chosen.second) : "off"));
        }
    };
    addStream("audio", context.ChosenAudio(), true);
    addStream("subtitle", context.ChosenPg(), context.GetPgTextStDisplay());
    addStream("pip", context.ChosenSecondaryVideo(), context.GetSecondaryVideoDisplay());
    if (context.ChosenAngle().second > 1) {
        addStream("angle", context.ChosenAngle(), true);
    }
    const bd::TriggerType repeat = context.GetCurrentABRepeatState();
    if (repeat == bd::TRIGGER_A || repeat == bd::TRIGGER_B) {
        add(repeat == bd::TRIGGER_A ? "repeat A-" : "repeat A-B");
    }
    return line;
}

} // namespace deskplayer
