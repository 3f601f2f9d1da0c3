/**
 * @file
 * What the events really do, in enough situations to see all of it.
 */
#ifndef DOCS_HAPPENINGS_H
#define DOCS_HAPPENINGS_H

#include <functional>
#include <string>
#include <vector>

#include "bdmv/bdmvnavigator/allevents.h"
#include "support/scriptableplaybackcontext.h"

typedef bdmvtest::ScriptablePlaybackContext Context;

/** One thing that an event did, in the words of the reference. */
struct Happening {
    std::string action;               ///< query, log, callback and the like
    std::string subject;              ///< the operation, the format, the callback
    std::vector<std::string> values;  ///< a query's variables when it was asked, what a line shows,
                                      ///< a callback's arguments
    std::vector<std::string> answers; ///< a query's variables when it was answered
};

/** What the context holds. */
struct Situation {
    std::string name;
    std::function<void(Context&)> arrange;
};

/** Every way an event may go is taken in one of them. */
std::vector<Situation> AllSituations();

/** Holds a trigger situation, with a trigger of its own set. */
Situation TriggerSituation(bd::TriggerType kind, bd::TriggerType abState,
                           bd::TriggerType chpTitleState);

/** A context in which all numbers differ, and then the situation. */
void Arrange(Context& context, const Situation& situation);

/** Dispatches an event of the class to one listener, with the log on. */
std::vector<Happening> WhatHappens(const EventClass& event, const Situation& situation);

/** The printf conversions of a format, in order. */
std::vector<std::string> Conversions(const std::string& format);

#endif
