#include "output/traceoutput.h"

#include <algorithm>
#include <array>
#include <utility>

#include "output/argumentsjson.h"

namespace deskplayer
{

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
    FirstInterface ///< followed by one track for every other ListenerInterface
};

namespace
{

/** Indexed by TraceOutput::Track. */
constexpr std::array<std::string_view, 18> TrackNames{"playback",
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
                                                      "menu",
                                                      NameOf(ListenerInterface::Control),
                                                      NameOf(ListenerInterface::Settings),
                                                      NameOf(ListenerInterface::Button),
                                                      NameOf(ListenerInterface::Interactive)};

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

/** @param name of an argument of the callback */
template <typename Value> const Value& ValueOf(std::string_view name, const Callback& callback)
{
    const auto argument =
        std::find_if(callback.arguments.begin(), callback.arguments.end(),
                     [name](const Argument& candidate) { return candidate.name == name; });
    return std::get<Value>(argument->value);
}

} // namespace

TraceOutput::TraceOutput(std::ostream& stream, const VirtualClock& clock,
                         const OutputFilter& filter)
    : Output(stream, clock, filter)
{
    for (const std::string_view name : TrackNames) {
        m_Tracks.push_back({std::string(name), false, std::nullopt});
    }
    Append(Metadata("process_name", 0, "name", "session"));
}

TraceOutput::~TraceOutput()
{
    for (std::size_t track = 0; track < m_Tracks.size(); ++track) {
        End(static_cast<Track>(track));
    }
    Stream() << "\n]\n";
}

void TraceOutput::Follow(const Callback& callback)
{
    switch (callback.id) {
    case CallbackId::PlayStarted:
    case CallbackId::Continued:
        Begin(Track::Playback, Playing, callback);
        break;
    case CallbackId::Paused:
        Begin(Track::Playback, "Paused", callback);
        break;
    case CallbackId::StillOn:
        Begin(Track::Playback, "Still", callback);
        break;
    case CallbackId::StillOff:
        if (StateOf(Track::Playback).slice && StateOf(Track::Playback).slice->name == "Still") {
            Begin(Track::Playback, Playing, callback);
        }
        break;
    case CallbackId::Suspended:
        m_BeforeSuspension = StateOf(Track::Playback).slice ? StateOf(Track::Playback).slice->name
                                                            : std::string(Playing);
        Begin(Track::Playback, "Suspended", callback);
        break;
    case CallbackId::Resumed:
        Begin(Track::Playback, m_BeforeSuspension, callback);
        break;
    case CallbackId::SystemSuspended:
        Begin(Track::Playback, "Standby", callback);
        break;
    case CallbackId::SystemResumed:
        if (ValueOf<bool>("playing", callback)) {
            Begin(Track::Playback, Playing, callback);
        } else {
            EndPlayback();
        }
        break;
    case CallbackId::PlayFailed:
    case CallbackId::Stopped:
    case CallbackId::Finished:
    case CallbackId::ResumeFailed:
    case CallbackId::SystemResumeFailed:
        EndPlayback();
        break;

    case CallbackId::PlayMode:
        Begin(Track::PlayMode,
              ValueOf<std::string>("direction", callback) + " " +
                  ValueOf<std::string>("speed", callback),
              callback);
        break;
    case CallbackId::Playlist:
        BeginNumbered(Track::PlayList, "playListId", callback);
        break;
    case CallbackId::PlayItem:
        BeginNumbered(Track::PlayItem, "playItemId", callback);
        break;
    case CallbackId::ChapterNumber:
        BeginCounted(Track::Chapter, "chapter", callback);
        break;

    case CallbackId::VideoInfo:
        BeginCounted(Track::Video, "number", callback);
        break;
    case CallbackId::AudioInfo:
        BeginCounted(Track::Audio, "number", callback);
        break;
    case CallbackId::PresentationGraphicsInfo:
        BeginCounted(Track::Subtitles, "number", callback);
        break;
    case CallbackId::AngleInfo:
        BeginCounted(Track::Angle, "number", callback);
        break;
    case CallbackId::InteractiveGraphicsInfo:
        BeginCounted(Track::InteractiveGraphics, "number", callback);
        break;
    case CallbackId::SecondaryVideoInfo:
        BeginCounted(Track::SecondaryVideo, "number", callback);
        break;
    case CallbackId::SecondaryAudioInfo:
        BeginCounted(Track::SecondaryAudio, "number", callback);
        break;
    case CallbackId::PipPgTextStInfo:
        BeginCounted(Track::PipSubtitles, "number", callback);
        break;

    case CallbackId::InteractiveGraphicsVisible:
        Begin(Track::Menu, "Visible", callback);
        break;
    case CallbackId::InteractiveGraphicsInvisible:
        End(Track::Menu);
        break;

    default:
        break;
    }
}

void TraceOutput::Write(const Callback& callback)
{
    const CallbackInfo& info = InfoOf(callback.id);
    const auto track =
        static_cast<std::size_t>(Track::FirstInterface) + static_cast<std::size_t>(info.interface);
    AppendEvent(static_cast<Track>(track), "i",
                {{"s", "t"}, {"name", info.name}, {"args", ArgumentsJson(callback)}});
}

void TraceOutput::Begin(Track track, const std::string& name, const Callback& callback)
{
    End(track);
    StateOf(track).slice = Slice{name, callback};
    AppendSlice(track, "B", *StateOf(track).slice);
}

void TraceOutput::BeginNumbered(Track track, std::string_view number, const Callback& callback)
{
    Begin(track,
          StateOf(track).name + " " + std::to_string(ValueOf<std::uint64_t>(number, callback)),
          callback);
}

/** Streams, angles and chapters are numbered from 1; 0 means none. */
void TraceOutput::BeginCounted(Track track, std::string_view number, const Callback& callback)
{
    if (ValueOf<std::uint64_t>(number, callback) == 0) {
        End(track);
    } else {
        BeginNumbered(track, number, callback);
    }
}

void TraceOutput::End(Track track)
{
    if (const std::optional<Slice> slice = std::exchange(StateOf(track).slice, std::nullopt)) {
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

/** Gives begin and end the same members, because some viewers match them by name and arguments. */
void TraceOutput::AppendSlice(Track track, const char* phase, const Slice& slice)
{
    AppendEvent(track, phase, {{"name", slice.name}, {"args", ArgumentsJson(slice.callback)}});
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
        {"ph", phase}, {"ts", Microseconds(Now())}, {"pid", Process}, {"tid", thread}};
    event.update(members);
    Append(event);
}

void TraceOutput::Append(const ordered_json& event)
{
    Stream() << m_Separator << event.dump();
    m_Separator = ",\n";
}

} // namespace deskplayer
