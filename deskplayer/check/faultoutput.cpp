#include "check/faultoutput.h"

#include <nlohmann/json.hpp>

#include "disc/errors.h"
#include "text/printable.h"

namespace deskplayer
{

namespace
{

using nlohmann::ordered_json;

/** The message of the error that the reader throws for such a fault. */
std::string MessageOf(const Fault& fault)
{
    if (fault.offset) {
        return FormatError(fault.file, *fault.offset, fault.found, fault.expected).what();
    }
    return fault.expected.empty() ? FileError(fault.file, fault.found).what()
                                  : FileError(fault.file, fault.found, fault.expected).what();
}

ordered_json OrNull(const std::string& text)
{
    return text.empty() ? ordered_json() : ordered_json(text);
}

} // namespace

void WriteFault(std::ostream& output, const Fault& fault)
{
    output << MessageOf(fault) << '\n';
}

void WriteFaultAsJson(std::ostream& output, const Fault& fault)
{
    const ordered_json json = {
        {"file", Printable(fault.file)},
        {"offset", fault.offset ? ordered_json(*fault.offset) : ordered_json()},
        {"found", OrNull(fault.found)},
        {"expected", OrNull(fault.expected)}};
    output << json.dump() << '\n';
}

} // namespace deskplayer
