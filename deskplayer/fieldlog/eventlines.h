/**
 * @file
 * The lines that the events write, and how to read them.
 *
 * @code
 * const EventText text = ReadEventText("Sending ExecuteButton - ticket: 7, buttonId: 2");
 * // text.role is LineRole::Announces, text.callback ExecuteButton with ticket 7 and button 2, and
 * // text.absent has the third argument: the line does not carry the program.
 * @endcode
 */
#ifndef DESKPLAYER_FIELDLOG_EVENTLINES_H
#define DESKPLAYER_FIELDLOG_EVENTLINES_H

#include <array>
#include <cstdint>
#include <optional>
#include <string_view>

#include "clientkit/callback.h"
#include "output/record.h"

namespace deskplayer
{

/** What a line says about its callback. */
enum class LineRole {
    Announces,          ///< the callback follows
    AnnouncesRevocably, ///< the callback follows unless the next line revokes this one
    AnnouncesInPart,    ///< the callback follows; the next line may complete its arguments
    Revokes,            ///< the callback that the line before announced does not follow
    Completes           ///< the callback follows, and this line has its arguments
};

/** In EventLine::arguments: the value of the conversion is no argument of the callback. */
constexpr std::int8_t NoArgument = -1;

/** A line that an event writes. */
struct EventLine {
    std::string_view format; ///< of printf, as in the navigator's source
    std::string_view head;   ///< the format up to its first conversion
    LineRole role;
    bdmv::CallbackId callback;
    std::array<std::int8_t, 4> arguments; ///< by conversion: the position of the argument it shows

    /** If the event has announced another callback before: what its first line announces. */
    std::optional<bdmv::CallbackId> continues;
};

/** An array of EventLine from begin() to end(), sorted by format. */
struct EventLines {
    const EventLine* first;
    const EventLine* last;

    const EventLine* begin() const { return first; }
    const EventLine* end() const { return last; }
};

/** All lines of all events. */
EventLines AllEventLines();

/** The arguments of its callback that a line does not show. */
ArgumentSet AbsentArguments(const EventLine& line);

/** What a text is. */
enum class EventTextKind {
    Event,   ///< the text of an event's line
    Damaged, ///< begins like the line of an event, but its values cannot be read
    Other    ///< something else
};

/** A text that has been read. */
struct EventText {
    EventTextKind kind = EventTextKind::Other;
    LineRole role = LineRole::Announces;    ///< with EventTextKind::Event only
    std::optional<bdmv::Callback> callback; ///< with EventTextKind::Event only
    ArgumentSet absent;                     ///< these arguments are neutral: zero, false or empty
    std::optional<bdmv::CallbackId> continues; ///< as in EventLine
};

/**
 * Reads the text of a line, without its escapes.
 *
 * A value is read only if the event can have written it so: a number out of the range of its
 * argument, or with a sign or zeros that printf does not write, makes the text damaged.
 */
EventText ReadEventText(std::string_view text);

} // namespace deskplayer

#endif
