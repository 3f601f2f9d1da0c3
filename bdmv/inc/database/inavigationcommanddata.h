/**
 * @file
 * One command of a navigation program.
 */
#ifndef DATABASE_INAVIGATIONCOMMANDDATA_H
#define DATABASE_INAVIGATIONCOMMANDDATA_H

#include "bd/types.h"

namespace bdmv
{

/** A navigation command: a code and two operands. */
class INavigationCommandData
{
public:
    /** The command codes. A disc may contain a code outside the list; it is passed on unchanged. */
    enum Command : KEVRO_UInt32 {
        CommandNop = 0x00000000,
        CommandGoTo = 0x20010000,
        CommandBreak = 0x00020000,
        CommandJumpObject = 0x21000000,
        CommandJumpTitle = 0x21010000,
        CommandCallObject = 0x21020000,
        CommandCallTitle = 0x21030000,
        CommandResume = 0x01040000,
        CommandPlayPL = 0x22000000,
        CommandPlayPLEx = 0x22000001,
        CommandPlayPLatPI = 0x42010000,
        CommandPlayPLatMK = 0x42020000,
        CommandTerminatePL = 0x02030000,
        CommandLinkPI = 0x22040000,
        CommandLinkMK = 0x22050000,
        CommandBC = 0x48000100,
        CommandEQ = 0x48000200,
        CommandNE = 0x48000300,
        CommandGE = 0x48000400,
        CommandGT = 0x48000500,
        CommandLE = 0x48000600,
        CommandLT = 0x48000700,
        CommandMove = 0x50000001,
        CommandSwap = 0x50000002,
        CommandAdd = 0x50000003,
        CommandSub = 0x50000004,
        CommandMul = 0x50000005,
        CommandDiv = 0x50000006,
        CommandMod = 0x50000007,
        CommandRnd = 0x50000008,
        CommandAnd = 0x50000009,
        CommandOr = 0x5000000a,
        CommandXor = 0x5000000b,
        CommandBitSet = 0x5000000c,
        CommandBitClear = 0x5000000d,
        CommandShiftLeft = 0x5000000e,
        CommandShiftRight = 0x5000000f,
        CommandSetStream = 0x51000001,
        CommandSetNVTimer = 0x51000002,
        CommandSetButtonPage = 0x51000003,
        CommandEnableButton = 0x31000004,
        CommandDisableButton = 0x31000005,
        CommandSetSecondaryStream = 0x51000006,
        CommandPopupMenuOff = 0x11000007,
        CommandStillOn = 0x11000008,
        CommandStillOff = 0x11000009
    };

    INavigationCommandData() = default;
    virtual ~INavigationCommandData() = default;
    INavigationCommandData(const INavigationCommandData&) = default;
    INavigationCommandData& operator=(const INavigationCommandData&) = default;

    /** The code of the command; may be a number without an enumerator. */
    virtual Command GetCommand() const = 0;

    /**
     * Writes the two operands, each a flag and a value. The meaning of a flag is unspecified: the
     * program's author and its interpreter agree on it.
     *
     * @param[out] flag1    the flag of the first operand
     * @param[out] operand1 its value
     * @param[out] flag2    the flag of the second operand
     * @param[out] operand2 its value
     */
    virtual void GetOperands(bool& flag1, bd::UInt32& operand1, bool& flag2,
                             bd::UInt32& operand2) const = 0;
};

static_assert(sizeof(INavigationCommandData::Command) == 4, "a command code is 32 bits");

} // namespace bdmv

#endif
