#include <algorithm>
#include <array>
#include <atomic>
#include <mutex>
#include <optional>

#include "bd/logging.h"
#include "kevro/kevro_log.h"
#include "kevro_linux.h"
#include "names.h"
#include "settings.h"

namespace kevro
{

namespace
{

/** The levels that are on: bit n for level n, bit n + HiFreqShift for its high-frequency lines. */
using LevelSet = KEVRO_UInt32;

constexpr int HiFreqShift = 16;
static_assert(KEVRO_Log_Level__sizeof <= HiFreqShift, "two bits per level");

constexpr LevelSet Bit(KEVRO_UInt32 level)
{
    return LevelSet{1} << level;
}

constexpr LevelSet AllLevels = Bit(KEVRO_Log_Level__sizeof) - 1;
constexpr LevelSet DefaultLevels =
    Bit(KEVRO_Log_LevelException) | Bit(KEVRO_Log_LevelWarning) | Bit(KEVRO_Log_LevelFatal);

constexpr KEVRO_UInt32 FirstComponent = bd::CompIdBdavArchiver;
constexpr KEVRO_UInt32 ComponentCount = bd::CompId__sizeof - FirstComponent;

/** The index of a component in the table; numbers outside the list share the last entry. */
constexpr std::size_t IndexOf(KEVRO_UInt32 component)
{
    return std::min(component - FirstComponent, ComponentCount);
}

struct SwitchWord {
    // Initialised at compile time, so that it is valid for the first constructor that logs.
    std::atomic<LevelSet> levels{DefaultLevels};
};

SwitchWord g_Switch[ComponentCount + 1];
std::mutex g_ConfigureMutex;

/** Refuses a word that is not a name in the list, and suggests a similar name. */
[[noreturn]] void RefuseName(const Word& word, const Names& names, const std::string& expected)
{
    const Names::Entry* const similar = names.FindSimilar(word.text);
    word.Refuse(similar == nullptr ? expected : expected + "; did you mean " + similar->name + "?");
}

/** The index of the component that a word names, or nothing if it names all. */
std::optional<std::size_t> ReadComponent(const Word& word)
{
    if (word.text == "*") {
        return std::nullopt;
    }
    const Names::Entry* const component = Components.Find(word.text);
    if (component == nullptr) {
        RefuseName(word, Components, "a component or *");
    }
    return IndexOf(component->number);
}

LevelSet ReadLevel(const Word& word)
{
    const std::vector<Word> parts = word.Split('+');
    const Word& name = parts[0];
    LevelSet levels = AllLevels;
    if (name.text != "*") {
        const Names::Entry* const level = Levels.Find(name.text);
        if (level == nullptr) {
            RefuseName(name, Levels, "a level or *");
        }
        levels = Bit(level->number);
    }
    if (parts.size() > 2) {
        word.Refuse("at most one + after a level");
    }
    if (parts.size() == 2) {
        if (parts[1].text != "hifreq") {
            parts[1].Refuse("hifreq");
        }
        levels |= levels << HiFreqShift;
    }
    return levels;
}

void Configure(const char* text)
{
    std::array<std::optional<LevelSet>, ComponentCount> named;
    LevelSet others = 0;

    const Word whole = Word::Whole(text);
    const std::vector<Word> entries = whole.text.empty() ? std::vector<Word>() : whole.Split(',');
    for (const Word& entry : entries) {
        const std::vector<Word> sides = entry.Split('=');
        const std::optional<std::size_t> index = ReadComponent(sides[0]);
        if (sides.size() != 2) {
            entry.Refuse("COMPONENT=LEVEL[|LEVEL...]");
        }
        LevelSet levels = 0;
        for (const Word& level : sides[1].Split('|')) {
            levels |= ReadLevel(level);
        }
        if (index) {
            named[*index] = named[*index].value_or(0) | levels;
        } else {
            others |= levels;
        }
    }

    const std::lock_guard<std::mutex> lock(g_ConfigureMutex);
    for (std::size_t index = 0; index < named.size(); ++index) {
        g_Switch[index].levels.store(named[index].value_or(others), std::memory_order_relaxed);
    }
    g_Switch[ComponentCount].levels.store(others, std::memory_order_relaxed);
}

[[maybe_unused]] const bool g_ConfiguredAtStart = ApplyEnvironment("KEVRO_LOG", Configure);

} // namespace

} // namespace kevro

KEVRO_Bool KEVRO_Log_IsEnabled(KEVRO_UInt32 component, KEVRO_Int32 level, KEVRO_Bool hiFreq)
{
    const auto number = static_cast<KEVRO_UInt32>(level); // a negative level exceeds all others
    if (number >= KEVRO_Log_Level__sizeof) {
        return 0;
    }
    const kevro::LevelSet levels =
        kevro::g_Switch[kevro::IndexOf(component)].levels.load(std::memory_order_relaxed);
    return static_cast<KEVRO_Bool>(
        (levels >> (hiFreq != 0 ? number + kevro::HiFreqShift : number)) & 1);
}

bool KEVRO_Log_Configure(const char* text, char* message, size_t messageSize)
{
    return kevro::Apply(kevro::Configure, text, message, messageSize);
}
