#include "allevents.h"

#include <algorithm>
#include <set>

#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "eventtest.h"

namespace
{

static_assert(std::is_abstract<bdmv::INavigatorEvent>::value, "");
static_assert(std::is_abstract<bdmv::NavigatorEvent>::value, "");
static_assert(std::has_virtual_destructor<bdmv::INavigatorEvent>::value, "");
static_assert(std::has_virtual_destructor<bdmv::NavigatorEvent>::value, "");
static_assert(sizeof(bdmv::INavigatorEvent) == sizeof(void*), "");
static_assert(sizeof(bdmv::NavigatorEvent) == 2 * sizeof(void*), "has only the context");
static_assert(std::is_constructible<bdmv::TriggerSetEvent, bdmv::IPlaybackContext&, bd::TriggerType,
                                    bool>::value,
              "");
static_assert(std::is_constructible<bdmv::MarkInfoEvent, bdmv::IPlaybackContext&,
                                    bdmv::IPlayListMark::MarkType>::value,
              "");
static_assert(std::is_constructible<bdmv::AudioInfoChangedEvent, bdmv::IPlaybackContext&, bool,
                                    bd::AudioInfoType>::value,
              "");

struct BaseSized {
    void* virtualTable;
    void* context;
};
struct TriggerSetSized : BaseSized {
    bd::TriggerType type;
    bool resultInfo;
};
struct MarkInfoSized : BaseSized {
    bdmv::IPlayListMark::MarkType markType;
};
struct AudioInfoChangedSized : BaseSized {
    bool isPrimary;
    bd::AudioInfoType info;
};
static_assert(sizeof(bdmv::TriggerSetEvent) == sizeof(TriggerSetSized), "");
static_assert(sizeof(bdmv::MarkInfoEvent) == sizeof(MarkInfoSized), "");
static_assert(sizeof(bdmv::AudioInfoChangedEvent) == sizeof(AudioInfoChangedSized), "");

class AllEventClasses : public EventTest
{
};

TEST_F(AllEventClasses, AreFiftySix)
{
    EXPECT_EQ(AllEvents().size(), 56u);
}

TEST_F(AllEventClasses, FireTheirCallbacksAndNoOthers)
{
    for (const EventClass& eventClass : AllEvents()) {
        std::set<std::string> fired;
        a.onCallback = [&fired](const std::string& callback) {
            fired.insert(callback.substr(0, callback.find('(')));
        };
        for (int flags = 0; flags < 32; ++flags) {
            context.async2ndVid = (flags & 1) != 0;
            context.async2ndAud = (flags & 2) != 0;
            context.prev2ndVid = (flags & 4) != 0;
            context.prev2ndAud = (flags & 8) != 0;
            context.currentPlayMode =
                bd::PlayMode(bd::PlayDirectionForward,
                             (flags & 16) != 0 ? bd::PlaySpeedNormal : bd::PlaySpeedFast1);
            eventClass.make(context)->Dispatch(listeners);
        }

        EXPECT_EQ(fired,
                  std::set<std::string>(eventClass.callbacks.begin(), eventClass.callbacks.end()))
            << eventClass.name;
    }
}

TEST_F(AllEventClasses, TreatAnyNonZeroAnswerOfTheLogSwitchAsOn)
{
    for (const EventClass& eventClass : AllEvents()) {
        WhenTheLogSwitchIsAsked(1, [] {});
        eventClass.make(context)->Dispatch(listeners);
        const std::string on = journal.Take();
        WhenTheLogSwitchIsAsked(-2, [] {});
        eventClass.make(context)->Dispatch(listeners);

        EXPECT_EQ(journal.Take(), on) << eventClass.name;
    }
}

/** Keeps the addresses of its reference arguments. */
class AddressListener : public bdmv::NavigatorListenerAdapter
{
public:
    void Stepped(const bd::TimePosition& position, bd::PlayDirectionDef) override
    {
        addresses = {&position};
    }
    void TriggerTimeReached(bd::TriggerType, const bd::TimePosition& time) override
    {
        addresses = {&time};
    }
    void UOMask(const bdmv::UOMaskTable& mask) override { addresses = {&mask}; }
    void ChapterNumber(const bd::ChapterNumberDef& chapter) override { addresses = {&chapter}; }
    void MarkInfo(bd::PlayListIdDef, const bd::PlayListMarkIdDef& markId,
                  const bd::TimePosition& time) override
    {
        addresses = {&markId, &time};
    }
    void CurrentTimePosition(const bd::TimePosition& position) override { addresses = {&position}; }
    void ExecuteButton(bd::UInt32, bd::ButtonId, bdmv::IProgramData::RefPtr& program) override
    {
        addresses = {&program};
    }

    std::vector<const void*> addresses;
};

TEST_F(AllEventClasses, PassEveryListenerTheSameObjectsByReference)
{
    const std::set<std::string> byReference = {
        "SteppedEvent",  "TriggerReachedEvent",      "UOMaskEvent",       "ChapterEvent",
        "MarkInfoEvent", "CurrentTimePositionEvent", "ExecuteButtonEvent"};
    for (const EventClass& eventClass : AllEvents()) {
        AddressListener first;
        AddressListener second;
        Listeners addressListeners;
        addressListeners.AddListener(&first);
        addressListeners.AddListener(&second);

        eventClass.make(context)->Dispatch(addressListeners);

        EXPECT_EQ(first.addresses, second.addresses) << eventClass.name;
        EXPECT_EQ(first.addresses.empty(), byReference.count(eventClass.name) == 0)
            << eventClass.name;
    }
}

} // namespace
