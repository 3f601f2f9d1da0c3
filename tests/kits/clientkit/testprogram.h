/**
 * @file
 * A program of a button that reports its destruction.
 */
#ifndef KITS_CLIENTKIT_TESTPROGRAM_H
#define KITS_CLIENTKIT_TESTPROGRAM_H

#include <functional>
#include <utility>

#include "database/iprogramdata.h"

namespace bdmvtest
{

/** Has no commands. */
class TestProgram : public bdmv::IProgramData
{
public:
    explicit TestProgram(std::function<void()> onDestruction)
        : m_OnDestruction(std::move(onDestruction))
    {
    }

    ~TestProgram() override { m_OnDestruction(); }

    TestProgram(const TestProgram&) = delete;
    TestProgram& operator=(const TestProgram&) = delete;

    bd::UInt16 GetNumberOfNavigationCommands() const override { return 0; }

    const bdmv::INavigationCommandData*
    GetNavigationCommandData(CommandIdDef /*commandId*/) const override
    {
        return nullptr;
    }

private:
    std::function<void()> m_OnDestruction;
};

} // namespace bdmvtest

#endif
