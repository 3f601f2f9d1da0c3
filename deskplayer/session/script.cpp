#include "session/script.h"

#include <algorithm>
#include <charconv>
#include <limits>
#include <optional>
#include <system_error>

#include "text/printable.h"
#include "text/timetext.h"

namespace deskplayer
{

namespace
{

using Words = std::vector<std::string_view>;

/** The words refer to @p text, so their positions in it can be computed. */
Words SplitAtBlanks(std::string_view text)
{
    constexpr const char* blanks = " \t";
    Words words;
    std::size_t begin = text.find_first_not_of(blanks);
    while (begin != std::string_view::npos) {
        const std::size_t end = std::min(text.find_first_of(blanks, begin), text.size());
        words.push_back(text.substr(begin, end - begin));
        begin = text.find_first_not_of(blanks, end);
    }
    return words;
}

/** A line of the script with its file name and number. */
class Line
{
public:
    Line(const std::string& fileName, std::size_t number, std::string_view text)
        : m_rFileName(fileName), m_Number(number), m_Text(text)
    {
    }

    std::size_t Number() const { return m_Number; }

    /** The words before the comment. */
    Words GetWords() const
    {
        for (const char& character : m_Text) {
            const auto byte = static_cast<unsigned char>(character);
            if ((byte < 0x20 && character != '\t') || byte == 0x7F) {
                Fail(&character,
                     "'" + Printable({&character, 1}) + "' is a control character; expected text");
            }
        }
        return SplitAtBlanks(m_Text.substr(0, m_Text.find('#')));
    }

    /** @param place points into the text of this line, or to its end */
    [[noreturn]] void Fail(const char* place, const std::string& problem) const
    {
        throw ScriptError(m_rFileName, m_Number, std::size_t(place - m_Text.data()) + 1, problem);
    }

private:
    const std::string& m_rFileName;
    std::size_t m_Number;
    std::string_view m_Text;
};

/** Removes the first line from @p text, with its line ending. */
std::string_view TakeLine(std::string_view& text)
{
    const std::size_t size = std::min(text.find('\n'), text.size());
    std::string_view line = text.substr(0, size);
    text.remove_prefix(std::min(size + 1, text.size()));
    if (!line.empty() && line.back() == '\r') {
        line.remove_suffix(1);
    }
    return line;
}

constexpr std::string_view NumberPlaceholder = "NUMBER";
constexpr std::string_view TimePlaceholder = "TIME";
constexpr std::string_view EndOfLine;

constexpr std::string_view Unexpected = "unexpected";

/** The meaning of a word at its position. */
struct Meaning {
    std::uint64_t value = 0;
    std::string_view problem; ///< empty if the word fits
};

/**
 * Removes leading digits from @p text. A number that does not fit the result becomes the greatest
 * one, which is out of range wherever numbers are used.
 */
std::optional<std::uint32_t> TakeNumber(std::string_view& text)
{
    std::uint32_t number = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
    if (error == std::errc::invalid_argument) {
        return std::nullopt;
    }
    text.remove_prefix(std::size_t(end - text.data()));
    return error == std::errc() ? number : std::numeric_limits<std::uint32_t>::max();
}

/** Removes @p character from the front of @p text. @return false if it is not there */
bool TakeCharacter(std::string_view& text, char character)
{
    const bool found = !text.empty() && text.front() == character;
    text.remove_prefix(found ? 1 : 0);
    return found;
}

Meaning ReadNumber(std::string_view word)
{
    const auto number = TakeNumber(word);
    if (!number) {
        return {0, Unexpected};
    }
    if (!word.empty()) {
        return {0, "is not a whole number"};
    }
    if (*number > GreatestNumber) {
        return {0, "is not between 0 and 65535"};
    }
    return {*number, ""};
}

/** Removes a decimal fraction from the front of @p text. @return thousandths; 0 without one */
std::optional<std::uint64_t> TakeThousandths(std::string_view& text)
{
    if (!TakeCharacter(text, '.')) {
        return 0;
    }
    const std::size_t sizeBefore = text.size();
    const auto number = TakeNumber(text);
    const std::size_t digits = sizeBefore - text.size();
    if (!number || digits > 3) {
        return std::nullopt;
    }
    constexpr std::uint64_t thousandths[] = {100, 10, 1};
    return *number * thousandths[digits - 1];
}

/** The number of milliseconds in a unit of time. */
std::optional<std::uint64_t> ReadUnit(std::string_view unit)
{
    if (unit == "ms") {
        return 1;
    }
    if (unit == "s" || unit.empty()) {
        return 1000;
    }
    if (unit == "m") {
        return 60 * 1000;
    }
    if (unit == "h") {
        return 3600 * 1000;
    }
    return std::nullopt;
}

Meaning ReadTime(std::string_view word)
{
    constexpr Meaning notATime{0, "is not a time"};

    const auto first = TakeNumber(word);
    if (!first) {
        return {0, Unexpected};
    }
    std::uint64_t whole = *first;
    std::size_t colons = 0;
    while (colons < 2 && TakeCharacter(word, ':')) {
        const auto part = TakeNumber(word);
        if (!part) {
            return notATime;
        }
        if (*part > 59) {
            return {0, "is not a time: minutes and seconds must be below 60"};
        }
        whole = whole * 60 + *part;
        ++colons;
    }
    const auto thousandths = TakeThousandths(word);
    const auto unit = ReadUnit(word);
    if (!thousandths || !unit || (colons > 0 && !word.empty())) {
        return notATime;
    }
    if (*thousandths * *unit % 1000 != 0) {
        return {0, "is finer than a millisecond"};
    }
    constexpr std::uint64_t ticksPerMillisecond = TicksPerSecond / 1000;
    const std::uint64_t milliseconds = whole * *unit + *thousandths * *unit / 1000;
    if (milliseconds > LongestSession.count() / ticksPerMillisecond) {
        return {0, "is more than 1000 hours"};
    }
    return {milliseconds * ticksPerMillisecond, ""};
}

bool IsPlaceholder(std::string_view patternWord)
{
    return patternWord == NumberPlaceholder || patternWord == TimePlaceholder;
}

/** Reads @p word as @p patternWord of a command's pattern. */
Meaning Read(std::string_view patternWord, std::string_view word)
{
    if (patternWord == NumberPlaceholder) {
        return ReadNumber(word);
    }
    if (patternWord == TimePlaceholder) {
        return ReadTime(word);
    }
    return {0, patternWord == word ? "" : Unexpected};
}

enum Timing { TimingAt, TimingAfter, TimingWithLineBefore };

/** A possible form of a line: a command, with or without a time before it. */
struct Form {
    Words words; ///< including placeholders
    std::size_t command = 0;
    Timing timing = TimingWithLineBefore;

    /** The word at @p position; EndOfLine after the last word. */
    std::string_view At(std::size_t position) const
    {
        return position < words.size() ? words[position] : EndOfLine;
    }
};

using Forms = std::vector<const Form*>;

std::vector<Form> FormsOf(const std::vector<CommandSyntax>& syntaxes)
{
    std::vector<Form> forms;
    const auto add = [&](const Words& time, Timing timing) {
        for (std::size_t command = 0; command < syntaxes.size(); ++command) {
            const Words pattern = SplitAtBlanks(syntaxes[command].pattern);
            forms.push_back({time, command, timing});
            Words& words = forms.back().words;
            words.insert(words.end(), pattern.begin(), pattern.end());
        }
    };
    add({"at", TimePlaceholder}, TimingAt);
    add({"after", TimePlaceholder}, TimingAfter);
    add({}, TimingWithLineBefore);
    return forms;
}

std::string Quoted(std::string_view word)
{
    constexpr std::size_t longest = 40;
    const char* const dots = word.size() > longest ? "..." : "";
    return "'" + Printable(FirstCharacters(word, longest)) + dots + "'";
}

std::string Description(std::string_view patternWord)
{
    if (patternWord == NumberPlaceholder) {
        return "a NUMBER";
    }
    if (patternWord == TimePlaceholder) {
        return "a TIME (such as 1:02:03.5, 02:03, 3.25, 2s, 500ms, 1.5m or 1h)";
    }
    return patternWord == EndOfLine ? "the end of the line" : std::string(patternWord);
}

/** The words of @p forms at @p position, such as "; expected next, previous or a NUMBER". */
std::string Expectation(const Forms& forms, std::size_t position)
{
    Words choices;
    for (const Form* form : forms) {
        const std::string_view choice = form->At(position);
        if (std::find(choices.begin(), choices.end(), choice) == choices.end()) {
            choices.push_back(choice);
        }
    }
    std::string text;
    const char* separator = "; expected ";
    for (std::size_t index = 0; index < choices.size(); ++index) {
        text += separator + Description(choices[index]);
        separator = index + 2 == choices.size() ? " or " : ", ";
    }
    return text;
}

/** Goes through @p words and drops the forms that do not match them. */
const Form& FindForm(const Line& line, const Words& words, Forms forms)
{
    for (std::size_t position = 0; position < words.size(); ++position) {
        const std::string_view word = words[position];
        Forms matching;
        std::string_view problem = Unexpected;
        for (const Form* form : forms) {
            const Meaning meaning = Read(form->At(position), word);
            if (meaning.problem.empty()) {
                matching.push_back(form);
            } else if (meaning.problem != Unexpected) {
                problem = meaning.problem;
            }
        }
        if (matching.empty()) {
            const std::string message = problem == Unexpected
                                            ? "unexpected " + Quoted(word)
                                            : Quoted(word) + " " + std::string(problem);
            line.Fail(word.data(), message + Expectation(forms, position));
        }
        forms = std::move(matching);
    }
    for (const Form* form : forms) {
        if (form->At(words.size()) == EndOfLine) {
            return *form;
        }
    }
    line.Fail(words.back().data() + words.back().size(),
              "the line ends here" + Expectation(forms, words.size()));
}

/** The time of a line that begins with "at" or "after" and the time @p word. */
Ticks TimeOf(const Line& line, Timing timing, std::string_view word, const ScriptStep& previous)
{
    const Ticks time(Read(TimePlaceholder, word).value);
    if (timing == TimingAt) {
        if (time < previous.time) {
            line.Fail(word.data(), TimeText(time) + " is before line " +
                                       std::to_string(previous.line) + "; expected at least " +
                                       TimeText(previous.time));
        }
        return time;
    }
    if (time > LongestSession - previous.time) {
        line.Fail(word.data(),
                  Quoted(word) + " after " + TimeText(previous.time) + " is more than 1000 hours");
    }
    return previous.time + time;
}

ScriptStep ReadStep(const Line& line, const Words& words, const Form& form,
                    const ScriptStep& previous)
{
    ScriptStep step;
    step.time = previous.time;
    step.command = form.command;
    step.line = line.Number();
    std::size_t position = 0;
    if (form.timing != TimingWithLineBefore) {
        step.time = TimeOf(line, form.timing, words[1], previous);
        position = 2;
    }
    for (; position < words.size(); ++position) {
        if (IsPlaceholder(form.words[position])) {
            step.values.push_back(Read(form.words[position], words[position]).value);
        }
    }
    return step;
}

} // namespace

ScriptError::ScriptError(const std::string& fileName, std::size_t line, std::size_t column,
                         const std::string& problem)
    : std::runtime_error(Printable(fileName) + ":" + std::to_string(line) + ":" +
                         std::to_string(column) + ": " + problem)
{
}

std::vector<ScriptStep> ParseScript(std::string_view text, const std::string& fileName,
                                    const std::vector<CommandSyntax>& syntaxes)
{
    if (text.size() > LongestScript) {
        throw ScriptError(fileName, 1, 1,
                          "the script has " + std::to_string(text.size()) +
                              " bytes; expected at most " + std::to_string(LongestScript));
    }
    const std::vector<Form> forms = FormsOf(syntaxes);
    Forms allForms;
    for (const Form& form : forms) {
        allForms.push_back(&form);
    }

    const ScriptStep start;
    std::vector<ScriptStep> steps;
    for (std::size_t number = 1; !text.empty(); ++number) {
        const Line line(fileName, number, TakeLine(text));
        const Words words = line.GetWords();
        if (!words.empty()) {
            const Form& form = FindForm(line, words, allForms);
            steps.push_back(ReadStep(line, words, form, steps.empty() ? start : steps.back()));
        }
    }
    return steps;
}

} // namespace deskplayer
