#include "output/argumentsjson.h"

#include "bd/constants.h"

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

ordered_json ArgumentsJson(const Callback& callback)
{
    ordered_json arguments = ordered_json::object();
    for (const Argument& argument : callback.arguments) {
        arguments[argument.name] =
            std::visit([](const auto& value) { return ToJson(value); }, argument.value);
    }
    return arguments;
}

} // namespace deskplayer
