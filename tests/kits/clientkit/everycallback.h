/**
 * @file
 * Calls every callback once.
 */
#ifndef TESTS_KITS_CLIENTKIT_EVERYCALLBACK_H
#define TESTS_KITS_CLIENTKIT_EVERYCALLBACK_H

#include <vector>

#include "clientkit/callback.h"

namespace bdmvtest
{

/** The block of the call of SystemSuspended(). */
inline constexpr bd::UInt8 StandbyBlock[] = {0x00, 0xA5, 0xFF};

/** A program of as many commands as asked for. */
class ProgramOfCommands : public bdmv::IProgramData
{
public:
    explicit ProgramOfCommands(bd::UInt16 commands) : m_Commands(commands) {}

    bd::UInt16 GetNumberOfNavigationCommands() const override { return m_Commands; }
    const bdmv::INavigationCommandData*
    GetNavigationCommandData(CommandIdDef /*commandId*/) const override
    {
        return nullptr;
    }

private:
    bd::UInt16 m_Commands;
};

/** A program of three commands. */
bdmv::IProgramData::RefPtr MakeProgram();

/** Calls every callback once, in order of declaration, with distinct arguments. */
void CallEveryCallback(bdmv::INavigatorListener& listener, bdmv::IProgramData::RefPtr& program);

/** Calls every callback with MakeProgram(). */
void CallEveryCallback(bdmv::INavigatorListener& listener);

/** Keeps the callbacks as values. */
class CollectingListener : public bdmv::CallbackListener
{
public:
    std::vector<bdmv::Callback> callbacks;

private:
    void OnCallback(const bdmv::Callback& callback) override { callbacks.push_back(callback); }
};

/** The values that CallEveryCallback() leads to. */
std::vector<bdmv::Callback> EveryCallback();

} // namespace bdmvtest

#endif
