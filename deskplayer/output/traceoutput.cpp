#include "output/traceoutput.h"

#include <algorithm>
#include <utility>

#include "output/argumentsjson.h"
#include "text/names.h"

namespace deskplayer
{

namespace callbacks = bdmv::callbacks;
using nlohmann::ordered_json;

/** In order from top to bottom. */
enum class TraceOutput::Track : std::size_t {
    Playback,
    PlayMode,
    PlayList,
    PlayItem,
    Chapter,
    Video,
    Audio,
    Subtitles,
    Angle,
    InteractiveGraphics,
    SecondaryVideo,
    SecondaryAudio,
    PipSubtitles,
    Menu,
    FirstInterface, ///< followed by one track for every other bdmv::ListenerInterface
    Gaps = FirstInterface + bdmv::ListenerInterface__sizeof,
    Starts
};

/** Keeps its arguments as they were when it began: a callback's bytes do not last. */
struct TraceOutput::Slice {
    std::string name;
    ordered_json arguments;
};

namespace
{

/** The tracks before FirstInterface, indexed by TraceOutput::Track. */
constexpr const char* TrackNames[] = {"playback",
                                      "play mode",
                                      "play list",
                                      "play item",
                                      "chapter",
                                      "video",
                                      "audio",
                                      "subtitles",
                                      "angle",
                                      "interactive graphics",
                                      "secondary video",
                                      "secondary audio",
                                      "picture-in-picture subtitles",
                                      "menu"};

constexpr int Process = 1;

constexpr const char* Playing = "Playing";

/** A metadata event, which describes the process or one of its threads; the tracks are threads. */
template <typename Value>
ordered_json Metadata(const char* name, std::size_t thread, const char* member, const Value& value)
{
    return {{"ph", "M"},
            {"pid", Process},
            {"tid", thread},
            {"name", name},
            {"args", {{member, value}}}};
}

/** @tparam Arguments those of this callback */
template <typename Arguments> const Arguments& In(const bdmv::Callback& callback)
{
    return *callback.As<Arguments>();
}

} // namespace

TraceOutput::TraceOutput(std::ostream& stream, const VirtualClock& clock,
                         const OutputFilter& filter)
    : Output(stream, clock, filter)
{
    for (const char* const name : TrackNames) {
        m_Tracks.push_back({name, false, nullptr});
    }
    for (int interface = 0; interface < bdmv::ListenerInterface__sizeof; ++interface) {
        m_Tracks.push_back(
            {NameOf(static_cast<bdmv::ListenerInterface>(interface)), false, nullptr});
    }
    m_Tracks.push_back({"gaps", false, nullptr});
    m_Tracks.push_back({"starts", false, nullptr});
    Append(Metadata("process_name", 0, "name", "session"));
}

TraceOutput::~TraceOutput()
{
    m_Time = std::max(m_Time, Now());
    EndAll();
    Stream() << "\n]\n";
}

void TraceOutput::Follow(const CallbackRecord& record)
{
    m_Time = record.time;
    const bdmv::Callback& callback = record.callback;
    switch (callback.Id()) {
    case bdmv::CallbackPlayStarted:
    case bdmv::CallbackContinued:
        Begin(Track::Playback, Playing, record);
        break;
    case bdmv::CallbackPaused:
        Begin(Track::Playback, "Paused", record);
        break;
    case bdmv::CallbackStillOn:
        Begin(Track::Playback, "Still", record);
        break;
    case bdmv::CallbackStillOff:
        if (StateOf(Track::Playback).slice && StateOf(Track::Playback).slice->name == "Still") {
            Begin(Track::Playback, Playing, record);
        }
        break;
    case bdmv::CallbackSuspended:
        m_BeforeSuspension = StateOf(Track::Playback).slice ? StateOf(Track::Playback).slice->name
                                                            : std::string(Playing);
        Begin(Track::Playback, "Suspended", record);
        break;
    case bdmv::CallbackResumed:
        Begin(Track::Playback, m_BeforeSuspension, record);
        break;
    case bdmv::CallbackSystemSuspended:
        Begin(Track::Playback, "Standby", record);
        break;
    case bdmv::CallbackSystemResumed:
        if (In<callbacks::SystemResumed>(callback).playing) {
            Begin(Track::Playback, Playing, record);
        } else {
            EndPlayback();
        }
        break;
    case bdmv::CallbackPlayFailed:
    case bdmv::CallbackStopped:
    case bdmv::CallbackFinished:
    case bdmv::CallbackResumeFailed:
    case bdmv::CallbackSystemResumeFailed:
        EndPlayback();
        break;

    case bdmv::CallbackPlayMode:
        BeginNamed(Track::PlayMode,
                   NameOrNumber(In<callbacks::PlayMode>(callback).direction) + " " +
                       NameOrNumber(In<callbacks::PlayMode>(callback).speed),
                   record);
        break;
    case bdmv::CallbackPlaylist:
        BeginNumbered(Track::PlayList, In<callbacks::Playlist>(callback).playListId, record);
        break;
    case bdmv::CallbackPlayItem:
        BeginNumbered(Track::PlayItem, In<callbacks::PlayItem>(callback).playItemId, record);
        break;
    case bdmv::CallbackChapterNumber:
        BeginCounted(Track::Chapter, In<callbacks::ChapterNumber>(callback).chapter, record);
        break;

    case bdmv::CallbackVideoInfo:
        BeginCounted(Track::Video, In<callbacks::VideoInfo>(callback).number, record);
        break;
    case bdmv::CallbackAudioInfo:
        BeginCounted(Track::Audio, In<callbacks::AudioInfo>(callback).number, record);
        break;
    case bdmv::CallbackPresentationGraphicsInfo:
        BeginCounted(Track::Subtitles, In<callbacks::PresentationGraphicsInfo>(callback).number,
                     record);
        break;
    case bdmv::CallbackAngleInfo:
        BeginCounted(Track::Angle, In<callbacks::AngleInfo>(callback).number, record);
        break;
    case bdmv::CallbackInteractiveGraphicsInfo:
        BeginCounted(Track::InteractiveGraphics,
                     In<callbacks::InteractiveGraphicsInfo>(callback).number, record);
        break;
    case bdmv::CallbackSecondaryVideoInfo:
        BeginCounted(Track::SecondaryVideo, In<callbacks::SecondaryVideoInfo>(callback).number,
                     record);
        break;
    case bdmv::CallbackSecondaryAudioInfo:
        BeginCounted(Track::SecondaryAudio, In<callbacks::SecondaryAudioInfo>(callback).number,
                     record);
        break;
    case bdmv::CallbackPipPgTextStInfo:
        BeginCounted(Track::PipSubtitles, In<callbacks::PipPgTextStInfo>(callback).number, record);
        break;

    case bdmv::CallbackInteractiveGraphicsVisible:
        Begin(Track::Menu, "Visible", record);
        break;
    case bdmv::CallbackInteractiveGraphicsInvisible:
        End(Track::Menu);
        break;

    default:
        break;
    }
}

void TraceOutput::Write(const CallbackRecord& record)
{
    const bdmv::CallbackId id = record.callback.Id();
    const auto track =
        static_cast<std::size_t>(Track::FirstInterface) + static_cast<std::size_t>(InterfaceOf(id));
    AppendEvent(static_cast<Track>(track), "i",
                {{"s", "t"}, {"name", NameOf(id)}, {"args", ArgumentsJson(record)}});
}

/** Ends all slices: any state may have changed in the gap. */
void TraceOutput::Write(const GapRecord& gap)
{
    m_Time = gap.time;
    EndAll();
    ordered_json arguments = ordered_json::object();
    if (gap.lost) {
        arguments["lost"] = *gap.lost;
    }
    arguments["cause"] = gap.cause;
    AppendEvent(Track::Gaps, "i", {{"s", "t"}, {"name", "gap"}, {"args", arguments}});
}

void TraceOutput::Write(const StartRecord& start)
{
    m_Time = start.time;
    AppendEvent(Track::Starts, "i",
                {{"s", "t"}, {"name", "start"}, {"args", {{"wallClock", start.wallClock}}}});
}

void TraceOutput::Begin(Track track, const std::string& name, const CallbackRecord& record)
{
    End(track);
    StateOf(track).slice = std::make_unique<Slice>(Slice{name, ArgumentsJson(record)});
    AppendSlice(track, "B", *StateOf(track).slice);
}

/** Begins a slice that the arguments name, so only if all are known. */
void TraceOutput::BeginNamed(Track track, const std::string& name, const CallbackRecord& record)
{
    if (record.absent.any()) {
        End(track);
    } else {
        Begin(track, name, record);
    }
}

void TraceOutput::BeginNumbered(Track track, bd::UInt32 number, const CallbackRecord& record)
{
    BeginNamed(track, StateOf(track).name + " " + std::to_string(number), record);
}

/** Streams, angles and chapters are numbered from 1; 0 means none. */
void TraceOutput::BeginCounted(Track track, bd::UInt32 number, const CallbackRecord& record)
{
    if (number == 0) {
        End(track);
    } else {
        BeginNumbered(track, number, record);
    }
}

void TraceOutput::End(Track track)
{
    if (const std::unique_ptr<Slice> slice = std::move(StateOf(track).slice)) {
        AppendSlice(track, "E", *slice);
    }
}

void TraceOutput::EndPlayback()
{
    for (const Track track :
         {Track::Playback, Track::PlayMode, Track::PlayList, Track::PlayItem, Track::Chapter}) {
        End(track);
    }
}

void TraceOutput::EndAll()
{
    for (std::size_t track = 0; track < m_Tracks.size(); ++track) {
        End(static_cast<Track>(track));
    }
}

/** Gives begin and end the same members, because some viewers match them by name and arguments. */
void TraceOutput::AppendSlice(Track track, const char* phase, const Slice& slice)
{
    AppendEvent(track, phase, {{"name", slice.name}, {"args", slice.arguments}});
}

void TraceOutput::AppendEvent(Track track, const char* phase, const ordered_json& members)
{
    const auto thread = static_cast<std::size_t>(track) + 1;
    if (!StateOf(track).named) {
        Append(Metadata("thread_name", thread, "name", StateOf(track).name));
        Append(Metadata("thread_sort_index", thread, "sort_index", thread));
        StateOf(track).named = true;
    }
    ordered_json event = {
        {"ph", phase}, {"ts", Microseconds(m_Time)}, {"pid", Process}, {"tid", thread}};
    event.update(members);
    Append(event);
}

void TraceOutput::Append(const ordered_json& event)
{
    Stream() << m_Separator << event.dump();
    m_Separator = ",\n";
}

} // namespace deskplayer
