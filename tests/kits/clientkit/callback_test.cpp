#include "clientkit/callback.h"

#include <gtest/gtest.h>

#include <string>
#include <type_traits>
#include <vector>

#include "kits/clientkit/everycallback.h"

namespace bdmv
{
namespace
{

using namespace callbacks;

static_assert(sizeof(Callback) <= 40, "fits into most of a cache line");
static_assert(!std::is_default_constructible<Callback>::value, "a value is always a callback");
static_assert(std::is_convertible<PlayItem, Callback>::value, "a callback is its arguments");
static_assert(!std::is_convertible<int, Callback>::value, "nothing else is a callback");

#define HAS_PLAIN_ARGUMENTS(interface, name)                                                       \
    static_assert(std::is_trivially_copyable<name>::value ==                                       \
                      !std::is_same<name, ExecuteButton>::value,                                   \
                  "only a program is more than its bytes");                                        \
    static_assert(std::is_trivially_destructible<name>::value ==                                   \
                      !std::is_same<name, ExecuteButton>::value,                                   \
                  "only a program is released");
BDMV_CALLBACKS(HAS_PLAIN_ARGUMENTS)
#undef HAS_PLAIN_ARGUMENTS

/** A program that owns a callback. */
class ProgramWithCallback : public IProgramData
{
public:
    explicit ProgramWithCallback(const Callback& callback) : m_Callback(callback) {}

    const Callback& GetCallback() const { return m_Callback; }

    bd::UInt16 GetNumberOfNavigationCommands() const override { return 0; }
    const INavigationCommandData* GetNavigationCommandData(CommandIdDef) const override
    {
        return nullptr;
    }

private:
    Callback m_Callback;
};

TEST(Callback, GivesItsArguments)
{
    const Callback callback =
        PlayItem{800, 2, bd::VideoFormatType1080p, bd::VideoAspectRatioType4x3};

    EXPECT_EQ(CallbackPlayItem, callback.Id());
    const PlayItem* const item = callback.As<PlayItem>();
    ASSERT_NE(nullptr, item);
    EXPECT_EQ(800U, item->playListId);
    EXPECT_EQ(2, item->playItemId);
    EXPECT_EQ(bd::VideoFormatType1080p, item->videoFormat);
    EXPECT_EQ(bd::VideoAspectRatioType4x3, item->aspectRatio);
}

TEST(Callback, HasNoArgumentsOfAnotherCallback)
{
    const Callback callback = AudioInfo{1};

    EXPECT_EQ(nullptr, callback.As<VideoInfo>());
}

TEST(Callback, VisitsTheArgumentsAsTheirType)
{
    for (const Callback& callback : bdmvtest::EveryCallback()) {
        int visits = 0;
        callback.Visit([&](const auto& arguments) {
            typedef std::decay_t<decltype(arguments)> Arguments;
            EXPECT_EQ(callback.As<Arguments>(), &arguments) << NameOf(callback.Id());
            ++visits;
        });
        EXPECT_EQ(1, visits) << NameOf(callback.Id());
    }
}

TEST(Callback, VisitsEachArgumentByNameInOrder)
{
    const auto namesOf = [](const Callback& callback) {
        std::string names;
        callback.VisitArguments(
            [&](const char* name, const auto&) { names += std::string(name) + " "; });
        return names;
    };

    EXPECT_EQ("", namesOf(Paused{}));
    EXPECT_EQ("clip destination delay ", namesOf(ZoomModeSet{}));
    EXPECT_EQ("data size ", namesOf(SystemSuspended{nullptr, 0}));
    EXPECT_EQ("isPrimary format sampleRate bitsPerSample channels pid channelLayout ",
              namesOf(AudioInfoChanged{true, bd::AudioInfoType()}));
    EXPECT_EQ("forbidden ", namesOf(UOMask{UOMaskTable()}));
    EXPECT_EQ("ticket buttonId commands ", namesOf(ExecuteButton{1, 2, nullptr}));
}

TEST(Callback, SharesItsProgramWithItsCopies)
{
    const IProgramData::RefPtr program = bdmvtest::MakeProgram();
    {
        const Callback callback = ExecuteButton{1, 2, program};
        EXPECT_EQ(2, program.GetCount());
        const Callback copy(callback);
        EXPECT_EQ(3, program.GetCount());
        EXPECT_EQ(program.Get(), copy.As<ExecuteButton>()->program.Get());
    }
    EXPECT_EQ(1, program.GetCount());
}

TEST(Callback, CopiesEveryCallback)
{
    for (const Callback& callback : bdmvtest::EveryCallback()) {
        const Callback copy(callback);
        EXPECT_TRUE(copy == callback) << NameOf(callback.Id());
    }
}

TEST(Callback, IsAssignedFromEveryCallbackToEveryOther)
{
    const std::vector<Callback> callbacks = bdmvtest::EveryCallback();
    for (const Callback& from : callbacks) {
        for (const Callback& to : callbacks) {
            Callback callback(to);
            callback = from;
            EXPECT_TRUE(callback == from) << NameOf(from.Id()) << ' ' << NameOf(to.Id());
        }
    }
}

TEST(Callback, ReleasesItsProgramWhenItIsAssigned)
{
    const IProgramData::RefPtr first = bdmvtest::MakeProgram();
    const IProgramData::RefPtr second = bdmvtest::MakeProgram();
    Callback callback = ExecuteButton{1, 2, first};

    callback = ExecuteButton{1, 2, second};
    EXPECT_EQ(1, first.GetCount());
    EXPECT_EQ(2, second.GetCount());

    callback = Paused{};
    EXPECT_EQ(1, second.GetCount());
}

TEST(Callback, IsUnchangedWhenItIsAssignedToItself)
{
    const IProgramData::RefPtr program = bdmvtest::MakeProgram();
    Callback callback = ExecuteButton{1, 2, program};
    const Callback& same = callback;

    callback = same;

    EXPECT_EQ(2, program.GetCount());
    EXPECT_TRUE(callback == Callback(ExecuteButton{1, 2, program}));
}

TEST(Callback, IsAssignedFromAValueThatItsOwnProgramOwns)
{
    auto* const program = new ProgramWithCallback(AudioInfo{2});
    Callback callback = ExecuteButton{1, 2, program};

    callback = program->GetCallback(); // and the program is deleted

    EXPECT_TRUE(callback == Callback(AudioInfo{2}));
}

} // namespace
} // namespace bdmv
