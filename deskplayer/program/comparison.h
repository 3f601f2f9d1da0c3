/**
 * @file
 * The recording that a page shows beside another one.
 */
#ifndef DESKPLAYER_PROGRAM_COMPARISON_H
#define DESKPLAYER_PROGRAM_COMPARISON_H

#include <cstdio>
#include <memory>
#include <ostream>

#include "output/outputfilter.h"
#include "program/options.h"

namespace deskplayer
{

/**
 * The element of a page for the recording to compare with.
 *
 * A recording that is read from a pipe can be read only once, and a fault in it must be found
 * before the output is opened. The element is therefore kept in a temporary file.
 */
class Comparison
{
public:
    /**
     * Reads the recording that the options name.
     *
     * @throw RecordingError it cannot be opened or read
     * @throw OutputError there is no room for the temporary file
     */
    Comparison(const Options& options, const OutputFilter& filter);

    /** Writes the element. @param page fails if the element cannot be read back */
    void WriteTo(std::ostream& page) const;

private:
    struct Close {
        void operator()(std::FILE* file) const { std::fclose(file); }
    };

    std::unique_ptr<std::FILE, Close> m_pFile;
};

} // namespace deskplayer

#endif
