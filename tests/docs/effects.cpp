#include "docs/effects.h"

#include <cctype>
#include <sstream>
#include <stdexcept>

#include "docs/markdown.h"
#include "testkit/fakeplatform.h"
#include "testkit/recordinglistener.h"

namespace
{

/** Splits "1, (2, 3), 4" into its three values. */
std::vector<std::string> SplitValues(const std::string& text)
{
    std::vector<std::string> values;
    int depth = 0;
    for (std::size_t i = 0; i < text.size(); ++i) {
        if (values.empty()) {
            values.emplace_back();
        }
        depth += text[i] == '(' ? 1 : text[i] == ')' ? -1 : 0;
        if (depth == 0 && text.compare(i, 2, ", ") == 0) {
            values.emplace_back();
            ++i;
        } else {
            values.back() += text[i];
        }
    }
    return values;
}

/** The end of the printf conversion that begins at a position of a format. */
std::size_t EndOfConversion(const std::string& format, std::size_t begin)
{
    const std::size_t last = format.find_first_of("dus", begin);
    if (last == std::string::npos) {
        throw std::runtime_error("\"" + format + "\" has an unknown conversion");
    }
    return last + 1;
}

/** The values that a line shows for the conversions of its format: flags, unsigned numbers. */
std::vector<std::string> ShownValues(const std::string& format, const std::string& line)
{
    std::vector<std::string> values;
    std::size_t at = 0;
    for (std::size_t i = 0; i < format.size();) {
        if (format[i] == '%') {
            values.emplace_back();
            for (; at < line.size() && std::isalnum(static_cast<unsigned char>(line[at])); ++at) {
                values.back() += line[at];
            }
            i = EndOfConversion(format, i);
        } else {
            ++i;
            ++at;
        }
    }
    return values;
}

std::string LogAction(const std::string& tag)
{
    return tag == "57 5 0"   ? "log"
           : tag == "57 5 1" ? "log, high-frequency"
           : tag == "57 3 0" ? "log at Warning"
                             : "log with tag " + tag;
}

/** Reads "Name(value, value)", and " -> value, value" after it. */
Effect ParseCall(const std::string& action, const std::string& call)
{
    const std::size_t open = call.find('(');
    const std::size_t arrow = call.rfind(") -> ");
    const std::size_t close = arrow == std::string::npos ? call.size() - 1 : arrow;
    const std::string answers = arrow == std::string::npos ? "" : call.substr(arrow + 5);
    return {action, call.substr(0, open), SplitValues(call.substr(open + 1, close - open - 1)),
            SplitValues(answers)};
}

/** Turns the entries of a journal into effects. */
std::vector<Effect> ParseJournal(const std::string& journal)
{
    std::vector<Effect> effects;
    std::string format;
    std::istringstream entries(journal);
    for (std::string entry; std::getline(entries, entry);) {
        const std::size_t colon = entry.find(": ");
        if (StartsWith(entry, "context.")) {
            if (entry.find('(') != std::string::npos) {
                const bool answers = entry.find(" -> ") != std::string::npos;
                effects.push_back(ParseCall(answers ? "query" : "call", entry.substr(8)));
            }
        } else if (StartsWith(entry, "format: ")) {
            format = entry.substr(colon + 2);
        } else if (StartsWith(entry, "log ")) {
            effects.push_back({LogAction(entry.substr(4, colon - 4)),
                               format,
                               ShownValues(format, entry.substr(colon + 2)),
                               {}});
        } else if (StartsWith(entry, "A.")) {
            effects.push_back(ParseCall("callback", entry.substr(2)));
        } else if (StartsWith(entry, "assert: ")) {
            effects.push_back({"assert", entry.substr(colon + 2), {}, {}});
        } else if (!StartsWith(entry, "log? ")) {
            throw std::runtime_error("cannot read " + entry);
        }
    }
    return effects;
}

} // namespace

std::vector<Situation> AllSituations()
{
    std::vector<Situation> situations;

    for (const bd::PlaySpeedDef speed :
         {bd::PlaySpeedSlow1, bd::PlaySpeedNormal, bd::PlaySpeedFast1}) {
        for (unsigned flags = 0; flags < 16; ++flags) {
            situations.push_back(
                {"speed " + std::to_string(speed) + ", flags " + std::to_string(flags),
                 [speed, flags](Context& context) {
                     context.currentPlayMode = bd::PlayMode(bd::PlayDirectionForward, speed);
                     context.async2ndVid = (flags & 1) != 0;
                     context.async2ndAud = (flags & 2) != 0;
                     context.prev2ndVid = (flags & 4) != 0;
                     context.prev2ndAud = (flags & 8) != 0;
                 }});
        }
    }

    for (const bd::TriggerType kind : {bd::TRIGGER_B, bd::TRIGGER_INVALID, bd::TRIGGER_CHP}) {
        for (const bd::TriggerType abState : {bd::TRIGGER_AB_NONE, bd::TRIGGER_B}) {
            for (const bd::TriggerType chpTitleState : {bd::TRIGGER_NONE, bd::TRIGGER_TITLE}) {
                situations.push_back(TriggerSituation(kind, abState, chpTitleState));
            }
        }
    }

    for (const bool shown : {false, true}) {
        for (const bool async : {false, true}) {
            situations.push_back({std::string(shown ? "shown" : "hidden") +
                                      (async ? ", asynchronous" : ", synchronous"),
                                  [shown, async](Context& context) {
                                      context.pgTextStDisplay = shown;
                                      context.secondaryVideoDisplay = shown;
                                      context.secondaryAudioDisplay = shown;
                                      context.pipPgTextStSelect = shown;
                                      context.playingAfterSystemResume = shown;
                                      context.secondaryVideoAsync = async;
                                  }});
        }
    }

    for (const bdmv::INavError::ErrCode result :
         {bdmv::INavError::ErrFailed, bdmv::INavError::ErrNotAllowed}) {
        situations.push_back({"result " + std::to_string(result),
                              [result](Context& context) { context.rPgTextStResult = result; }});
    }

    for (const int reason : {1, 2}) {
        situations.push_back({"reason " + std::to_string(reason), [reason](Context& context) {
                                  context.finishedReason =
                                      static_cast<bdstreaming::FinishedReason>(reason);
                              }});
    }
    return situations;
}

Situation TriggerSituation(bd::TriggerType kind, bd::TriggerType abState,
                           bd::TriggerType chpTitleState)
{
    return {"kind " + std::to_string(kind) + ", A-B " + std::to_string(abState) +
                ", chapter/title " + std::to_string(chpTitleState),
            [=](Context& context) {
                context.triggerTypeByTime = kind;
                context.currentABRepeatState = abState;
                context.currentChpTitleRepeatState = chpTitleState;
            }};
}

void Arrange(Context& context, const Situation& situation)
{
    static bd::UInt8 resumeData[] = {1, 2, 3};
    context.systemResumeData = {resumeData, 3};
    context.playListId = 800;
    context.playItemId = 31;
    context.playMode = bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedFast2);
    context.trigger = {bd::TRIGGER_CURPOS};
    context.triggerReachedTime = 123456789012;
    context.currentChapter = 12;
    context.currentPLMarkId = 17;
    context.currentPLMarkTime = 234567890123;
    context.video = {2, 3};
    context.audio = {4, 5};
    context.ig = {6, 7};
    context.rPgTextSt = {8, 9};
    context.pgTextSt = {10, 11};
    context.secondaryVideo = {12, 13};
    context.secondaryAudio = {14, 15};
    context.pipPgTextSt = {16, 18};
    context.angleNumber = 19;
    context.angleCount = 20;
    context.uoMask = bdmv::UOMaskTable(0xC000000000000002ULL);
    context.currentTimePosition = 345678901234;
    context.executeButtonTicket = 21;
    context.executeButtonId = 22;
    context.currentTextSubtitleStyleNumber = 23;
    context.numberOfTextSubtitleStyles = 24;
    situation.arrange(context);
}

std::vector<Effect> EffectsOf(const EventClass& event, const Situation& situation)
{
    bdmvtest::Journal journal;
    bdmvtest::FakePlatform platform(&journal);
    platform.RecordFormats();
    Context context(journal);
    Arrange(context, situation);
    bdmvtest::RecordingListener listener(journal, "A");
    bd::EventListenerList<bdmv::INavigatorListener> listeners;
    listeners.AddListener(&listener);

    event.make(context)->Dispatch(listeners);

    return ParseJournal(journal.Take());
}

std::vector<std::string> Conversions(const std::string& format)
{
    std::vector<std::string> conversions;
    for (std::size_t i = format.find('%'); i != std::string::npos; i = format.find('%', i + 1)) {
        conversions.push_back(format.substr(i, EndOfConversion(format, i) - i));
    }
    return conversions;
}
