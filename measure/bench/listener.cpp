#include "listener.h"

namespace bench
{

namespace
{

const bd::TimePosition g_Position = 27000000;
const bd::AudioInfoType g_AudioInfo;

} // namespace

CountingListener* Listeners()
{
    static CountingListener listeners[1024];
    return listeners;
}

const bd::TimePosition& Position = g_Position;
const bd::AudioInfoType& AudioInfo = g_AudioInfo;

void CountingListener::PlayStarted()
{
    ++m_Count;
}

void CountingListener::CurrentTimePosition(const bd::TimePosition& /*position*/)
{
    ++m_Count;
}

void CountingListener::AudioInfoChanged(bool /*isPrimary*/, bd::AudioInfoType /*info*/)
{
    ++m_Count;
}

void CountingListener::PlayItem(bd::PlayListIdDef /*playListId*/, bd::PlayItemIdDef /*playItemId*/,
                                bd::VideoFormatType /*videoFormat*/,
                                bd::VideoAspectRatioType /*aspectRatio*/)
{
    ++m_Count;
}

} // namespace bench
