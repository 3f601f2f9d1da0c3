// Interfaces have nothing but pure virtual operations: the compiler names the operations that an
// implementation lacks.

#include <gtest/gtest.h>

#include <fstream>
#include <iterator>
#include <regex>
#include <string>

namespace
{

/** Every operation that the header declares, the destructor aside, is pure. */
class InterfaceHeaders : public testing::TestWithParam<const char*>
{
};

INSTANTIATE_TEST_SUITE_P(Of, InterfaceHeaders,
                         testing::Values("bdmv/inc/bdmvnavigator/inavcontrollistener.h",
                                         "bdmv/inc/bdmvnavigator/inavsettingslistener.h",
                                         "bdmv/inc/bdmvnavigator/inavbuttonlistener.h",
                                         "bdmv/inc/bdmvnavigator/inavinteractivelistener.h",
                                         "bdmv/inc/database/iprogramdata.h",
                                         "bdmv/inc/database/inavigationcommanddata.h",
                                         "bdmv/bdmvnavigator/iplaybackcontext.h",
                                         "bdmv/bdmvnavigator/inavigatorevent.h"));

} // namespace

TEST_P(InterfaceHeaders, DeclareOnlyPureOperations)
{
    std::ifstream file(BDMVNAVIGATOR_SOURCE_DIR "/" + std::string(GetParam()));
    const std::string text((std::istreambuf_iterator<char>(file)),
                           std::istreambuf_iterator<char>());
    const std::regex declaration("\\n *virtual [^~;{][^;{]*[;{]");
    int operations = 0;
    for (std::sregex_iterator i(text.begin(), text.end(), declaration), end; i != end; ++i) {
        ++operations;
        EXPECT_NE(std::string::npos, i->str().find("= 0;")) << i->str();
    }
    EXPECT_GT(operations, 0);
}
