// The reference of the events describes exactly what the events do, in that order.

#include "docs/eventsreference.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <map>
#include <regex>
#include <set>

#include "docs/declarations.h"
#include "docs/effects.h"
#include "testkit/describe.h"

namespace
{

/** The wording of a condition, and when it is true. */
struct Condition {
    const char* wording;
    bool (*holds)(const Context& context);
};

bool RepeatStatesMatter(const Context& context)
{
    return context.triggerTypeByTime == bd::TRIGGER_B ||
           context.triggerTypeByTime == bd::TRIGGER_INVALID;
}

bool RunsAtNormalSpeed(const Context& context)
{
    return context.currentPlayMode.Speed() == bd::PlaySpeedNormal;
}

const Condition conditions[] = {
    {"`fg2ndVid`", [](const Context& context) { return context.async2ndVid; }},
    {"`fg2ndAud`", [](const Context& context) { return context.async2ndAud; }},
    {"not `fg2ndVid`", [](const Context& context) { return !context.async2ndVid; }},
    {"not `fg2ndAud`", [](const Context& context) { return !context.async2ndAud; }},
    {"`fgPrev2ndVid` but not `fg2ndVid`",
     [](const Context& context) { return context.prev2ndVid && !context.async2ndVid; }},
    {"`fgPrev2ndAud` but not `fg2ndAud`",
     [](const Context& context) { return context.prev2ndAud && !context.async2ndAud; }},
    {"`speed` is `PlaySpeedNormal` and `fg2ndVid`",
     [](const Context& context) { return RunsAtNormalSpeed(context) && context.async2ndVid; }},
    {"`speed` is `PlaySpeedNormal` and `fg2ndAud`",
     [](const Context& context) { return RunsAtNormalSpeed(context) && context.async2ndAud; }},
    {"`speed` is not `PlaySpeedNormal` and `fg2ndVid`",
     [](const Context& context) { return !RunsAtNormalSpeed(context) && context.async2ndVid; }},
    {"`speed` is not `PlaySpeedNormal` and `fg2ndAud`",
     [](const Context& context) { return !RunsAtNormalSpeed(context) && context.async2ndAud; }},
    {"that kind is `TRIGGER_B` or `TRIGGER_INVALID`", RepeatStatesMatter},
    {"that kind is `TRIGGER_INVALID`, A-B is not `TRIGGER_B` and chapter/title is `TRIGGER_NONE`",
     [](const Context& context) {
         return context.triggerTypeByTime == bd::TRIGGER_INVALID &&
                context.currentABRepeatState != bd::TRIGGER_B &&
                context.currentChpTitleRepeatState == bd::TRIGGER_NONE;
     }},
    {"`ErrNotAllowed` is returned",
     [](const Context& context) {
         return context.rPgTextStResult == bdmv::INavError::ErrNotAllowed;
     }},
    {"the reason is neither of the two",
     [](const Context& context) {
         return context.finishedReason != bdstreaming::FinishedReasonEndOfMedia &&
                context.finishedReason != bdstreaming::FinishedReasonDataStarvation;
     }},
};

bool Holds(const std::string& wording, const Context& context)
{
    for (const Condition& condition : conditions) {
        if (condition.wording == wording) {
            return condition.holds(context);
        }
    }
    throw std::runtime_error("unknown condition: " + wording);
}

/** The value in a journal for a preset's wording. */
std::string DescribePreset(const std::string& wording)
{
    if (wording == "all 0") {
        return bdmvtest::Describe(bd::ZOOM_PARAM_Def());
    }
    if (wording == "nothing forbidden") {
        return bdmvtest::Describe(bdmv::UOMaskTable());
    }
    if (wording == "empty") {
        return bdmvtest::Describe(bdmv::IProgramData::RefPtr());
    }
    if (wording == "TimePositionNone") {
        return "18446744073709551615";
    }
    return wording;
}

/** Lines and journals write the same flag differently, and journals name enumerators. */
std::string AsNumber(const std::string& value)
{
    const std::set<std::string> on = {"TRUE", "true"};
    const std::set<std::string> off = {"FALSE", "false"};
    static const std::regex name("[A-Za-z]\\w*");
    return on.count(value) != 0            ? "1"
           : off.count(value) != 0         ? "0"
           : std::regex_match(value, name) ? std::to_string(NumberOf(value))
                                           : value;
}

/** The explanation of a conversion of a line. */
struct Shown {
    std::string conversion;
    std::string name; ///< empty when the explanation is in words
};

std::vector<Shown> ExplainedValues(const Step& step)
{
    std::vector<Shown> values;
    static const std::regex form("`(%\\w+)`(?: `(\\w+)`)?");
    for (std::sregex_iterator i(step.explanation.begin(), step.explanation.end(), form), end;
         i != end; ++i) {
        values.push_back({(*i)[1], (*i)[2]});
    }
    return values;
}

bool IsLog(const Step& step)
{
    return StartsWith(step.action, "log");
}

/** The level that switches a line on, with its suffix. */
std::string LevelOf(const Step& step)
{
    return step.action == "log at Warning" ? "Warning" : "Event" + step.action.substr(3);
}

std::string LinkTo(const EventSection& section)
{
    Chapter chapter;
    chapter.title = section.title;
    return "[" + section.event + "](#" + chapter.Anchor() + ")";
}

/** The callbacks of a section, each once, in the order of its steps. */
std::vector<std::string> CallbacksOf(const EventSection& section)
{
    std::vector<std::string> callbacks;
    for (const Step& step : section.steps) {
        if (step.action == "callback" &&
            std::count(callbacks.begin(), callbacks.end(), step.Subject()) == 0) {
            callbacks.push_back(step.Subject());
        }
    }
    return callbacks;
}

std::string CommaSeparated(const std::vector<std::string>& words, const char* quote = "")
{
    std::string text;
    for (const std::string& word : words) {
        text += (text.empty() ? "" : ", ") + (quote + word + quote);
    }
    return text;
}

const EventClass& ClassOf(const std::string& event)
{
    static const std::vector<EventClass> all = AllEvents();
    const auto found = std::find_if(all.begin(), all.end(), [&](const EventClass& eventClass) {
        return eventClass.name == event;
    });
    if (found == all.end()) {
        throw std::runtime_error("there is no event " + event);
    }
    return *found;
}

/** The steps of a section that are executed in a situation; the last may be an end. */
std::vector<std::size_t> StepsMade(const EventSection& section, const Situation& situation)
{
    Context context;
    Arrange(context, situation);
    std::vector<std::size_t> made;
    for (std::size_t i = 0; i < section.steps.size(); ++i) {
        const Step& step = section.steps[i];
        if (step.condition.empty() || Holds(step.condition, context)) {
            made.push_back(i);
            if (step.action == "end") {
                break;
            }
        }
    }
    return made;
}

} // namespace

class EventsDocument : public testing::Test
{
protected:
    static const EventsReference& Reference()
    {
        static const EventsReference reference = ReadEventsReference();
        return reference;
    }

    const EventsReference& reference = Reference();
};

TEST_F(EventsDocument, HasASectionForEveryEventInTheOrderOfDeclaration)
{
    std::vector<std::string> expected;
    for (const std::string& event : DeclaredEvents()) {
        expected.push_back(std::to_string(expected.size() + 1) + ". " + event);
    }

    std::vector<std::string> titles;
    for (const EventSection& section : reference.sections) {
        titles.push_back(section.title);
    }

    EXPECT_EQ(titles, expected);
    EXPECT_EQ(titles.size(), 56U);
}

TEST_F(EventsDocument, SendsEveryCallback)
{
    std::set<std::string> sent;
    for (const EventSection& section : reference.sections) {
        for (const std::string& callback : CallbacksOf(section)) {
            sent.insert(callback);
        }
    }

    std::set<std::string> declared;
    for (const auto& callback : DeclaredCallbacks()) {
        declared.insert(callback.first);
    }
    EXPECT_EQ(sent, declared);
}

TEST_F(EventsDocument, ListsEventsAndCallbacksAsTheSectionsHaveThem)
{
    std::vector<TableRow> expected;
    std::map<std::string, std::vector<std::string>> senders;
    for (const EventSection& section : reference.sections) {
        expected.push_back({std::to_string(expected.size() + 1), LinkTo(section),
                            CommaSeparated(CallbacksOf(section), "`")});
        for (const std::string& callback : CallbacksOf(section)) {
            senders[callback].push_back(LinkTo(section));
        }
    }
    for (const auto& sender : senders) {
        if (sender.second.size() > 1) {
            expected.push_back({"`" + sender.first + "`", CommaSeparated(sender.second)});
        }
    }

    std::vector<TableRow> rows = reference.ChapterOf("Table of events").TableRows();
    for (TableRow& row : rows) {
        if (row.size() == 4) {
            row.erase(row.begin() + 2);
        }
    }
    EXPECT_EQ(rows, expected);
}

TEST_F(EventsDocument, ListsLinesAsTheSectionsHaveThemInTheOrderOfTheirBytes)
{
    std::vector<TableRow> expected;
    for (const EventSection& section : reference.sections) {
        for (const Step& step : section.steps) {
            if (IsLog(step)) {
                expected.push_back({"`" + step.code + "`", LevelOf(step), LinkTo(section)});
            }
        }
    }
    std::sort(expected.begin(), expected.end(), [](const TableRow& left, const TableRow& right) {
        return CodeSpans(left.front()) < CodeSpans(right.front());
    });

    EXPECT_EQ(reference.ChapterOf("Log lines").TableRows(), expected);
}

TEST_F(EventsDocument, NamesNumbersAsDeclared)
{
    const std::map<std::string, std::vector<Enumerator>> declared = DeclaredEnumerations();
    std::set<std::string> listed;
    for (const TableRow& row : reference.ChapterOf("Numbers").TableRows()) {
        SCOPED_TRACE(row.front());
        const std::string type =
            std::regex_replace(CodeSpans(row.front()).at(0), std::regex("^bd::"), "");
        std::vector<std::string> expected;
        for (const Enumerator& enumerator : declared.at(type)) {
            expected.push_back(std::to_string(enumerator.second) + " `" + enumerator.first + "`");
        }
        EXPECT_EQ(row.at(1), CommaSeparated(expected));
        listed.insert(type);
    }

    EXPECT_EQ(listed,
              (std::set<std::string>{"FinishedReason", "PlayDirectionDef", "PlaySpeedDef",
                                     "TriggerType", "VideoAspectRatioType", "VideoFormatType"}));
}

TEST_F(EventsDocument, HasOnlyValidLinks)
{
    std::set<std::string> anchors;
    for (const Chapter& chapter : reference.chapters) {
        anchors.insert("#" + chapter.Anchor());
    }
    const std::filesystem::path document = BDMVNAVIGATOR_EVENTS_REFERENCE;

    const std::vector<std::string> targets = LinkTargets(ReadFile(document.string()));

    EXPECT_FALSE(targets.empty());
    for (const std::string& target : targets) {
        EXPECT_TRUE(target.front() == '#'
                        ? anchors.count(target) != 0
                        : std::filesystem::exists(document.parent_path() / target))
            << target;
    }
}

TEST_F(EventsDocument, DecidesEveryTriggerByItsTable)
{
    const EventSection& section = reference.SectionOf("TriggerReachedEvent");
    const auto fits = [](const std::string& cell, int value) {
        if (cell == "any") {
            return true;
        }
        return (value == NumberOf(CodeSpans(cell).at(0))) == !StartsWith(cell, "not ");
    };
    const auto toNumber = [](const std::string& cell, const Context& context) -> int {
        const std::map<std::string, int> states = {
            {"the chapter/title state", context.currentChpTitleRepeatState},
            {"the trigger that is set", context.trigger.triggerType},
            {"the kind at that time", context.triggerTypeByTime}};
        const auto state = states.find(cell);
        return state != states.end() ? state->second : NumberOf(CodeSpans(cell).at(0));
    };

    std::set<TableRow> used;
    for (int kind = bd::TriggerTypeNone; kind <= bd::TRIGGER_NOTIFY_FROM_CURPOS; ++kind) {
        for (const int abState : {bd::TRIGGER_NONE, bd::TRIGGER_A, bd::TRIGGER_B,
                                  bd::TRIGGER_AB_NONE, bd::TRIGGER_INVALID}) {
            for (const int chpTitleState : {bd::TRIGGER_NONE, bd::TRIGGER_AB_NONE, bd::TRIGGER_CHP,
                                            bd::TRIGGER_TITLE, bd::TRIGGER_INVALID}) {
                const Situation situation = TriggerSituation(
                    static_cast<bd::TriggerType>(kind), static_cast<bd::TriggerType>(abState),
                    static_cast<bd::TriggerType>(chpTitleState));
                SCOPED_TRACE(situation.name);
                Context context;
                Arrange(context, situation);
                const auto row = std::find_if(
                    section.table.begin(), section.table.end(), [&](const TableRow& cells) {
                        return fits(cells.at(0), kind) && fits(cells.at(1), abState) &&
                               fits(cells.at(2), chpTitleState);
                    });
                ASSERT_NE(row, section.table.end());
                used.insert(*row);

                const Effect callback = EffectsOf(ClassOf(section.event), situation).back();

                EXPECT_EQ(AsNumber(callback.values.at(0)),
                          std::to_string(toNumber(row->at(3), context)));
            }
        }
    }
    EXPECT_EQ(used.size(), section.table.size()) << "a row never decides";
}

/** The section about the event named by the parameter. */
class EventsDocumentSection : public EventsDocument, public testing::WithParamInterface<std::string>
{
public:
    static std::string Name(const testing::TestParamInfo<std::string>& info) { return info.param; }

protected:
    const EventSection& section = reference.SectionOf(GetParam());
    const EventClass& eventClass = ClassOf(GetParam());

    /** Calls the action with every executed step and its effects, in every situation. */
    template <typename Action> void ForEachStepMade(Action action)
    {
        for (const Situation& situation : AllSituations()) {
            SCOPED_TRACE(situation.name);
            const std::vector<Effect> effects = EffectsOf(eventClass, situation);
            const std::vector<std::size_t> made = StepsMade(section, situation);
            ASSERT_LE(effects.size(), made.size());
            for (std::size_t i = 0; i < effects.size(); ++i) {
                action(section.steps[made[i]], effects, i);
            }
        }
    }

    /**
     * The value of a name at a point of a dispatch: that of the next callback with such an
     * argument, or else of the last query with such a variable.
     */
    std::string ValueOf(const std::string& name, const std::vector<Effect>& effects, std::size_t at)
    {
        const std::map<std::string, std::string> callbacks = DeclaredCallbacks();
        for (std::size_t i = at; i < effects.size(); ++i) {
            if (effects[i].action == "callback") {
                const std::vector<std::string> names =
                    ParameterNames(callbacks.at(effects[i].subject));
                const auto found = std::find(names.begin(), names.end(), name);
                if (found != names.end()) {
                    return effects[i].values.at(static_cast<std::size_t>(found - names.begin()));
                }
            }
        }
        for (std::size_t i = at; i-- > 0;) {
            for (const Step& step : section.steps) {
                if (step.action == "query" && step.Subject() == effects[i].subject) {
                    const std::vector<Variable> variables = step.Variables();
                    for (std::size_t j = 0; j < variables.size(); ++j) {
                        if (variables[j].first == name) {
                            return effects[i].answers.at(j);
                        }
                    }
                }
            }
        }
        return "no value named " + name;
    }
};

TEST_P(EventsDocumentSection, BeginsWithWhatHasHappened)
{
    EXPECT_TRUE(std::regex_search(section.firstSentence, std::regex("^[A-Z]"))) << "no sentence";
}

TEST_P(EventsDocumentSection, StatesItsEffectsInEverySituation)
{
    for (const Situation& situation : AllSituations()) {
        SCOPED_TRACE(situation.name);
        std::vector<std::string> expected;
        for (const std::size_t i : StepsMade(section, situation)) {
            const Step& step = section.steps[i];
            if (step.action != "end") {
                expected.push_back(step.action + " " + step.Subject());
            }
        }
        std::vector<std::string> actual;
        for (const Effect& effect : EffectsOf(eventClass, situation)) {
            actual.push_back(effect.action + " " + effect.subject);
        }

        EXPECT_EQ(expected, actual);
    }
}

TEST_P(EventsDocumentSection, HasNoStepThatIsNeverMadeAndNoConditionThatAlwaysHolds)
{
    std::vector<std::size_t> times(section.steps.size());
    const std::vector<Situation> situations = AllSituations();
    for (const Situation& situation : situations) {
        for (const std::size_t i : StepsMade(section, situation)) {
            ++times[i];
        }
    }

    for (std::size_t i = 0; i < times.size(); ++i) {
        EXPECT_GT(times[i], 0U) << "step " << i + 1;
        if (!section.steps[i].condition.empty()) {
            EXPECT_LT(times[i], situations.size()) << "step " << i + 1;
        }
    }
}

TEST_P(EventsDocumentSection, HasTheSignaturesOfTheListenerAndExplainsEveryArgument)
{
    const std::map<std::string, std::string> declared = DeclaredCallbacks();
    for (const Step& step : section.steps) {
        if (step.action == "callback") {
            EXPECT_EQ(step.code, declared.at(step.Subject()));
            std::vector<std::string> explained;
            for (const std::string& bullet : step.bullets) {
                explained.push_back(AllMatches(bullet, "^- `(\\w+)`: .").at(0));
            }
            EXPECT_EQ(explained, ParameterNames(step.code));
        } else {
            EXPECT_TRUE(step.bullets.empty()) << step.code;
        }
    }
}

TEST_P(EventsDocumentSection, ExplainsEveryConversion)
{
    for (const Step& step : section.steps) {
        if (IsLog(step)) {
            std::vector<std::string> explained;
            for (const Shown& value : ExplainedValues(step)) {
                explained.push_back(value.conversion);
            }
            EXPECT_EQ(explained, Conversions(step.code)) << step.code;
        }
    }

    ForEachStepMade([this](const Step& step, const std::vector<Effect>& effects, std::size_t i) {
        if (IsLog(step)) {
            const std::vector<Shown> explained = ExplainedValues(step);
            ASSERT_EQ(explained.size(), effects[i].values.size());
            for (std::size_t j = 0; j < explained.size(); ++j) {
                if (!explained[j].name.empty()) {
                    EXPECT_EQ(AsNumber(effects[i].values[j]),
                              AsNumber(ValueOf(explained[j].name, effects, i)))
                        << explained[j].name;
                }
            }
        }
    });
}

TEST_P(EventsDocumentSection, StatesThePresetsOfVariables)
{
    ForEachStepMade([](const Step& step, const std::vector<Effect>& effects, std::size_t i) {
        if (step.action == "query") {
            const std::vector<Variable> variables = step.Variables();
            ASSERT_EQ(variables.size(), effects[i].values.size()) << step.code;
            for (std::size_t j = 0; j < variables.size(); ++j) {
                if (!variables[j].second.empty()) {
                    EXPECT_EQ(effects[i].values[j], DescribePreset(variables[j].second))
                        << step.code;
                }
            }
        }
    });
}

INSTANTIATE_TEST_SUITE_P(Events, EventsDocumentSection, testing::ValuesIn(DeclaredEvents()),
                         EventsDocumentSection::Name);
