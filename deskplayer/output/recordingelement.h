/**
 * @file
 * A recording as an element of a page.
 */
#ifndef DESKPLAYER_OUTPUT_RECORDINGELEMENT_H
#define DESKPLAYER_OUTPUT_RECORDINGELEMENT_H

#include <ostream>
#include <streambuf>
#include <string>

namespace deskplayer
{

/** Passes JSON on to a page, which would take `<` for the beginning of a tag. */
class ScriptBuffer : public std::streambuf
{
public:
    /** @param page must outlive the buffer */
    explicit ScriptBuffer(std::ostream& page) : m_rPage(page) {}

    ScriptBuffer(const ScriptBuffer&) = delete;
    ScriptBuffer& operator=(const ScriptBuffer&) = delete;

protected:
    int_type overflow(int_type character) override;
    std::streamsize xsputn(const char* text, std::streamsize size) override;

private:
    std::ostream& m_rPage;
};

/**
 * The element of a page that contains a recording. Its start tag is written when the object is
 * constructed, its end tag when it is destroyed.
 *
 * The JSON of the lines keeps its meaning: `<` is written as `\u003c`, because it occurs in strings
 * only.
 */
class RecordingElement
{
public:
    /**
     * @param page does not throw, and must outlive the element
     * @param name of the recording, for people
     */
    RecordingElement(std::ostream& page, const std::string& name);
    ~RecordingElement();

    RecordingElement(const RecordingElement&) = delete;
    RecordingElement& operator=(const RecordingElement&) = delete;

    /** Receives the JSON lines of the recording. Never buffers. */
    std::ostream& Lines() { return m_Lines; }

private:
    std::ostream& m_rPage;
    ScriptBuffer m_Buffer;
    std::ostream m_Lines;
};

} // namespace deskplayer

#endif
