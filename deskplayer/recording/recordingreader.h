/**
 * @file
 * Reads recordings: JSON lines with callbacks, gaps and starts.
 *
 * @code
 * RecordingReader reader(stream, "evening.jsonl");
 * while (reader.Next(output)) {
 * }
 * @endcode
 */
#ifndef DESKPLAYER_RECORDING_RECORDINGREADER_H
#define DESKPLAYER_RECORDING_RECORDINGREADER_H

#include <cstddef>
#include <cstdint>
#include <istream>
#include <string>
#include <vector>

#include "deskplayer/errors.h"
#include "output/record.h"

namespace deskplayer
{

/** Bytes of the longest line of a recording, without its end. */
constexpr std::size_t LongestRecordLine = std::size_t{1024} * 1024;

/** Reads a recording line by line. Its memory does not grow with the recording. */
class RecordingReader
{
public:
    /**
     * @param stream does not throw, and must outlive the reader
     * @param name   of the recording in messages
     */
    RecordingReader(std::istream& stream, const std::string& name);

    /**
     * Reads the next line and passes it on. The record lives for the duration of the call.
     *
     * @return false at the end of the recording
     * @throw RecordingError the line cannot be read; the reader must not be used afterwards
     * @throw whatever the listener throws
     */
    bool Next(RecordListener& listener);

    /** Where the last line is, for messages: "evening.jsonl:3". */
    std::string Place() const;

private:
    bool ReadLine();

    const std::string m_Name; ///< printable
    std::istream& m_rStream;
    std::string m_Line;
    std::uint64_t m_Number = 0; ///< of the last line
    std::vector<bd::UInt8> m_Block;
};

} // namespace deskplayer

#endif
