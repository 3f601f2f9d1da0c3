#include "output/argumentsjson.h"

#include "bd/constants.h"
#include "output/arguments.h"

namespace deskplayer
{

namespace
{

using nlohmann::ordered_json;

template <typename Value> ordered_json ToJson(const Value& value)
{
    return value;
}

ordered_json ToJson(Position position)
{
    return position.ticks == bd::TimePositionNone ? ordered_json() : ordered_json(position.ticks);
}

ordered_json ToJson(const bd::ZoomRectangleDef& rectangle)
{
    return {{"x", rectangle.X},
            {"y", rectangle.Y},
            {"width", rectangle.Width},
            {"height", rectangle.Height}};
}

} // namespace

ordered_json ArgumentsJson(const CallbackRecord& record)
{
    ordered_json arguments = ordered_json::object();
    VisitShownArguments(record, [&arguments](const char* name, const auto& value) {
        arguments[name] = ToJson(value);
    });
    return arguments;
}

} // namespace deskplayer
