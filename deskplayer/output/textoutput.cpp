#include "output/textoutput.h"

#include <unistd.h>

#include "text/timetext.h"

namespace deskplayer
{

namespace
{

/** The length of PresentationGraphicsDisplay, the longest name of a callback with arguments. */
constexpr std::size_t NameWidth = 27;

// Control sequences of a terminal.
constexpr const char* Reset = "\033[0m";
constexpr const char* Dim = "\033[2m";
constexpr const char* Red = "\033[31m";
constexpr const char* Green = "\033[32m";
constexpr const char* Yellow = "\033[33m";
constexpr const char* Magenta = "\033[35m";
constexpr const char* Cyan = "\033[36m";

/** Indexed by bdmv::ListenerInterface. */
constexpr const char* Colours[] = {Green, Cyan, Yellow, Magenta};

} // namespace

TextOutput::TextOutput(std::ostream& stream, const VirtualClock& clock, const OutputFilter& filter,
                       bool coloured)
    : Output(stream, clock, filter), m_Coloured(coloured)
{
}

void TextOutput::Write(const CallbackRecord& record)
{
    const bdmv::CallbackId id = record.callback.Id();
    WriteLine(record.time, NameOf(id), Colours[InterfaceOf(id)], ArgumentTexts(record));
}

void TextOutput::Write(const GapRecord& gap)
{
    std::vector<ArgumentText> arguments;
    if (gap.lost) {
        arguments.push_back({"lost", std::to_string(*gap.lost)});
    }
    arguments.push_back({"cause", gap.cause});
    WriteLine(gap.time, "(gap)", Red, arguments);
}

void TextOutput::Write(const StartRecord& start)
{
    Paint(TimeText(start.time), Dim);
    Stream() << "  (start) at " << start.wallClock << '\n';
}

void TextOutput::WriteLine(Ticks time, std::string_view name, const char* colour,
                           const std::vector<ArgumentText>& arguments)
{
    Paint(TimeText(time), Dim);
    Stream() << "  ";
    Paint(name, colour);
    if (!arguments.empty()) {
        Stream() << std::string(NameWidth - name.size(), ' ');
    }
    for (const ArgumentText& argument : arguments) {
        Stream() << ' ';
        Paint(std::string(argument.name) + "=", Dim);
        Stream() << argument.value;
    }
    Stream() << '\n';
}

void TextOutput::Paint(std::string_view text, const char* colour)
{
    if (m_Coloured) {
        Stream() << colour << text << Reset;
    } else {
        Stream() << text;
    }
}

bool WantsColours(int fileDescriptor, const char* noColor, const char* terminal)
{
    const bool forbidden = noColor != nullptr && *noColor != '\0';
    const bool isDumb = terminal != nullptr && std::string_view(terminal) == "dumb";
    return !forbidden && !isDumb && isatty(fileDescriptor) == 1;
}

} // namespace deskplayer
