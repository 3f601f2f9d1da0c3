#include "output/consolelistener.h"

#include <iomanip>

#include "bd/constants.h"
#include "output/timetext.h"

namespace deskplayer
{

namespace
{

constexpr int NameWidth = 27; // PresentationGraphicsDisplay

std::string ValueText(bool value)
{
    return value ? "true" : "false";
}

std::string ValueText(std::uint64_t value)
{
    return std::to_string(value);
}

std::string ValueText(Position position)
{
    return position.ticks == bd::TimePositionNone ? "none" : TimeText(position.ticks);
}

const std::string& ValueText(const std::string& value)
{
    return value;
}

} // namespace

ConsoleListener::ConsoleListener(std::ostream& output, const VirtualClock& clock)
    : m_rOutput(output), m_rClock(clock)
{
}

void ConsoleListener::OnCallback(const Callback& callback)
{
    m_rOutput << TimeText(m_rClock.Now()) << "  ";
    if (callback.arguments.empty()) {
        m_rOutput << callback.name;
    } else {
        m_rOutput << std::left << std::setw(NameWidth) << callback.name;
    }
    for (const Argument& argument : callback.arguments) {
        m_rOutput << ' ' << argument.name << '=';
        std::visit([this](const auto& value) { m_rOutput << ValueText(value); }, argument.value);
    }
    m_rOutput << '\n';
}

} // namespace deskplayer
