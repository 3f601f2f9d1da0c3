/**
 * @file
 * The reference of the events, parsed into values.
 */
#ifndef DOCS_EVENTSREFERENCE_H
#define DOCS_EVENTSREFERENCE_H

#include <string>
#include <utility>
#include <vector>

#include "docs/markdown.h"

/** A variable of a query: its name and its preset; empty if it has none. */
typedef std::pair<std::string, std::string> Variable;

/**
 * One step of an event as a section describes it.
 *
 *     4. If `fg2ndVid`: **log** `Sending AudioInfo - audioNr: %u`: `%u` `number`
 *           condition    action  code                              explanation
 */
struct Step {
    std::string condition; ///< empty when there is none
    std::string action;    ///< query, log, callback and the like
    std::string code;      ///< the query, log line or callback; empty for an end
    std::string explanation;
    std::vector<std::string> bullets; ///< nested below it

    /** The code without the parentheses after a name; for a log line the whole code. */
    std::string Subject() const;

    /** The variables of a query, in order. */
    std::vector<Variable> Variables() const;
};

/** A section about an event. */
struct EventSection {
    std::string title; ///< "5. ContinuedEvent"
    std::string event; ///< the title without its number
    std::string firstSentence;
    std::vector<Step> steps;
    std::vector<TableRow> table;
};

/** docs/events.md. */
struct EventsReference {
    std::vector<Chapter> chapters;
    std::vector<EventSection> sections; ///< in order

    /** @throw std::runtime_error there is no such chapter */
    const Chapter& ChapterOf(const std::string& title) const;

    /** @throw std::runtime_error there is no such section */
    const EventSection& SectionOf(const std::string& event) const;
};

/** @throw std::runtime_error the document cannot be read */
EventsReference ReadEventsReference();

#endif
