// What docs/clients.md says about the status is what the client kit does, and its examples are
// those of clientexamples_test.cpp and replayexamples_test.cpp.

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <set>
#include <sstream>

#include "docs/markdown.h"
#include "docs/statusparts.h"
#include "kits/clientkit/randomcallbacks.h"
#include "testkit/fakeplatform.h"

namespace
{

using bdmv::PlaybackStatus;

const std::vector<Chapter>& Chapters()
{
    static const std::vector<Chapter> chapters = ReadMarkdown(BDMVNAVIGATOR_CLIENTS_GUIDE);
    return chapters;
}

std::vector<TableRow> TableOf(const std::string& title)
{
    for (const Chapter& chapter : Chapters()) {
        if (chapter.title == title) {
            return chapter.TableRows();
        }
    }
    return {};
}

/** A row of the table of callbacks. */
struct Rule {
    std::string condition;                ///< "", or as below with its words in code spans
    std::vector<std::string> words;       ///< of the condition
    std::vector<std::string> assignments; ///< "part = value value"
};

const std::map<std::string, std::vector<Rule>>& Rules()
{
    static const std::map<std::string, std::vector<Rule>> rules = [] {
        std::map<std::string, std::vector<Rule>> rulesByName;
        std::string name;
        for (const TableRow& row : TableOf("What each callback means for the status")) {
            name = row[0].empty() ? name : CodeSpans(row[0]).at(0);
            rulesByName[name].push_back({row[1], CodeSpans(row[1]), CodeSpans(row[2])});
        }
        return rulesByName;
    }();
    return rules;
}

/** The value of a word of the table. */
std::string ValueOf(const std::string& word, const Texts& arguments, const Texts& before)
{
    if (arguments.count(word) != 0) {
        return arguments.at(word);
    }
    return before.count(word) != 0 ? before.at(word) : word;
}

/** Conditions are "`name` is `value`", "`name` is not `value`" and "`name` is unknown". */
bool Holds(const Rule& rule, const Texts& arguments, const Texts& before)
{
    if (rule.condition.empty()) {
        return true;
    }
    const std::string expected = rule.words.size() == 2 ? rule.words[1] : "unknown";
    const bool isNegative = rule.condition.find(" is not ") != std::string::npos;
    return (ValueOf(rule.words.at(0), arguments, before) == expected) != isNegative;
}

/** The parts after a callback as the table has it. */
Texts After(const bdmv::Callback& callback, const Texts& before)
{
    Texts after = before;
    const Texts arguments = ArgumentsOf(callback);
    const std::vector<Rule>& rules = Rules().at(NameOf(callback.Id()));
    const auto rule = std::find_if(rules.begin(), rules.end(), [&](const Rule& candidate) {
        return Holds(candidate, arguments, before);
    });
    if (rule == rules.end()) {
        return after;
    }
    for (const std::string& assignment : rule->assignments) {
        std::istringstream words(assignment);
        std::string part;
        std::string word;
        words >> part >> word; // and the equals sign
        std::string value;
        while (words >> word) {
            value += (value.empty() ? "" : " ") + ValueOf(word, arguments, before);
        }
        after[part] = value;
        if (part == "state") {
            after["resumesTo"] = "Playing";
        }
    }
    return after;
}

/** Statuses with no, some and all parts known, in every state of playback. */
std::vector<PlaybackStatus> StatusesBefore()
{
    std::vector<PlaybackStatus> statuses(1);
    bdmvtest::RandomCallbacks random(1);
    const auto apply = [&statuses](const bdmv::Callback& callback) {
        statuses.push_back(statuses.back());
        Apply(callback, statuses.back());
    };
    for (int id = 0; id < bdmv::Callback__sizeof; ++id) {
        apply(random.Make(static_cast<bdmv::CallbackId>(id)));
    }
    for (std::set<std::string> states; states.size() < 6;) {
        apply(random.Next());
        states.insert(NameOf(statuses.back().state.value));
    }
    return statuses;
}

TEST(ClientsGuide, ListsEveryCallbackInOrder)
{
    std::vector<std::string> names;
    for (const TableRow& row : TableOf("What each callback means for the status")) {
        for (const std::string& name : CodeSpans(row[0])) {
            names.push_back(name);
        }
    }
    ASSERT_EQ(names.size(), 56U);
    for (int id = 0; id < bdmv::Callback__sizeof; ++id) {
        EXPECT_EQ(names[static_cast<std::size_t>(id)], NameOf(static_cast<bdmv::CallbackId>(id)));
    }
}

TEST(ClientsGuide, SaysWhatEveryCallbackMeansForTheStatus)
{
    bdmvtest::RandomCallbacks random(2);
    for (const PlaybackStatus& before : StatusesBefore()) {
        const Texts parts = PartsOf(before);
        for (int id = 0; id < bdmv::Callback__sizeof; ++id) {
            const bdmv::Callback callback = random.Make(static_cast<bdmv::CallbackId>(id));
            PlaybackStatus after = before;
            Apply(callback, after);

            ASSERT_EQ(PartsOf(after), After(callback, parts))
                << NameOf(callback.Id()) << " in " << NameOf(before.state.value);
        }
    }
}

/** The callbacks by which a state is reported, in the order of their names in the table. */
std::vector<std::string> StateCallbacks(const Texts& parts, const std::vector<std::string>& names)
{
    const std::map<std::string, std::string> callbacks{
        {"Playing", names.at(0)},   {"Paused", names.at(1)},  {"Still", names.at(2)},
        {"Suspended", names.at(3)}, {"Stopped", names.at(5)}, {"Standby", names.at(6)}};
    const std::string& state = parts.at("state");
    if (state == "unknown") {
        return {};
    }
    if (state == "Suspended") {
        return {callbacks.at(parts.at("resumesTo")), callbacks.at(state)};
    }
    return {callbacks.at(state)};
}

/** A row of the table of what a client that joins receives. */
struct PartRow {
    std::string part;
    std::vector<std::string> callbacks;
};

const std::vector<PartRow>& PartRows()
{
    static const std::vector<PartRow> rows = [] {
        std::vector<PartRow> read;
        for (const TableRow& row : TableOf("What a client that joins receives")) {
            read.push_back({CodeSpans(row[0]).at(0), CodeSpans(row[1])});
        }
        return read;
    }();
    return rows;
}

/** What a client that joins receives as the table has it. */
std::vector<std::string> CallbacksOfJoining(const Texts& parts)
{
    std::vector<std::string> callbacks;
    std::vector<std::string> atTheEnd;
    for (const PartRow& row : PartRows()) {
        const std::string& value = parts.at(row.part);
        if (row.part == "state") {
            const bool isOver = value == "Stopped" || value == "Standby";
            (isOver ? atTheEnd : callbacks) = StateCallbacks(parts, row.callbacks);
        } else if (value != "unknown") {
            const bool isFirst = row.callbacks.size() == 1 || value == "true";
            callbacks.push_back(row.callbacks.at(isFirst ? 0 : 1));
        }
    }
    callbacks.insert(callbacks.end(), atTheEnd.begin(), atTheEnd.end());
    return callbacks;
}

TEST(ClientsGuide, SaysWhatAClientThatJoinsReceives)
{
    for (const PlaybackStatus& status : StatusesBefore()) {
        bdmvtest::CallbackKeeper client;
        Deliver(status, client);
        std::vector<std::string> received;
        for (const bdmv::Callback& callback : client.callbacks) {
            received.push_back(NameOf(callback.Id()));
        }
        ASSERT_EQ(received, CallbacksOfJoining(PartsOf(status)));
    }
}

/** A text without indentation. */
std::string Unindented(const std::string& text)
{
    std::string unindented;
    std::istringstream lines(text);
    for (std::string line; std::getline(lines, line);) {
        unindented += line.substr(std::min(line.size(), line.find_first_not_of(' '))) + "\n";
    }
    return unindented;
}

TEST(ClientsGuide, ShowsExamplesThatAreCompiledAndRun)
{
    const std::string examples = Unindented(ReadFile(BDMVNAVIGATOR_CLIENTS_EXAMPLES)) +
                                 Unindented(ReadFile(BDMVNAVIGATOR_REPLAY_EXAMPLES));
    std::size_t count = 0;
    std::string code;
    bool inCode = false;
    for (const Chapter& chapter : Chapters()) {
        for (const std::string& line : chapter.lines) {
            if (line == "```cpp") {
                inCode = true;
                code.clear();
            } else if (inCode && line == "```") {
                inCode = false;
                ++count;
                EXPECT_NE(examples.find(Unindented(code)), std::string::npos) << code;
            } else if (inCode) {
                code += line + "\n";
            }
        }
    }
    EXPECT_GE(count, 14U);
}

TEST(ClientsGuide, LinksToWhatExists)
{
    std::set<std::string> anchors;
    for (const Chapter& chapter : Chapters()) {
        anchors.insert("#" + chapter.Anchor());
    }
    const std::filesystem::path guide = BDMVNAVIGATOR_CLIENTS_GUIDE;
    const std::vector<std::string> targets = LinkTargets(ReadFile(guide));
    for (const std::string& target : targets) {
        EXPECT_TRUE(anchors.count(target) != 0 ||
                    std::filesystem::exists(guide.parent_path() / target))
            << target;
    }
    EXPECT_GE(targets.size(), 9U);
}

} // namespace
