/**
 * @file
 * The contents of a disc or a play list in JSON.
 *
 * Every part is one object on a line of its own, so the memory needed does not depend on the number
 * of parts. docs/outputs.md describes the members.
 *
 *     {"part":"title","number":1,"objectType":{"code":1,"name":"movie object"},...}
 */
#ifndef DESKPLAYER_LISTING_LISTINGJSON_H
#define DESKPLAYER_LISTING_LISTINGJSON_H

#include <cstddef>
#include <cstdint>
#include <ostream>
#include <vector>

#include "disc/disc.h"

namespace deskplayer
{

/** ListPlayLists() in JSON: the index, the titles and the play lists. */
std::size_t ListPlayListsAsJson(std::ostream& output, const Disc& disc,
                                const std::vector<std::uint32_t>& numbers,
                                const MessageHandler& onFault = {});

/** DescribePlayList() in JSON: the play list, its play items, sub paths, marks and so on. */
std::size_t DescribePlayListAsJson(std::ostream& output, const Disc& disc, std::uint32_t number,
                                   const PlayList& playList, const MessageHandler& onFault = {});

} // namespace deskplayer

#endif
