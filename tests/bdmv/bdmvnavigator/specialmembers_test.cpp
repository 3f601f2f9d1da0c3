// The interfaces have nothing but virtual operations, are destroyed through their base, and can be
// copied by their implementations.

#include <gtest/gtest.h>

#include <memory>
#include <type_traits>

#include "bdmvnavigator/inavigatorevent.h"
#include "bdmvnavigator/inavigatorlistener.h"
#include "bdmvnavigator/iplaybackcontext.h"
#include "database/inavigationcommanddata.h"
#include "database/iplaylistmark.h"
#include "database/iprogramdata.h"

namespace
{

/** Uses the special members of an interface as an implementation does. */
template <typename Interface> struct Implementation : Interface {
    Implementation() : Interface() {}
    Implementation(const Implementation& other) : Interface(other) {}
    Implementation& operator=(const Implementation& other)
    {
        Interface::operator=(other);
        return *this;
    }
};

template struct Implementation<bdmv::INavControlListener>;
template struct Implementation<bdmv::INavSettingsListener>;
template struct Implementation<bdmv::INavButtonListener>;
template struct Implementation<bdmv::INavInteractiveListener>;
template struct Implementation<bdmv::INavigatorListener>;
template struct Implementation<bdmv::INavError>;
template struct Implementation<bdmv::IPlaybackContext>;
template struct Implementation<bdmv::IProgramData>;
template struct Implementation<bdmv::INavigationCommandData>;
template struct Implementation<bdmv::IPlayListMark>;
template struct Implementation<bdmv::INavigatorEvent>;

template <typename Interface> class Interfaces : public testing::Test
{
};

typedef testing::Types<bdmv::INavControlListener, bdmv::INavSettingsListener,
                       bdmv::INavButtonListener, bdmv::INavInteractiveListener,
                       bdmv::IPlaybackContext, bdmv::IProgramData, bdmv::INavigationCommandData,
                       bdmv::INavigatorEvent, bdmv::INavError, bdmv::IPlayListMark>
    SingleInterfaces;
TYPED_TEST_SUITE(Interfaces, SingleInterfaces, );

} // namespace

TYPED_TEST(Interfaces, HoldNothingButTheirVirtualTablePointer)
{
    EXPECT_EQ(sizeof(void*), sizeof(TypeParam));
}

TYPED_TEST(Interfaces, AreDestroyedThroughTheirVirtualDestructor)
{
    EXPECT_TRUE(std::has_virtual_destructor_v<TypeParam>);
    EXPECT_TRUE(std::is_nothrow_destructible_v<TypeParam>);
}

TYPED_TEST(Interfaces, CanBeAssigned)
{
    EXPECT_TRUE(std::is_copy_assignable_v<TypeParam>);
}

TEST(Interfaces, WithOperationsAreAbstract)
{
    EXPECT_TRUE(std::is_abstract_v<bdmv::INavControlListener>);
    EXPECT_TRUE(std::is_abstract_v<bdmv::INavSettingsListener>);
    EXPECT_TRUE(std::is_abstract_v<bdmv::INavButtonListener>);
    EXPECT_TRUE(std::is_abstract_v<bdmv::INavInteractiveListener>);
    EXPECT_TRUE(std::is_abstract_v<bdmv::INavigatorListener>);
    EXPECT_TRUE(std::is_abstract_v<bdmv::IPlaybackContext>);
    EXPECT_TRUE(std::is_abstract_v<bdmv::IProgramData>);
    EXPECT_TRUE(std::is_abstract_v<bdmv::INavigationCommandData>);
    EXPECT_TRUE(std::is_abstract_v<bdmv::INavigatorEvent>);
}

TEST(NavigatorListener, HoldsNothingButTheVirtualTablePointersOfItsBases)
{
    EXPECT_EQ(4 * sizeof(void*), sizeof(bdmv::INavigatorListener));
    EXPECT_TRUE(std::has_virtual_destructor_v<bdmv::INavigatorListener>);
    EXPECT_TRUE(std::is_copy_assignable_v<bdmv::INavigatorListener>);
}

TEST(PlaybackContext, IsAnErrorInterface)
{
    EXPECT_TRUE((std::is_convertible_v<bdmv::IPlaybackContext*, bdmv::INavError*>));
}

TEST(PlaybackContext, NamesItsErrorCodeAndItsPointerType)
{
    EXPECT_TRUE((std::is_same_v<bdmv::IPlaybackContext::ErrCode, bdmv::INavError::ErrCode>));
    EXPECT_TRUE((std::is_same_v<bdmv::IPlaybackContext::RefPtr, bd::RefPtr<bdmv::IProgramData>>));
}

TEST(ProgramData, NamesItsPointerTypeAndItsIndexType)
{
    EXPECT_TRUE((std::is_same_v<bdmv::IProgramData::RefPtr, bd::RefPtr<bdmv::IProgramData>>));
    EXPECT_TRUE((std::is_same_v<bdmv::IProgramData::CommandIdDef, bd::UInt16>));
}

TEST(PlayListMark, IsDestroyedWithItsImplementation)
{
    struct Mark : bdmv::IPlayListMark {
        explicit Mark(bool& isDestroyed) : destroyed(isDestroyed) {}
        ~Mark() override { destroyed = true; }

        bool& destroyed;
    };
    bool destroyed = false;

    std::unique_ptr<bdmv::IPlayListMark>(new Mark(destroyed)).reset();

    EXPECT_TRUE(destroyed);
}
