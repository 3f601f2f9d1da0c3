/**
 * @file
 * A desk to test the navigator on: play lists made for the purpose, a session, and a listener that
 * writes down what it hears and when.
 */
#ifndef TESTS_DESKPLAYER_TESTDESK_H
#define TESTS_DESKPLAYER_TESTDESK_H

#include <cstdint>
#include <ostream>
#include <string>
#include <vector>

#include "session/commands.h"
#include "session/session.h"
#include "support/recordinglistener.h"

namespace deskplayer
{

constexpr Ticks Second = std::chrono::seconds(1);

/** Coding types of streams. */
constexpr std::uint8_t CodingLpcm = 0x80;
constexpr std::uint8_t CodingAc3 = 0x81;
constexpr std::uint8_t CodingEac3Secondary = 0xA1;
constexpr std::uint8_t CodingGraphics = 0x90;
constexpr std::uint8_t CodingMenu = 0x91;
constexpr std::uint8_t CodingTextSubtitle = 0x92;

/** A stream of the clip of the play item. */
Stream StreamOf(std::uint8_t codingType, std::uint16_t pid = 0);

/** A stream that a sub path brings. */
Stream StreamOfSubPath(std::uint8_t codingType, std::uint8_t subPath);

/** A play item of this duration that has one video, of 50 Hz. Its clip starts at ten minutes. */
PlayItem ItemOfTicks(Ticks duration);

/** The same in seconds. */
PlayItem Item(std::uint32_t seconds);

PlayItem WithTimedStill(PlayItem item, std::uint16_t seconds);
PlayItem WithEndlessStill(PlayItem item);

/** The item with a bit of its mask set for each of @p operations. */
PlayItem Forbidding(PlayItem item, const std::vector<bd::UserOperationMaskDef>& operations);

/** The mask as it stands in a file. */
std::uint64_t MaskOf(const std::vector<bd::UserOperationMaskDef>& operations);

/**
 * A play item of @p seconds with two of every kind of stream, in step, the second subtitle as text.
 */
PlayItem RichItem(std::uint32_t seconds);

/** A mark of type entry, at @p time after the start of the play item. */
Mark Entry(std::uint16_t item, Ticks time);

/** A mark of type link. */
Mark Link(std::uint16_t item, Ticks time);

PlayList ListOf(std::vector<PlayItem> items, std::vector<Mark> marks = {});

/**
 * A navigator over a play list, number 7, on a clock of its own, and what its listener receives.
 *
 * Throws out of playback that does not end: after many times the callbacks of the longest test.
 */
class TestDesk
{
public:
    explicit TestDesk(PlayList playList);
    ~TestDesk() = default;
    TestDesk(const TestDesk&) = delete;
    TestDesk& operator=(const TestDesk&) = delete;

    /**
     * The callbacks since the last call, one a line, each behind the second of the session it came
     * at and the ticks beyond it, if there are any: "0+900 Stepped(900, PlayDirectionForward)".
     */
    std::string Take();

    /** The same without CurrentTimePosition(). */
    std::string TakeWithoutPositions();

    /** Hooks for a session on this desk; they throw out of one that does not end. */
    SessionHooks Hooks();

    /** Plays from the start, lets so much time pass, and forgets what was heard. */
    void Start(Ticks time = Ticks(0));

    /** Takes an operation to have been carried out, and forgets what was heard of it. */
    void Do(const Outcome& outcome);

    /** All answers of the navigator that an operation can change, as a text. */
    std::string Snapshot();

    Desk desk;
    SimulatedNavigator& navigator = desk.Navigator();
    const VirtualClock& clock = desk.Clock();

private:
    /** @throw std::runtime_error when there have been too many */
    void CountStep(const std::string& step);

    bdmvtest::Journal m_Journal;
    bdmvtest::RecordingListener m_Listener{m_Journal, "A"};
    std::string m_Heard;
    int m_Steps = 0; ///< callbacks and passes of time
};

/** Shows outcomes and statuses in the messages of tests. */
void PrintTo(const Outcome& outcome, std::ostream* stream);
void PrintTo(Status status, std::ostream* stream);

} // namespace deskplayer

#endif
