// Reads any bytes as a session script.

#include <vector>

#include "expect.h"
#include "session/script.h"

namespace
{

using namespace deskplayer;

/** Every kind of similarity between patterns, and every placeholder. */
const std::vector<CommandSyntax> Syntaxes = {
    {"play", ""},
    {"chapter next", ""},
    {"chapter previous", ""},
    {"chapter NUMBER", ""},
    {"seek TIME", ""},
    {"forward", ""},
    {"subtitle on", ""},
    {"forward fast NUMBER", ""},
    {"subtitle NUMBER", ""},
    {"subtitle style NUMBER", ""},
    {"repeat TIME to TIME times NUMBER", ""},
};

/** The number of values of each pattern. */
const std::vector<std::size_t> ValueCounts = {0, 0, 0, 1, 1, 0, 0, 1, 1, 1, 3};

void ExpectSteps(const std::vector<ScriptStep>& steps)
{
    ScriptStep before;
    for (const ScriptStep& step : steps) {
        fuzz::Expect(step.line > before.line);
        fuzz::Expect(step.time >= before.time && step.time <= LongestSession);
        fuzz::Expect(step.values.size() == ValueCounts.at(step.command));
        for (const std::uint64_t value : step.values) {
            fuzz::Expect(value <= LongestSession.count());
        }
        before = step;
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    const std::string_view text(reinterpret_cast<const char*>(data), size);
    try {
        ExpectSteps(ParseScript(text, "file", Syntaxes));
    } catch (const ScriptError& error) {
        fuzz::ExpectPrintableLine(error.what());
    }
    return 0;
}
