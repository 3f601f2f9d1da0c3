/**
 * @file
 * The common part of the fuzz targets for files of a disc.
 */
#ifndef FUZZ_DISCFILE_H
#define FUZZ_DISCFILE_H

#include <cstddef>
#include <cstdint>
#include <string>

#include "disc/bytereader.h"
#include "disc/errors.h"
#include "expect.h"

namespace fuzz
{

/**
 * Passes a file of these bytes to @p use, which reads it and works with its contents. It may refuse
 * the file with FormatError; any other exception ends the program as a finding.
 *
 * @return what LLVMFuzzerTestOneInput() returns
 */
template <typename Use> int OnDiscFile(const std::uint8_t* data, std::size_t size, Use use)
{
    const deskplayer::Bytes bytes(data, data + size);
    const std::string fileName = "file";
    try {
        use(bytes, fileName);
    } catch (const deskplayer::FormatError& error) {
        ExpectPrintableLine(error.what());
        Expect(error.Offset() <= size);
    }
    return 0;
}

} // namespace fuzz

#endif
