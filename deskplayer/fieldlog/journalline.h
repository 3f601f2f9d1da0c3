/**
 * @file
 * Lines that journalctl exports as JSON.
 */
#ifndef DESKPLAYER_FIELDLOG_JOURNALLINE_H
#define DESKPLAYER_FIELDLOG_JOURNALLINE_H

#include <optional>
#include <string>
#include <string_view>

#include "fieldlog/logline.h"

namespace deskplayer
{

/** Reads the lines of `journalctl -o json`, and keeps the parts of the last one. */
class JournalLineReader
{
public:
    /** @return nothing if the line is none; the parts are valid until the next call */
    std::optional<LogLine> Read(std::string_view text);

private:
    std::string m_Message;
    std::string m_Process;
    std::string m_Time;
};

} // namespace deskplayer

#endif
