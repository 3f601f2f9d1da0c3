/**
 * @file
 * Writes callbacks as lines of JSON, as docs/outputs.md describes them, without allocating.
 *
 * @code
 * void Append(void* user, const char* bytes, std::size_t size)
 * {
 *     static_cast<std::string*>(user)->append(bytes, size);
 * }
 *
 * std::string text;
 * bdmv::WriteJsonLine(2610000, bdmv::callbacks::ChapterNumber{2}, Append, &text);
 * // {"ticks":2610000,"time":"00:00:58.000","interface":"settings","callback":"ChapterNumber",
 * // "arguments":{"chapter":2}} and a line end, without the line break shown here
 * @endcode
 *
 * The same callback gives the same bytes on every target and in every locale. Any thread may call
 * everything here.
 */
#ifndef CLIENTKIT_JSONLINE_H
#define CLIENTKIT_JSONLINE_H

#include <cstddef>
#include <type_traits>

#include "clientkit/callback.h"
#include "clientkit/names.h"

namespace bdmv
{

/**
 * Receives JSON in pieces, in order.
 *
 * @param user  what the caller of the writing function passed
 * @param bytes not terminated; valid during the call
 * @param size  at least 1
 */
typedef void (*JsonSink)(void* user, const char* bytes, std::size_t size);

/**
 * Composes one line, for recordings that keep arguments in another form or have gaps;
 * WriteJsonLine() suffices for a callback.
 *
 * A line is passed on once its buffer is full and at its end: a line of up to 512 bytes, line end
 * included, is one piece, and no piece has parts of two lines. An exception from the sink leaves
 * the operation; the object must not be used afterwards.
 */
class JsonLine
{
public:
    /** Passes lines to @p sink, with @p user. */
    JsonLine(JsonSink sink, void* user);

    JsonLine(const JsonLine&) = delete;
    JsonLine& operator=(const JsonLine&) = delete;

    /** Begins the line of a callback. Its arguments follow, then End(). */
    void Begin(bd::UInt64 ticks, CallbackId id);

    /**
     * Adds an argument. This is a visitor for Callback::VisitArguments().
     *
     * @param name  printable ASCII without quotes and backslashes
     * @param value of any type that an argument has
     */
    template <typename Value> void operator()(const char* name, const Value& value)
    {
        AddName(name);
        Add(value);
    }

    /** Begins a block of bytes. AddBytes() any number of times follows, then EndBytes(). */
    void BeginBytes(const char* name);

    /** Adds bytes to the block. */
    void AddBytes(const bd::UInt8* bytes, std::size_t size);

    /** Ends the block. */
    void EndBytes();

    /** Ends the line of a callback. */
    void End();

    /**
     * Writes a whole line for callbacks that are missing from a recording.
     *
     * @param ticks session time of the first callback after them, in 45 kHz ticks
     * @param lost  the number of missing callbacks
     * @param cause why they are missing: printable ASCII without quotes and backslashes
     */
    void Gap(bd::UInt64 ticks, bd::UInt64 lost, const char* cause);

    /** The same without a number, which is unknown. */
    void Gap(bd::UInt64 ticks, const char* cause);

private:
    void BeginGap(bd::UInt64 ticks);
    void EndGap(const char* cause);
    void AddName(const char* name);

    void Add(bool value);
    void Add(bd::TimePosition value);
    void Add(const bd::ZoomRectangleDef& value);
    void Add(const UOMaskTable& value);
    void Add(const Bytes& value);
    void Add(const IProgramData::RefPtr& value);

    template <typename Number>
    typename std::enable_if<std::is_unsigned<Number>::value>::type Add(Number value)
    {
        AddNumber(value);
    }

    template <typename Enumeration>
    typename std::enable_if<std::is_enum<Enumeration>::value>::type Add(Enumeration value)
    {
        AddEnumerator(NameOf(value), value);
    }

    void AddEnumerator(const char* name, bd::Int64 value);
    void AddNumber(bd::UInt64 number, int digits = 1);
    void AddTime(bd::UInt64 ticks);
    void AddText(const char* text);
    void AddByte(char byte);
    void Flush();

    const JsonSink m_Sink;
    void* const m_pUser;
    const char* m_pSeparator; ///< before the next argument
    std::size_t m_Size;       ///< bytes in the buffer
    char m_Buffer[512];
};

/**
 * Writes one line for a callback.
 *
 * A mask is written as it is reported at this moment, with ::g_u1Bduopmask. A program is written as
 * the number of its commands, which calls the program.
 *
 * @param ticks session time, in 45 kHz ticks
 * @throw whatever the sink throws
 */
void WriteJsonLine(bd::UInt64 ticks, const Callback& callback, JsonSink sink, void* user);

} // namespace bdmv

#endif
