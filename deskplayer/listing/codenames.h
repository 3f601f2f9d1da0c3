/**
 * @file
 * Names of the codes that listings and descriptions explain, besides those of disc/codes.h. A code
 * without a name is "reserved".
 */
#ifndef DESKPLAYER_LISTING_CODENAMES_H
#define DESKPLAYER_LISTING_CODENAMES_H

#include <cstdint>
#include <string>

namespace deskplayer
{

std::string PlaybackTypeName(std::uint8_t code);
std::string ConnectionConditionName(std::uint8_t code);
std::string StillModeName(std::uint8_t code);
std::string EntryTypeName(std::uint8_t code);
std::string MarkTypeName(std::uint8_t code);

/** @param name as returned by the functions of disc/codes.h, which repeat a reserved code */
std::string WithoutCode(const std::string& name);

} // namespace deskplayer

#endif
