/**
 * @file
 * The actual effects of the events, in enough situations to see all of them.
 */
#ifndef DOCS_EFFECTS_H
#define DOCS_EFFECTS_H

#include <functional>
#include <string>
#include <vector>

#include "bdmv/bdmvnavigator/allevents.h"
#include "testkit/scriptableplaybackcontext.h"

typedef bdmvtest::ScriptablePlaybackContext Context;

/** One action of an event, in the words of the reference. */
struct Effect {
    std::string action;               ///< query, log, callback and the like
    std::string subject;              ///< the operation, the format, the callback
    std::vector<std::string> values;  ///< a query's variables before it, the values in a line, or
                                      ///< a callback's arguments
    std::vector<std::string> answers; ///< a query's variables after it
};

/** A state of the context. */
struct Situation {
    std::string name;
    std::function<void(Context&)> arrange;
};

/** Together they cover every path of every event. */
std::vector<Situation> AllSituations();

/** A situation with a trigger kind and repeat states, and another trigger set. */
Situation TriggerSituation(bd::TriggerType kind, bd::TriggerType abState,
                           bd::TriggerType chpTitleState);

/** Makes all numbers of the context differ, then applies the situation. */
void Arrange(Context& context, const Situation& situation);

/** Dispatches an event of the class to one listener, with the log on. */
std::vector<Effect> EffectsOf(const EventClass& event, const Situation& situation);

/** The printf conversions of a format, in order. */
std::vector<std::string> Conversions(const std::string& format);

#endif
