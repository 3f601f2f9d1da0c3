// Lines as they are in a library that is built without them.

#define BD_LOG_LINES 0

#include <gtest/gtest.h>

#include "bd/logging.h"
#include "support/fakeplatform.h"

namespace
{

constexpr bd::LogTag Event = {bd::CompIdBdmvNavigator, KEVRO_Log_LevelEvent, 0};

} // namespace

TEST(LogLinesLeftOut, NeitherAskTheSwitchNorEvaluateTheirArguments)
{
    bdmvtest::Journal journal;
    bdmvtest::FakePlatform platform(&journal);
    int evaluated = 0;
    BD_LOG(Event, "value %d", ++evaluated);

    EXPECT_EQ("", journal.Take());
    EXPECT_EQ(0, evaluated);
}
