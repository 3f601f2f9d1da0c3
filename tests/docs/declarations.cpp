#include "docs/declarations.h"

#include <regex>
#include <sstream>
#include <stdexcept>

#include "docs/markdown.h"

namespace
{

/** The words of a header, separated by single blanks. */
std::string Header(const std::string& name)
{
    std::istringstream words(ReadFile(BDMVNAVIGATOR_SOURCE_DIR "/" + name));
    std::string text;
    for (std::string word; words >> word;) {
        text += word + " ";
    }
    return text;
}

std::map<std::string, std::string> ReadCallbacks()
{
    std::map<std::string, std::string> callbacks;
    for (const char* const concern : {"button", "control", "interactive", "settings"}) {
        const std::string header =
            Header("bdmv/inc/bdmvnavigator/inav" + std::string(concern) + "listener.h");
        for (const std::string& callback :
             AllMatches(header, "virtual void (\\w+\\([^)]*\\)) = 0;")) {
            callbacks[callback.substr(0, callback.find('('))] = callback;
        }
    }
    return callbacks;
}

std::map<std::string, int> AllEnumerators()
{
    std::map<std::string, int> all;
    for (const auto& enumeration : DeclaredEnumerations()) {
        all.insert(enumeration.second.begin(), enumeration.second.end());
    }
    return all;
}

} // namespace

std::vector<std::string> DeclaredEvents()
{
    return AllMatches(Header("bdmv/bdmvnavigator/navigatorevent.h"),
                      "class (\\w+) : public NavigatorEvent ");
}

const std::map<std::string, std::string>& DeclaredCallbacks()
{
    static const std::map<std::string, std::string> callbacks = ReadCallbacks();
    return callbacks;
}

std::map<std::string, std::vector<Enumerator>> DeclaredEnumerations()
{
    std::map<std::string, std::vector<Enumerator>> enumerations;
    const std::string headers =
        Header("inc/bd/types.h") + Header("bdmv/inc/bdmvnavigator/inavcontrollistener.h");
    const std::regex enumeration("enum (\\w+) : KEVRO_Int32 \\{([^}]*)\\}");
    const std::regex enumerator("(\\w+) = (\\d+)");
    for (std::sregex_iterator i(headers.begin(), headers.end(), enumeration), end; i != end; ++i) {
        const std::string body = (*i)[2];
        for (std::sregex_iterator j(body.begin(), body.end(), enumerator); j != end; ++j) {
            enumerations[(*i)[1]].emplace_back((*j)[1], std::stoi((*j)[2]));
        }
    }
    return enumerations;
}

int NumberOf(const std::string& enumerator)
{
    static const std::map<std::string, int> all = AllEnumerators();
    return all.at(enumerator);
}

std::vector<std::string> ParameterNames(const std::string& signature)
{
    return AllMatches(signature.substr(signature.find('(')), "(\\w+)[,)]");
}
