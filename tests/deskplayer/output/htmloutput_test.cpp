#include "output/htmloutput.h"

#include <gtest/gtest.h>

#include <memory>
#include <ostream>
#include <sstream>
#include <streambuf>
#include <string>

namespace deskplayer
{
namespace
{

namespace callbacks = bdmv::callbacks;

class Page : public testing::Test
{
protected:
    void Begin(const std::string& name = "evening", const OutputFilter& filter = {})
    {
        m_Output = std::make_unique<HtmlOutput>(m_Stream, clock, filter, name,
                                                std::make_shared<PageFrame>(frame));
    }

    bdmv::INavigatorListener& Listener() { return *m_Output; }
    RecordListener& Records() { return *m_Output; }

    /** Completes the page. */
    std::string Text()
    {
        m_Output.reset();
        return m_Stream.str();
    }

    PageFrame frame{"<html>\n", "\n</html>\n", {}};
    VirtualClock clock;

private:
    std::ostringstream m_Stream;
    std::unique_ptr<Output> m_Output;
};

TEST_F(Page, ContainsTheJsonLinesInAnElement)
{
    Begin();
    Listener().AngleInfo(1);
    clock.Advance(Ticks(45000));
    Listener().Paused();

    EXPECT_EQ(Text(), "<html>\n"
                      "<script type=\"application/x-ndjson\" data-name=\"evening\">\n"
                      R"({"ticks":0,"time":"00:00:00.000","interface":"settings",)"
                      R"("callback":"AngleInfo","arguments":{"number":1}})"
                      "\n"
                      R"({"ticks":45000,"time":"00:00:01.000","interface":"control",)"
                      R"("callback":"Paused","arguments":{}})"
                      "\n</script>\n"
                      "</html>\n");
}

TEST_F(Page, ContainsGapsAndStarts)
{
    Begin();
    Records().OnStart({Ticks(0), "May 31 20:15:00"});
    Records().OnRecord({Ticks(1), callbacks::MarkInfo{800, 2, 45000}, 0b110});
    Records().OnGap({Ticks(2), "capacity", 7});

    EXPECT_NE(Text().find("\">\n"
                          R"({"ticks":0,"start":{"wallClock":"May 31 20:15:00"}})"
                          "\n"
                          R"({"ticks":1,"time":"00:00:00.000","interface":"settings",)"
                          R"("callback":"MarkInfo","arguments":{"playListId":800}})"
                          "\n"
                          R"({"ticks":2,"gap":{"lost":7,"cause":"capacity"}})"
                          "\n</script>"),
              std::string::npos);
}

TEST_F(Page, IsNotEndedByTextOfTheRecording)
{
    Begin();
    Records().OnGap({Ticks(0), "<</script><!--", std::nullopt});
    Records().OnStart({Ticks(0), "<script>"});

    EXPECT_EQ(Text(), "<html>\n"
                      "<script type=\"application/x-ndjson\" data-name=\"evening\">\n"
                      R"({"ticks":0,"gap":{"cause":"\u003c\u003c/script>\u003c!--"}})"
                      "\n"
                      R"({"ticks":0,"start":{"wallClock":"\u003cscript>"}})"
                      "\n</script>\n"
                      "</html>\n");
}

TEST_F(Page, ShowsANameThatLooksLikeTags)
{
    Begin("\"<b>&amp;'\x1B\xC3\xA9");

    EXPECT_NE(Text().find(" data-name=\"&quot;&lt;b&gt;&amp;amp;'\\x1B\xC3\xA9\">\n"),
              std::string::npos);
}

TEST_F(Page, ContainsWhatPassesTheFilter)
{
    OutputFilter filter;
    filter.KeepCallbacks("Stopped");
    Begin("evening", filter);
    Listener().Paused();
    Listener().Stopped();

    const std::string page = Text();
    EXPECT_EQ(page.find("Paused"), std::string::npos);
    EXPECT_NE(page.find("Stopped"), std::string::npos);
}

TEST_F(Page, HasOtherRecordingsAfterItsOwn)
{
    frame.writeOthers = [](std::ostream& page) { page << "<other>"; };
    Begin();

    EXPECT_EQ(Text(), "<html>\n"
                      "<script type=\"application/x-ndjson\" data-name=\"evening\">\n"
                      "</script><other>\n"
                      "</html>\n");
}

/** Accepts no more than some characters. */
class FullBuffer : public std::streambuf
{
public:
    explicit FullBuffer(std::streamsize room) : m_Room(room) {}

protected:
    int_type overflow(int_type character) override
    {
        return m_Room-- > 0 ? traits_type::not_eof(character) : traits_type::eof();
    }

private:
    std::streamsize m_Room;
};

TEST_F(Page, ShowsThatItCouldNotBeWritten)
{
    for (const std::streamsize room : {0, 10, 100}) {
        FullBuffer buffer(room);
        std::ostream stream(&buffer);
        {
            HtmlOutput output(stream, clock, OutputFilter(), "evening",
                              std::make_shared<PageFrame>(frame));
            static_cast<bdmv::INavigatorListener&>(output).Paused();
        }
        EXPECT_FALSE(stream) << room;
    }
}

TEST(RecordingElement, EscapesSingleCharacters)
{
    std::ostringstream page;
    {
        RecordingElement element(page, "");
        element.Lines().put('a').put('<').put('\xFF');
        EXPECT_TRUE(element.Lines());
    }
    EXPECT_EQ(page.str(), "<script type=\"application/x-ndjson\" data-name=\"\">\n"
                          "a\\u003c\xFF</script>");
}

TEST(RecordingElement, ShowsThatALineCouldNotBeWritten)
{
    FullBuffer buffer(100);
    std::ostream stream(&buffer);
    RecordingElement element(stream, "evening");
    element.Lines() << std::string(100, 'x');

    EXPECT_FALSE(element.Lines());
}

} // namespace
} // namespace deskplayer
