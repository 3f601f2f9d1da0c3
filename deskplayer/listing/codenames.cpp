#include "listing/codenames.h"

#include "disc/playlist.h"
#include "text/codes.h"

namespace deskplayer
{

namespace
{

const CodeName g_PlaybackTypes[] = {
    {PlaybackTypeInSequence, "in sequence"},
    {PlaybackTypeRandom, "random; played in sequence"},
    {PlaybackTypeShuffle, "shuffle; played in sequence"},
};

const CodeName g_ConnectionConditions[] = {
    {1, "not seamless"},
    {5, "seamless"},
    {6, "seamless, on the same time line"},
};

const CodeName g_StillModes[] = {
    {StillModeNone, "none"},
    {StillModeTimed, "timed"},
    {StillModeEndless, "endless"},
};

const CodeName g_EntryTypes[] = {
    {EntryTypePlayItem, "play item"},
    {EntryTypeSubPath, "sub path"},
    {EntryTypePlayItemSubPath3, "play item, for a sub path"},
    {EntryTypePlayItemSubPath4, "play item, for a sub path"},
};

const CodeName g_MarkTypes[] = {
    {MarkTypeEntry, "entry"},
    {MarkTypeLink, "link"},
};

template <typename Table> std::string NameIn(const Table& table, std::uint8_t code)
{
    const CodeName* const entry = FindCode(table, code);
    return entry == nullptr ? "reserved" : entry->name;
}

} // namespace

std::string PlaybackTypeName(std::uint8_t code)
{
    return NameIn(g_PlaybackTypes, code);
}

std::string ConnectionConditionName(std::uint8_t code)
{
    return NameIn(g_ConnectionConditions, code);
}

std::string StillModeName(std::uint8_t code)
{
    return NameIn(g_StillModes, code);
}

std::string EntryTypeName(std::uint8_t code)
{
    return NameIn(g_EntryTypes, code);
}

std::string MarkTypeName(std::uint8_t code)
{
    return NameIn(g_MarkTypes, code);
}

std::string WithoutCode(const std::string& name)
{
    return name.rfind("reserved", 0) == 0 ? "reserved" : name;
}

} // namespace deskplayer
