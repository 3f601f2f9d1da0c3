#include "output/callbackrecorder.h"

#include <algorithm>
#include <cstddef>
#include <utility>

#include "output/argumentstext.h"

namespace deskplayer
{

void CallbackRecorder::OnCallback(const bdmv::Callback& callback)
{
    Recorded recorded = {NameOf(callback.Id()), {}};
    for (const ArgumentText& argument : ArgumentTexts({Ticks(), callback, {}})) {
        recorded.arguments.push_back(std::string(argument.name) + "=" + argument.value);
    }
    m_Callbacks.push_back(std::move(recorded));
}

bool CallbackRecorder::Contains(std::string_view name,
                                const std::vector<std::string>& arguments) const
{
    return std::any_of(m_Callbacks.begin(), m_Callbacks.end(), [&](const Recorded& recorded) {
        const std::vector<std::string>& all = recorded.arguments;
        return recorded.name == name &&
               std::all_of(arguments.begin(), arguments.end(), [&all](const std::string& argument) {
                   return std::find(all.begin(), all.end(), argument) != all.end();
               });
    });
}

std::string CallbackRecorder::Text() const
{
    constexpr std::size_t shownAtEachEnd = 20;
    const std::size_t count = m_Callbacks.size();
    std::string text;
    for (std::size_t index = 0; index < count; ++index) {
        const char* const separator = index == 0 ? "" : ", ";
        if (index == shownAtEachEnd && count > 2 * shownAtEachEnd) {
            const std::size_t hidden = count - 2 * shownAtEachEnd;
            text += separator + std::to_string(hidden) + " more";
            index += hidden - 1;
            continue;
        }
        text.append(separator).append(m_Callbacks[index].name);
        for (const std::string& argument : m_Callbacks[index].arguments) {
            text += " " + argument;
        }
    }
    return text.empty() ? "nothing" : text;
}

} // namespace deskplayer
