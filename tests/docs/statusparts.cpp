#include "docs/statusparts.h"

namespace
{

template <typename Number> std::string Text(const Number& value)
{
    return std::to_string(static_cast<bd::UInt64>(value));
}

std::string Text(bool value)
{
    return value ? "true" : "false";
}

std::string Text(bdmv::PlaybackState value)
{
    return NameOf(value);
}

std::string Text(const bd::PlayMode& value)
{
    return Text(value.Direction()) + " " + Text(value.Speed());
}

std::string Text(const bdmv::UOMaskTable& value)
{
    return Text(value.GetUOMaskTable());
}

std::string Text(const bd::ZoomRectangleDef& value)
{
    return Text(value.X) + "," + Text(value.Y) + "," + Text(value.Width) + "," + Text(value.Height);
}

std::string Text(const bd::ZOOM_PARAM_Def& value)
{
    return Text(value.rClipRectangle) + " " + Text(value.rDestRectangle) + " " +
           Text(value.u4Delay);
}

std::string Text(const bd::AudioInfoType& value)
{
    return Text(value.format) + " " + Text(value.sampleRate) + " " + Text(value.bitsPerSampling) +
           " " + Text(value.channels) + " " + Text(value.pid) + " " +
           Text(value.u4AudChannelLayout);
}

std::string Text(const bdmv::PlayItemStatus& value)
{
    return Text(value.playListId) + " " + Text(value.playItemId) + " " + Text(value.videoFormat) +
           " " + Text(value.aspectRatio);
}

template <typename Value> std::string Text(const bdmv::Reported<Value>& part)
{
    return part.known ? Text(part.value) : "unknown";
}

struct ArgumentTexts {
    Texts texts;

    template <typename Value> void operator()(const char* name, const Value& value)
    {
        texts[name] = Text(value);
    }

    // No part of the status has these.
    void operator()(const char* /*name*/, const bdmv::Bytes& /*value*/) {}
    void operator()(const char* /*name*/, const bdmv::IProgramData::RefPtr& /*value*/) {}
};

} // namespace

Texts PartsOf(const bdmv::PlaybackStatus& status)
{
    return {
        {"state", Text(status.state)},
        {"resumesTo", Text(status.resumesTo)},
        {"playList", Text(status.playList)},
        {"playItem", Text(status.playItem)},
        {"chapter", Text(status.chapter)},
        {"position", Text(status.position)},
        {"playMode", Text(status.playMode)},
        {"zoom", Text(status.zoom)},
        {"mask", Text(status.mask)},
        {"video", Text(status.video)},
        {"angle", Text(status.angle)},
        {"audio", Text(status.audio)},
        {"audioInfo", Text(status.audioInfo)},
        {"subtitle", Text(status.subtitle)},
        {"subtitleAvailable", Text(status.subtitleAvailable)},
        {"subtitleShown", Text(status.subtitleShown)},
        {"subtitleStyle", Text(status.subtitleStyle)},
        {"subtitleStyles", Text(status.subtitleStyles)},
        {"pipAvailable", Text(status.pipAvailable)},
        {"secondaryVideo", Text(status.secondaryVideo)},
        {"secondaryVideoShown", Text(status.secondaryVideoShown)},
        {"secondaryAudioAvailable", Text(status.secondaryAudioAvailable)},
        {"secondaryAudio", Text(status.secondaryAudio)},
        {"secondaryAudioShown", Text(status.secondaryAudioShown)},
        {"secondaryAudioInfo", Text(status.secondaryAudioInfo)},
        {"pipSubtitle", Text(status.pipSubtitle)},
        {"pipSubtitleAvailable", Text(status.pipSubtitleAvailable)},
        {"pipSubtitleSelected", Text(status.pipSubtitleSelected)},
        {"interactiveGraphics", Text(status.interactiveGraphics)},
        {"menuVisible", Text(status.menuVisible)},
        {"menuActive", Text(status.menuActive)},
        {"popUpMenuAvailable", Text(status.popUpMenuAvailable)},
        {"buttonBusy", Text(status.buttonBusy)},
    };
}

Texts ArgumentsOf(const bdmv::Callback& callback)
{
    ArgumentTexts arguments;
    callback.VisitArguments(arguments);
    return arguments.texts;
}
