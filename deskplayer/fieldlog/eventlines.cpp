#include "fieldlog/eventlines.h"

#include <algorithm>
#include <charconv>
#include <limits>
#include <type_traits>

namespace deskplayer
{

namespace
{

/** Values by argument; a number is extended to 64 bits, with its sign if its conversion has one. */
using Values = std::array<std::optional<std::uint64_t>, ArgumentSet().size()>;

/** Assigns values to the arguments of a callback that a line can show. */
class ArgumentWriter
{
public:
    explicit ArgumentWriter(const Values& values) : m_rValues(values) {}

    /** Whether every value was in the range of its argument. */
    bool InRange() const { return m_InRange; }

    /** The arguments that have no value. */
    ArgumentSet Absent() const { return m_Absent; }

    template <typename Value> void operator()(const char* /*name*/, Value& target)
    {
        if (const std::optional<std::uint64_t>& value = Next()) {
            m_InRange = m_InRange && Assign(*value, target);
        }
    }

    void operator()(const char* /*name*/, const bdmv::Bytes& /*target*/) { Next(); }

private:
    const std::optional<std::uint64_t>& Next()
    {
        const std::optional<std::uint64_t>& value = m_rValues[m_Position];
        m_Absent[m_Position] = !value;
        ++m_Position;
        return value;
    }

    template <typename Value> static bool Assign(std::uint64_t value, Value& target)
    {
        if constexpr (std::is_same_v<Value, bdmv::INavControlListener::FinishedReason>) {
            target = value == 0 ? bdmv::INavControlListener::EndOfMedia
                                : bdmv::INavControlListener::DataStarvation;
            return value <= 1;
        } else if constexpr (std::is_same_v<Value, bdmv::UOMaskTable>) {
            // The line has operation n at bit n, the disc's field at bit 63 - n.
            bd::UInt64 field = 0;
            for (int bit = 0; bit < 64; ++bit) {
                field = (field << 1) | ((value >> bit) & 1);
            }
            target = bdmv::UOMaskTable(field);
            return true;
        } else if constexpr (std::is_same_v<Value, bool>) {
            target = value != 0;
            return value <= 1;
        } else if constexpr (std::is_enum_v<Value>) {
            // Shown as a signed or an unsigned number of the same 32 bits.
            target = static_cast<Value>(static_cast<std::int32_t>(value));
            return true;
        } else if constexpr (std::is_integral_v<Value>) {
            target = static_cast<Value>(value);
            return value <= std::numeric_limits<Value>::max();
        } else {
            return false; // no line shows arguments of other types
        }
    }

    const Values& m_rValues;
    std::size_t m_Position = 0;
    ArgumentSet m_Absent;
    bool m_InRange = true;
};

template <typename Arguments> EventText MakeAs(const Values& values)
{
    Arguments arguments{};
    ArgumentWriter writer(values);
    Arguments::VisitArguments(arguments, writer);
    EventText text;
    text.kind = writer.InRange() ? EventTextKind::Event : EventTextKind::Damaged;
    text.callback = arguments;
    text.absent = writer.Absent();
    return text;
}

EventText Make(bdmv::CallbackId callback, const Values& values)
{
    static constexpr EventText (*Makers[])(const Values&) = {
#define DESKPLAYER_MAKER(interface, name) &MakeAs<bdmv::callbacks::name>,
        BDMV_CALLBACKS(DESKPLAYER_MAKER)
#undef DESKPLAYER_MAKER
    };
    return Makers[callback](values);
}

/** Removes @p beginning from the text, if the text begins so. */
bool Skip(std::string_view& text, std::string_view beginning)
{
    if (text.substr(0, beginning.size()) != beginning) {
        return false;
    }
    text.remove_prefix(beginning.size());
    return true;
}

/** Removes a number from the beginning of the text, if it is written as printf writes it. */
template <typename Number> std::optional<std::uint64_t> TakeNumber(std::string_view& text)
{
    Number number = 0;
    const auto result = std::from_chars(text.data(), text.data() + text.size(), number);
    const std::string_view digits(text.data(), static_cast<std::size_t>(result.ptr - text.data()));
    const bool isCanonical = digits == "0" || (digits.find_first_not_of('-') < digits.size() &&
                                               digits[digits.find_first_not_of('-')] != '0');
    if (result.ec != std::errc() || !isCanonical) {
        return std::nullopt;
    }
    text.remove_prefix(digits.size());
    return static_cast<std::uint64_t>(number);
}

std::optional<std::uint64_t> TakeTruth(std::string_view& text)
{
    if (Skip(text, "TRUE")) {
        return 1;
    }
    return Skip(text, "FALSE") ? std::optional<std::uint64_t>(0) : std::nullopt;
}

/** Removes a conversion from the format, and from the text what it has written. */
std::optional<std::uint64_t> TakeConversion(std::string_view& format, std::string_view& text)
{
    if (Skip(format, "%s")) {
        return TakeTruth(text);
    }
    if (Skip(format, "%d")) {
        return TakeNumber<std::int32_t>(text);
    }
    if (Skip(format, "%llu")) {
        return TakeNumber<std::uint64_t>(text);
    }
    Skip(format, "%lu") || Skip(format, "%u");
    return TakeNumber<std::uint32_t>(text);
}

EventText ReadValues(const EventLine& line, std::string_view text)
{
    EventText damaged;
    damaged.kind = EventTextKind::Damaged;

    Values values;
    std::string_view format = line.format;
    for (const std::int8_t argument : line.arguments) {
        const std::string_view literal = format.substr(0, format.find('%'));
        if (!Skip(text, literal)) {
            return damaged;
        }
        format.remove_prefix(literal.size());
        if (format.empty()) {
            break;
        }
        const std::optional<std::uint64_t> value = TakeConversion(format, text);
        if (!value) {
            return damaged;
        }
        if (argument != NoArgument) {
            values[static_cast<std::size_t>(argument)] = value;
        }
    }
    if (text != format) {
        return damaged;
    }
    EventText result = Make(line.callback, values);
    result.role = line.role;
    result.continues = line.continues;
    return result;
}

} // namespace

ArgumentSet AbsentArguments(const EventLine& line)
{
    Values values;
    for (const std::int8_t argument : line.arguments) {
        if (argument != NoArgument) {
            values[static_cast<std::size_t>(argument)] = 0;
        }
    }
    return Make(line.callback, values).absent;
}

EventText ReadEventText(std::string_view text)
{
    // No head begins with another, so the last one up to the text is the only candidate.
    const EventLines lines = AllEventLines();
    const EventLine* const next = std::upper_bound(
        lines.begin(), lines.end(), text,
        [](std::string_view value, const EventLine& line) { return value < line.head; });
    if (next == lines.begin()) {
        return {};
    }
    const EventLine& line = *(next - 1);
    const bool hasValues = line.head.size() != line.format.size();
    const bool begins = text.substr(0, line.head.size()) == line.head;
    if (!begins || (!hasValues && text.size() != line.head.size())) {
        return {};
    }
    return ReadValues(line, text);
}

} // namespace deskplayer
