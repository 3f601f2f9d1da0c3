#include "check/faultoutput.h"

#include <sstream>

#include <gtest/gtest.h>

namespace deskplayer
{

namespace
{

const Fault AtAnOffset = {"BDMV/index.bdmv", 84, "movie object of title 1 is 9", "below 3"};
const Fault OfAFile = {"disc\n/BDMV/index.bdmv", std::nullopt, "No such file or directory",
                       "a file"};
const Fault OfAFolder = {"index.bdmv", std::nullopt, "", "a regular file"};

std::string LineOf(const Fault& fault)
{
    std::ostringstream output;
    WriteFault(output, fault);
    return output.str();
}

std::string JsonOf(const Fault& fault)
{
    std::ostringstream output;
    WriteFaultAsJson(output, fault);
    return output.str();
}

TEST(FaultOutput, IsALineOfText)
{
    EXPECT_EQ(LineOf(AtAnOffset),
              "BDMV/index.bdmv: offset 84: movie object of title 1 is 9, but expected below 3\n");
    EXPECT_EQ(LineOf(OfAFile),
              "disc\\x0A/BDMV/index.bdmv: No such file or directory, expected a file\n");
    EXPECT_EQ(LineOf(OfAFolder), "index.bdmv: expected a regular file\n");
}

TEST(FaultOutput, IsALineOfJson)
{
    EXPECT_EQ(JsonOf(AtAnOffset),
              "{\"file\":\"BDMV/index.bdmv\",\"offset\":84,\"found\":\"movie object of title 1 is "
              "9\",\"expected\":\"below 3\"}\n");
    EXPECT_EQ(JsonOf(OfAFolder), "{\"file\":\"index.bdmv\",\"offset\":null,\"found\":null,"
                                 "\"expected\":\"a regular file\"}\n");
}

} // namespace

} // namespace deskplayer
