#include <gtest/gtest.h>

#include <fstream>
#include <optional>
#include <regex>
#include <string>
#include <vector>

#include "fieldlogkeeper.h"

namespace deskplayer
{

namespace
{

/** Rows of docs/outputs.md whose second cell is code, and whose example is a line of Paused. */
std::vector<std::smatch> RowsThatMatch(const std::regex& row, std::vector<std::string>& texts)
{
    std::ifstream file(BDMVNAVIGATOR_DOCS "/outputs.md");
    for (std::string text; std::getline(file, text);) {
        if (std::regex_match(text, row)) {
            texts.push_back(text);
        }
    }
    std::vector<std::smatch> rows(texts.size());
    for (std::size_t i = 0; i < texts.size(); ++i) {
        std::regex_match(texts[i], rows[i], row);
    }
    return rows;
}

/** The number of callbacks Paused in a log of one line. */
int CountPaused(const std::string& line, std::optional<PrefixPattern> pattern)
{
    FieldLogKeeper keeper;
    FieldLogReader reader(keeper, std::move(pattern));
    reader.Read(line + "\n");
    reader.Finish();
    int paused = 0;
    for (const CallbackRecord& record : keeper.records) {
        paused += record.callback.Id() == bdmv::CallbackPaused ? 1 : 0;
    }
    return paused;
}

TEST(Documentation, ShowsLinesThatAreRecognised)
{
    std::vector<std::string> texts;
    const auto rows =
        RowsThatMatch(std::regex("\\| [^|`].* \\| `(.*Sending Paused.*)` \\|"), texts);

    EXPECT_EQ(rows.size(), 8U);
    for (const std::smatch& row : rows) {
        EXPECT_EQ(CountPaused(row[1], std::nullopt), 1) << row[1];
    }
}

TEST(Documentation, ShowsPatternsThatFitTheirLines)
{
    std::vector<std::string> texts;
    const auto rows = RowsThatMatch(std::regex("\\| `(.*Sending Paused)` \\| `(.*)` \\|"), texts);

    EXPECT_EQ(rows.size(), 5U);
    for (const std::smatch& row : rows) {
        EXPECT_EQ(CountPaused(row[1], PrefixPattern(row[2].str())), 1) << row[1];
        EXPECT_EQ(CountPaused(row[1], std::nullopt), 0) << row[1];
    }
}

} // namespace

} // namespace deskplayer
