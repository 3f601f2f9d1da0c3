#include "recording/argumentreader.h"

#include <algorithm>

#include "bd/constants.h"
#include "navigator/buttonprogram.h"

namespace deskplayer
{

namespace
{

/** A program of commands that are unknown, and do nothing. */
bdmv::IProgramData::RefPtr UnknownProgram(std::size_t commands)
{
    const ButtonCommand unknown(bdmv::INavigationCommandData::CommandNop);
    return bdmv::IProgramData::RefPtr(
        new ButtonProgram(std::vector<ButtonCommand>(commands, unknown)));
}

/** The value of a hexadecimal digit as it is written; -1 for another character. */
int DigitValue(char digit)
{
    const std::string_view digits = "0123456789abcdef";
    const std::size_t position = digits.find(digit);
    return position == std::string_view::npos ? -1 : static_cast<int>(position);
}

} // namespace

bool ArgumentReader::Take(const char* name)
{
    const bool present = m_rArguments.Has(name);
    m_Absent[m_Names.size()] = !present;
    m_Names.emplace_back(name);
    return present;
}

void ArgumentReader::ExpectNoOthers(const std::string& callback) const
{
    m_rArguments.Has(""); // refuses another type, also for callbacks without arguments
    for (const auto& member : m_rArguments.Value().items()) {
        if (std::find(m_Names.begin(), m_Names.end(), member.key()) == m_Names.end()) {
            m_rArguments.Member(member.key()).Refuse("an argument of " + callback);
        }
    }
}

void ArgumentReader::Read(const Element& element, bool& value) const
{
    value = element.Boolean();
}

void ArgumentReader::Read(const Element& element, bd::TimePosition& value) const
{
    value =
        element.Value().is_null() ? bd::TimePositionNone : element.Number(bd::TimePositionNone - 1);
}

void ArgumentReader::Read(const Element& element, bd::ZoomRectangleDef& value) const
{
    Read(element.Member("x"), value.X);
    Read(element.Member("y"), value.Y);
    Read(element.Member("width"), value.Width);
    Read(element.Member("height"), value.Height);
}

void ArgumentReader::Read(const Element& element, bdmv::UOMaskTable& value) const
{
    constexpr int last = 8 * bdmv::UOMaskTable::UO_MASK_TABLE_SIZE - 1;
    bd::UInt64 mask = 0;
    for (const std::string& text : element.Texts()) {
        bd::UserOperationMaskDef operation{};
        if (!FindEnumerator(text, operation) || operation < 0 || operation > last) {
            element.Refuse("names of user operations, not '" + text + "'");
        }
        mask |= bd::UInt64(1) << (last - operation);
    }
    value = bdmv::UOMaskTable(mask);
}

void ArgumentReader::Read(const Element& element, bdmv::IProgramData::RefPtr& value) const
{
    bd::UInt16 commands = 0;
    Read(element, commands);
    value = UnknownProgram(commands);
}

void ArgumentReader::ReadBlock(const Element& element)
{
    const std::string& text = element.Text();
    for (std::size_t i = 0; i < text.size(); i += 2) {
        const int high = DigitValue(text[i]);
        const int low = i + 1 < text.size() ? DigitValue(text[i + 1]) : -1;
        if (high < 0 || low < 0) {
            element.Refuse("two hexadecimal digits per byte, in lower case");
        }
        m_Block.push_back(static_cast<bd::UInt8>(high << 4 | low));
    }
}

void ArgumentReader::SetNeutral(bd::TimePosition& value) const
{
    value = bd::TimePositionNone;
}

void ArgumentReader::SetNeutral(bdmv::IProgramData::RefPtr& value) const
{
    value = UnknownProgram(0);
}

} // namespace deskplayer
