/**
 * @file
 * Callbacks as a page for a browser.
 */
#ifndef DESKPLAYER_OUTPUT_HTMLOUTPUT_H
#define DESKPLAYER_OUTPUT_HTMLOUTPUT_H

#include <functional>
#include <memory>
#include <optional>
#include <ostream>
#include <string>

#include "output/jsonoutput.h"
#include "output/output.h"
#include "output/recordingelement.h"

namespace deskplayer
{

/** What a page contains besides the recording. */
struct PageFrame {
    std::string head; ///< up to the recording
    std::string tail; ///< after the last recording

    /** Writes the elements of further recordings. May be empty. */
    std::function<void(std::ostream& page)> writeOthers;
};

/**
 * Writes a page that contains a recording: the lines that JsonOutput writes, in a RecordingElement.
 *
 * The page is complete once the output is destroyed. Memory does not grow with the length of the
 * recording.
 */
class HtmlOutput : public Output
{
public:
    /**
     * @copydoc Output::Output
     * @param name  of the recording, for people
     * @param frame not null
     */
    HtmlOutput(std::ostream& stream, const VirtualClock& clock, const OutputFilter& filter,
               const std::string& name, std::shared_ptr<const PageFrame> frame);

    /** Completes the page. */
    ~HtmlOutput() override;

private:
    void Write(const CallbackRecord& record) override { Lines().OnRecord(record); }
    void Write(const GapRecord& gap) override { Lines().OnGap(gap); }
    void Write(const StartRecord& start) override { Lines().OnStart(start); }

    RecordListener& Lines() { return *m_Lines; }

    const std::shared_ptr<const PageFrame> m_pFrame;
    std::optional<RecordingElement> m_Element;
    std::optional<JsonOutput> m_Lines;
};

} // namespace deskplayer

#endif
