#include "docs/eventsreference.h"

#include <regex>
#include <stdexcept>

namespace
{

/** An item with another form or number becomes a step that matches nothing that happens. */
Step ParseStep(const std::vector<std::string>& item, std::size_t number)
{
    static const std::regex form("([0-9]+)\\. (?:If (.*?): )?\\*\\*([^*]+)\\*\\*(?: `([^`]+)`)?"
                                 "(?:: (.*))?");
    std::smatch match;
    if (!std::regex_match(item.front(), match, form) || match[1] != std::to_string(number)) {
        return {"", "unreadable:", item.front(), "", {}};
    }
    return {match[2], match[3], match[4], match[5], {item.begin() + 1, item.end()}};
}

EventSection ParseSection(const Chapter& chapter)
{
    EventSection section;
    section.title = chapter.title;
    section.event = chapter.title.substr(chapter.title.find(' ') + 1);
    section.firstSentence = chapter.lines.size() > 1 ? chapter.lines[1] : "";
    for (const std::vector<std::string>& item : chapter.NumberedItems()) {
        section.steps.push_back(ParseStep(item, section.steps.size() + 1));
    }
    section.table = chapter.TableRows();
    return section;
}

} // namespace

std::string Step::Subject() const
{
    return StartsWith(action, "log") || action == "assert" ? code : code.substr(0, code.find('('));
}

std::vector<Variable> Step::Variables() const
{
    std::vector<Variable> variables;
    static const std::regex form("(\\w+)(?: = ([^,)]+))?[,)]");
    const std::string list = code.substr(code.find('(') + 1);
    for (std::sregex_iterator i(list.begin(), list.end(), form), end; i != end; ++i) {
        variables.emplace_back((*i)[1], (*i)[2]);
    }
    return variables;
}

const Chapter& EventsReference::ChapterOf(const std::string& title) const
{
    for (const Chapter& chapter : chapters) {
        if (chapter.title == title) {
            return chapter;
        }
    }
    throw std::runtime_error("there is no chapter " + title);
}

const EventSection& EventsReference::SectionOf(const std::string& event) const
{
    for (const EventSection& section : sections) {
        if (section.event == event) {
            return section;
        }
    }
    throw std::runtime_error("there is no section about " + event);
}

EventsReference ReadEventsReference()
{
    EventsReference reference;
    reference.chapters = ReadMarkdown(BDMVNAVIGATOR_EVENTS_REFERENCE);
    for (const Chapter& chapter : reference.chapters) {
        if (chapter.level == 3) {
            reference.sections.push_back(ParseSection(chapter));
        }
    }
    return reference;
}
