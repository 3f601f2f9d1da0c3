// Reads any bytes as a play list, computes its time line, and looks up the clip of every stream.

#include "disc/playlist.h"
#include "disc/timeline.h"
#include "discfile.h"

namespace
{

using namespace deskplayer;

void UseTimes(const PlayList& playList)
{
    for (const PlayItem& item : playList.playItems) {
        fuzz::Expect(item.inTime <= item.outTime);
    }
    const TimeLine timeLine = BuildTimeLine(playList);
    for (const auto& position : timeLine.markPositions) {
        fuzz::Expect(!position || *position <= timeLine.duration);
    }
    for (const Chapter& chapter : timeLine.chapters) {
        fuzz::Expect(chapter.start <= chapter.end && chapter.end <= timeLine.duration);
    }
}

void UseStreams(const PlayList& playList)
{
    for (std::size_t number = 0; number < playList.playItems.size(); ++number) {
        const StreamTable& table = playList.playItems[number].streams;
        for (const auto* streams :
             {&table.primaryVideo, &table.primaryAudio, &table.pg, &table.pipPg, &table.ig,
              &table.secondaryAudio, &table.secondaryVideo, &table.enhancementVideo}) {
            for (const Stream& stream : *streams) {
                const auto clip = ClipOfStream(playList, number, stream);
                fuzz::Expect(!clip || clip->size() == 5);
            }
        }
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    return fuzz::OnDiscFile(data, size, [](const Bytes& bytes, const std::string& fileName) {
        const PlayList playList = ParsePlayList(bytes, fileName);
        UseTimes(playList);
        UseStreams(playList);
    });
}
