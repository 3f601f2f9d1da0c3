/**
 * @file
 * A desk for tests of the navigator: play lists, sessions, and a listener that records callbacks
 * with their times.
 */
#ifndef TESTS_DESKPLAYER_TESTDESK_H
#define TESTS_DESKPLAYER_TESTDESK_H

#include <cstdint>
#include <ostream>
#include <string>
#include <vector>

#include "session/commands.h"
#include "session/session.h"
#include "testkit/recordinglistener.h"

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

/** A stream in the clip of the play item. */
Stream StreamOf(std::uint8_t codingType, std::uint16_t pid = 0);

/** A stream that a sub path carries. */
Stream StreamOfSubPath(std::uint8_t codingType, std::uint8_t subPath);

/** A play item with one video stream, of 50 Hz. Its clip starts at ten minutes. */
PlayItem ItemOfTicks(Ticks duration);

/** The same with a duration in seconds. */
PlayItem Item(std::uint32_t seconds);

PlayItem WithTimedStill(PlayItem item, std::uint16_t seconds);
PlayItem WithEndlessStill(PlayItem item);

/** The item with a mask that forbids @p operations. */
PlayItem Forbidding(PlayItem item, const std::vector<bd::UserOperationMaskDef>& operations);

/** The mask as it is in a file. */
std::uint64_t MaskOf(const std::vector<bd::UserOperationMaskDef>& operations);

/**
 * A play item of @p seconds with two streams of every kind, all synchronous; the second subtitle
 * stream is text.
 */
PlayItem RichItem(std::uint32_t seconds);

/** An entry mark at @p time after the start of the play item. */
Mark Entry(std::uint16_t item, Ticks time);

/** A link mark at @p time after the start of the play item. */
Mark Link(std::uint16_t item, Ticks time);

PlayList ListOf(std::vector<PlayItem> items, std::vector<Mark> marks = {});

/**
 * A navigator with play list number 7, and a listener that records callbacks.
 *
 * Throws if playback does not end, after more callbacks and advances than any test needs.
 */
class TestDesk
{
public:
    explicit TestDesk(PlayList playList);
    ~TestDesk() = default;
    TestDesk(const TestDesk&) = delete;
    TestDesk& operator=(const TestDesk&) = delete;

    /**
     * The callbacks since the last call, one per line, each after its session time in seconds and
     * remaining ticks, if any: "0+900 Stepped(900, PlayDirectionForward)".
     */
    std::string Take();

    /** The same without CurrentTimePosition(). */
    std::string TakeWithoutPositions();

    /** Hooks for a session on this desk; they throw if it does not end. */
    SessionHooks Hooks();

    /** Plays from the start for @p time and discards the callbacks. */
    void Start(Ticks time = Ticks(0));

    /** Expects an operation to have been carried out, and discards its callbacks. */
    void Do(const Outcome& outcome);

    /** All answers of the navigator that an operation can change, as text. */
    std::string Snapshot();

    DeskParts desk;
    SimulatedNavigator& navigator = desk.Navigator();
    const VirtualClock& clock = desk.Clock();

private:
    /** @throw std::runtime_error after too many steps */
    void CountStep(const std::string& step);

    bdmvtest::Journal m_Journal;
    bdmvtest::RecordingListener m_Listener{m_Journal, "A"};
    std::string m_Received;
    int m_Steps = 0; ///< callbacks, and advances of time
};

/** Prints outcomes and statuses in test messages. */
void PrintTo(const Outcome& outcome, std::ostream* stream);
void PrintTo(Status status, std::ostream* stream);

} // namespace deskplayer

#endif
