/**
 * @file
 * The navigation program of a button.
 */
#ifndef DESKPLAYER_NAVIGATOR_BUTTONPROGRAM_H
#define DESKPLAYER_NAVIGATOR_BUTTONPROGRAM_H

#include <utility>
#include <vector>

#include "database/iprogramdata.h"

namespace deskplayer
{

/** A navigation command with immediate operands. */
class ButtonCommand : public bdmv::INavigationCommandData
{
public:
    explicit ButtonCommand(Command command, bd::UInt32 operand1 = 0, bd::UInt32 operand2 = 0)
        : m_Command(command), m_Operand1(operand1), m_Operand2(operand2)
    {
    }

    Command GetCommand() const override { return m_Command; }

    void GetOperands(bool& isImmediate1, bd::UInt32& operand1, bool& isImmediate2,
                     bd::UInt32& operand2) const override
    {
        isImmediate1 = true;
        operand1 = m_Operand1;
        isImmediate2 = true;
        operand2 = m_Operand2;
    }

private:
    Command m_Command;
    bd::UInt32 m_Operand1;
    bd::UInt32 m_Operand2;
};

/** A sequence of navigation commands. */
class ButtonProgram : public bdmv::IProgramData
{
public:
    explicit ButtonProgram(std::vector<ButtonCommand> commands) : m_Commands(std::move(commands)) {}

    bd::UInt16 GetNumberOfNavigationCommands() const override
    {
        return static_cast<bd::UInt16>(m_Commands.size());
    }

    /** Null for a command that does not exist. */
    const bdmv::INavigationCommandData*
    GetNavigationCommandData(CommandIdDef commandId) const override
    {
        return commandId < m_Commands.size() ? &m_Commands[commandId] : nullptr;
    }

private:
    std::vector<ButtonCommand> m_Commands;
};

} // namespace deskplayer

#endif
