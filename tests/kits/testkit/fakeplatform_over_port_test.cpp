// A test of a client that links a port anyway: the fake platform replaces it.

#include <gtest/gtest.h>

#include "bd/logging.h"
#include "bdmvnavigator/navigatorevent.h"
#include "testkit/bench.h"

TEST(FakePlatformOverPort, ReceivesTheLinesOfTheLibrary)
{
    bdmvtest::Bench bench;
    EXPECT_EQ(bench.Dispatch<bdmv::PausedEvent>(), bdmvtest::Logged("Sending Paused"));
}

TEST(FakePlatformOverPort, ReceivesFailedAssertions)
{
    bdmvtest::Bench bench;
    Assert("expression", "file.cpp", 7);
    EXPECT_EQ(bench.journal.Take(), "assert: expression, file.cpp:7\n");
}
