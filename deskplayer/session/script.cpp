#include "session/script.h"

#include <algorithm>
#include <stdexcept>

#include "session/scriptwords.h"
#include "text/choice.h"
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

constexpr std::string_view FurtherArguments = "[ARGUMENT=VALUE ...]"; ///< in a pattern
constexpr std::string_view EndOfLine;

enum Timing { TimingAt, TimingAfter, TimingWithLineBefore };

/** A possible form of a line: a command, with or without a time before it. */
struct Form {
    Words words;                 ///< including placeholders
    bool takesArguments = false; ///< any number of them, after the words
    std::size_t command = 0;
    Timing timing = TimingWithLineBefore;

    /** The word at @p position; after the last word, a further argument or EndOfLine. */
    std::string_view At(std::size_t position) const
    {
        if (position < words.size()) {
            return words[position];
        }
        return takesArguments ? ArgumentPlaceholder : EndOfLine;
    }
};

using Forms = std::vector<const Form*>;

std::vector<Form> FormsOf(const std::vector<CommandSyntax>& syntaxes)
{
    std::vector<Form> forms;
    const auto add = [&](const Words& time, Timing timing) {
        for (std::size_t command = 0; command < syntaxes.size(); ++command) {
            const std::string_view text = syntaxes[command].pattern;
            const std::size_t arguments = text.find(FurtherArguments);
            const Words pattern = SplitAtBlanks(text.substr(0, arguments));
            forms.push_back({time, arguments != std::string_view::npos, command, timing});
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
    return patternWord == EndOfLine ? "the end of the line" : DescribePatternWord(patternWord);
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
            const Meaning meaning = ReadWord(form->At(position), word);
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
        if (form->words.size() <= words.size()) {
            return *form;
        }
    }
    line.Fail(words.back().data() + words.back().size(),
              "the line ends here" + Expectation(forms, words.size()));
}

/** The time of a line that begins with "at" or "after" and the time @p word. */
Ticks TimeOf(const Line& line, Timing timing, std::string_view word, const ScriptStep& previous)
{
    const Ticks time(ReadWord(TimePlaceholder, word).value);
    if (timing == TimingAt) {
        if (time < previous.time) {
            line.Fail(word.data(), TimeText(time) + " is earlier than line " +
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

void CheckCallback(const Line& line, std::string_view word,
                   const std::vector<std::string_view>& callbacks)
{
    try {
        if (!callbacks.empty()) {
            FindChoice(word, "a callback", callbacks);
        }
    } catch (const std::invalid_argument& error) {
        line.Fail(word.data(), error.what());
    }
}

ScriptStep ReadStep(const Line& line, const Words& words, const Form& form,
                    const ScriptStep& previous, const std::vector<std::string_view>& callbacks)
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
        const std::string_view patternWord = form.At(position);
        if (IsValuePlaceholder(patternWord)) {
            step.values.push_back(ReadWord(patternWord, words[position]).value);
        } else if (IsWordPlaceholder(patternWord)) {
            step.words.emplace_back(words[position]);
        }
        if (patternWord == CallbackPlaceholder) {
            CheckCallback(line, words[position], callbacks);
        }
    }
    return step;
}

} // namespace

ScriptError::ScriptError(const std::string& fileName, std::size_t line, std::size_t column,
                         const std::string& problem)
    : SessionError(Printable(fileName) + ":" + std::to_string(line) + ":" + std::to_string(column) +
                   ": " + problem)
{
}

std::vector<ScriptStep> ParseScript(std::string_view text, const std::string& fileName,
                                    const std::vector<CommandSyntax>& syntaxes,
                                    const std::vector<std::string_view>& callbacks)
{
    if (text.size() > LongestScript) {
        throw ScriptError(fileName, 1, 1,
                          "the session has " + std::to_string(text.size()) +
                              " bytes; expected at most " + std::to_string(LongestScript));
    }
    constexpr std::string_view byteOrderMark = "\xEF\xBB\xBF";
    if (text.substr(0, byteOrderMark.size()) == byteOrderMark) {
        text.remove_prefix(byteOrderMark.size());
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
            const ScriptStep& previous = steps.empty() ? start : steps.back();
            steps.push_back(ReadStep(line, words, form, previous, callbacks));
        }
    }
    return steps;
}

} // namespace deskplayer
