#include "deskplayer/desk.h"

#include <string>
#include <utility>

#include "disc/disc.h"
#include "facade/parts.h"
#include "navigator/loadedplaylist.h"

namespace deskplayer
{

namespace
{

/** Reports a playback type whose play items a player would not play in sequence, as a desk does. */
void ReportPlaybackType(const LoadedPlayList& playList, const MessageHandler& report)
{
    const std::uint8_t type = playList.playList.applicationInfo.playbackType;
    if (type == PlaybackTypeRandom || type == PlaybackTypeShuffle) {
        report("play list " + std::to_string(playList.number) + ": the playback type is " +
               (type == PlaybackTypeRandom ? "random" : "shuffle") +
               "; its play items are played in sequence");
    }
}

LoadedPlayList ReadFrom(const Disc& disc, std::optional<std::uint32_t> number,
                        const MessageHandler& report)
{
    if (number) {
        return LoadPlayList(disc, *number, disc.ReadPlayList(*number));
    }
    LongestPlayList longest = disc.FindLongestPlayList();
    for (const std::string& line : longest.skipped) {
        report("skipped: " + line);
    }
    return LoadPlayList(disc, longest.number, std::move(longest.playList));
}

LoadedPlayList Load(const std::filesystem::path& folder, std::optional<std::uint32_t> number,
                    const MessageHandler& onMessage)
{
    const MessageHandler report = onMessage ? onMessage : [](const std::string& /*message*/) {};
    LoadedPlayList playList = ReadFrom(Disc(folder, BackupCopies::Use, report), number, report);
    ReportPlaybackType(playList, report);
    for (const std::string& note : playList.notes) {
        report(note);
    }
    return playList;
}

} // namespace

Desk::Desk(const std::filesystem::path& disc, std::optional<std::uint32_t> playList,
           const MessageHandler& onMessage)
    : m_pParts(std::make_unique<DeskParts>(Load(disc, playList, onMessage)))
{
}

Desk::~Desk() = default;

bdmv::INavigatorEvent::Listeners& Desk::Listeners()
{
    return m_pParts->Listeners();
}

std::uint32_t Desk::PlayListNumber() const
{
    return m_pParts->Navigator().LoadedList().number;
}

Ticks Desk::Now() const
{
    return m_pParts->Clock().Now();
}

const std::vector<bd::UInt8>& Desk::ResumeData() const
{
    return m_pParts->ResumeData();
}

DeskParts& PartsOf(Desk& desk)
{
    return *desk.m_pParts;
}

} // namespace deskplayer
