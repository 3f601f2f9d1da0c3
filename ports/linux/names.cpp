#include "names.h"

#include <algorithm>
#include <cctype>
#include <numeric>
#include <string>
#include <vector>

#include "bd/logging.h"

namespace kevro
{

namespace
{

#define KEVRO_COMPONENT(name)                                                                      \
    {                                                                                              \
        static_cast<KEVRO_UInt32>(bd::CompId##name), #name                                         \
    }
constexpr Names::Entry ComponentEntries[] = {
    KEVRO_COMPONENT(BdavArchiver),
    KEVRO_COMPONENT(BdavDiscManager),
    KEVRO_COMPONENT(BdavEditor),
    KEVRO_COMPONENT(BdavInformation),
    KEVRO_COMPONENT(BdavNavigator),
    KEVRO_COMPONENT(BdavReplicator),
    KEVRO_COMPONENT(BdavSystem),
    KEVRO_COMPONENT(BdavFactory),
    KEVRO_COMPONENT(BdavDatabase),
    KEVRO_COMPONENT(Common),
    KEVRO_COMPONENT(FileManager),
    KEVRO_COMPONENT(ImageProcessor),
    KEVRO_COMPONENT(Scheduler),
    KEVRO_COMPONENT(Streamer),
    KEVRO_COMPONENT(Decoder),
    KEVRO_COMPONENT(StreamGateway),
    KEVRO_COMPONENT(StreamParser),
    KEVRO_COMPONENT(IgDecoder),
    KEVRO_COMPONENT(PgDecoder),
    KEVRO_COMPONENT(TsDecoder),
    KEVRO_COMPONENT(Reader),
    KEVRO_COMPONENT(Test),
    KEVRO_COMPONENT(BdmvDiscManager),
    KEVRO_COMPONENT(BdmvInformation),
    KEVRO_COMPONENT(BdmvNavigator),
    KEVRO_COMPONENT(BdmvSystem),
    KEVRO_COMPONENT(BdmvFactory),
    KEVRO_COMPONENT(BdmvDatabase),
    KEVRO_COMPONENT(BdmvUserEventManager),
    KEVRO_COMPONENT(BdmvHdmv),
    KEVRO_COMPONENT(BdmvCommandProcessor),
    KEVRO_COMPONENT(BdmvModuleManager),
    KEVRO_COMPONENT(BdmvCache),
    KEVRO_COMPONENT(BdmvJavaModule),
    KEVRO_COMPONENT(JpiConnector),
    KEVRO_COMPONENT(JbiConnector),
    KEVRO_COMPONENT(BdioSystem),
    KEVRO_COMPONENT(BdioDiscRecognition),
    KEVRO_COMPONENT(BdioVfs),
    KEVRO_COMPONENT(BdSystem),
    KEVRO_COMPONENT(Bdj),
    KEVRO_COMPONENT(BdmvBdjAdapter),
    KEVRO_COMPONENT(Jpi),
    KEVRO_COMPONENT(JbiGraphics),
    KEVRO_COMPONENT(JbiIo),
    KEVRO_COMPONENT(JbiMedia),
    KEVRO_COMPONENT(JbiMisc),
    KEVRO_COMPONENT(JbiOsa),
    KEVRO_COMPONENT(JbiTi),
};
#undef KEVRO_COMPONENT

#define KEVRO_LEVEL(name)                                                                          \
    {                                                                                              \
        static_cast<KEVRO_UInt32>(bd::Log##name), #name                                            \
    }
constexpr Names::Entry LevelEntries[] = {
    KEVRO_LEVEL(Method),  KEVRO_LEVEL(Interface), KEVRO_LEVEL(Exception), KEVRO_LEVEL(Warning),
    KEVRO_LEVEL(State),   KEVRO_LEVEL(Event),     KEVRO_LEVEL(Info),      KEVRO_LEVEL(Free1),
    KEVRO_LEVEL(Free2),   KEVRO_LEVEL(Free3),     KEVRO_LEVEL(Free4),     KEVRO_LEVEL(Default),
    KEVRO_LEVEL(Runtime), KEVRO_LEVEL(Fatal),
};
#undef KEVRO_LEVEL

char Lower(char c)
{
    return static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
}

/** The number of letters to change, insert or delete to turn one word into the other. */
std::size_t Distance(std::string_view from, std::string_view to)
{
    std::vector<std::size_t> row(to.size() + 1);
    std::iota(row.begin(), row.end(), std::size_t{0});
    for (std::size_t i = 0; i < from.size(); ++i) {
        std::size_t diagonal = row[0];
        row[0] = i + 1;
        for (std::size_t j = 0; j < to.size(); ++j) {
            const std::size_t change = diagonal + (Lower(from[i]) == Lower(to[j]) ? 0 : 1);
            diagonal = row[j + 1];
            row[j + 1] = std::min({change, diagonal + 1, row[j] + 1});
        }
    }
    return row.back();
}

} // namespace

const Names::Entry* Names::Find(KEVRO_UInt32 number) const
{
    const Entry* found =
        std::find_if(begin(), end(), [&](const Entry& entry) { return entry.number == number; });
    return found == end() ? nullptr : found;
}

const Names::Entry* Names::Find(std::string_view name) const
{
    const Entry* found =
        std::find_if(begin(), end(), [&](const Entry& entry) { return entry.name == name; });
    return found == end() ? nullptr : found;
}

const Names::Entry* Names::FindSimilar(std::string_view word) const
{
    const Entry* similar = nullptr;
    // With more than a third of the letters wrong it is another word, not a typing error.
    std::size_t bound = word.size() / 3 + 1;
    for (const Entry& entry : *this) {
        const std::size_t distance = Distance(word, entry.name);
        if (distance < bound) {
            bound = distance;
            similar = &entry;
        }
    }
    return similar;
}

const Names Components(ComponentEntries);
const Names Levels(LevelEntries);

} // namespace kevro
