#include "output/argumentstext.h"

#include "bd/constants.h"
#include "output/arguments.h"
#include "text/timetext.h"

namespace deskplayer
{

namespace
{

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
    return position.ticks == bd::TimePositionNone ? "none" : TimeText(Ticks(position.ticks));
}

std::string ValueText(const std::string& value)
{
    return value;
}

std::string ValueText(const std::vector<std::string>& names)
{
    std::string text;
    for (const std::string& name : names) {
        text += (text.empty() ? "" : ",") + name;
    }
    return text.empty() ? "nothing" : text;
}

std::string ValueText(const bd::ZoomRectangleDef& rectangle)
{
    return std::to_string(rectangle.Width) + "x" + std::to_string(rectangle.Height) + "+" +
           std::to_string(rectangle.X) + "+" + std::to_string(rectangle.Y);
}

} // namespace

std::vector<ArgumentText> ArgumentTexts(const CallbackRecord& record)
{
    std::vector<ArgumentText> texts;
    VisitShownArguments(record, [&texts](const char* name, const auto& value) {
        texts.push_back({name, ValueText(value)});
    });
    return texts;
}

} // namespace deskplayer
