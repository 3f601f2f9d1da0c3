#include <gtest/gtest.h>

#include <cstdlib>
#include <cstring>
#include <functional>
#include <memory>
#include <new>
#include <string>
#include <type_traits>
#include <utility>

#include "bd/refptr.h"
#include "testkit/allocationcounter.h"
#include "testkit/fakeplatform.h"
#include "testkit/operatornew.h"

namespace
{

/** Records its destruction in the journal; may run an action of the test first. */
class Object
{
public:
    Object(bdmvtest::Journal& journal, std::string name)
        : m_rJournal(journal), m_Name(std::move(name))
    {
    }

    virtual ~Object()
    {
        if (onDestruction) {
            onDestruction();
        }
        m_rJournal.Add("~" + m_Name);
    }

    Object(const Object&) = delete;
    Object& operator=(const Object&) = delete;

    const std::string& Name() const { return m_Name; }

    std::function<void()> onDestruction;
    bd::RefPtr<Object> next;

private:
    bdmvtest::Journal& m_rJournal;
    std::string m_Name;
};

typedef bd::RefPtr<Object> ObjectPtr;

class RefPtr : public testing::Test
{
protected:
    Object* New(const std::string& name) { return new Object(journal, name); }

    bdmvtest::Journal journal;
    bdmvtest::FakePlatform platform{&journal};
};

/** Records the platform calls in the journal as well. */
class RefPtrCalls : public RefPtr
{
protected:
    RefPtrCalls() { platform.RecordAtomicAdds(); }
};

void ExpectEmpty(const ObjectPtr& pointer)
{
    EXPECT_EQ(nullptr, pointer.Get());
    EXPECT_EQ(nullptr, pointer.operator->());
    EXPECT_FALSE(static_cast<bool>(pointer));
    EXPECT_TRUE(pointer.Null());
    EXPECT_FALSE(pointer.IsValid());
    EXPECT_FALSE(pointer.IsUnique());
    EXPECT_EQ(0, pointer.GetCount());
}

} // namespace

TEST_F(RefPtr, IsEmptyByDefault)
{
    const ObjectPtr pointer;

    ExpectEmpty(pointer);
}

TEST_F(RefPtr, IsEmptyWhenConstructedFromNull)
{
    const ObjectPtr pointer(nullptr);

    ExpectEmpty(pointer);
}

TEST_F(RefPtr, GivesAccessToTheObject)
{
    Object* const object = New("A");
    const ObjectPtr pointer(object);

    EXPECT_EQ(object, pointer.Get());
    EXPECT_EQ(object, &*pointer);
    EXPECT_EQ("A", pointer->Name());
    EXPECT_TRUE(static_cast<bool>(pointer));
    EXPECT_FALSE(pointer.Null());
    EXPECT_TRUE(pointer.IsValid());
}

TEST_F(RefPtr, StartsTheCountAtOne)
{
    const ObjectPtr pointer(New("A"));

    EXPECT_EQ(1, pointer.GetCount());
    EXPECT_TRUE(pointer.IsUnique());
}

TEST_F(RefPtr, ConvertsImplicitlyFromARawPointer)
{
    const auto factory = [this]() -> ObjectPtr { return New("A"); };

    EXPECT_EQ("A", factory()->Name());
}

TEST_F(RefPtr, ConvertsToBoolOnlyExplicitly)
{
    EXPECT_TRUE((std::is_constructible_v<bool, const ObjectPtr&>));
    EXPECT_FALSE((std::is_convertible_v<const ObjectPtr&, bool>));
}

TEST_F(RefPtr, HoldsTheObjectThenTheCounter)
{
    const ObjectPtr pointer(New("A"));
    const ObjectPtr copy(pointer);
    void* words[2];
    ASSERT_EQ(sizeof(words), sizeof(pointer));
    std::memcpy(words, static_cast<const void*>(&pointer), sizeof(words));
    KEVRO_Int32 count = 0;
    std::memcpy(&count, words[1], sizeof(count));

    EXPECT_EQ(pointer.Get(), words[0]);
    EXPECT_EQ(2, count);
}

TEST_F(RefPtr, HoldsTwoNullPointersWhenEmpty)
{
    ObjectPtr pointer(New("A"));
    pointer.Release();
    void* words[2];
    ASSERT_EQ(sizeof(words), sizeof(pointer));
    std::memcpy(words, static_cast<const void*>(&pointer), sizeof(words));

    EXPECT_EQ(nullptr, words[0]);
    EXPECT_EQ(nullptr, words[1]);
}

TEST_F(RefPtr, DestroysTheObjectThroughItsVirtualDestructor)
{
    struct Derived : Object {
        Derived(bdmvtest::Journal& log) : Object(log, "Base"), journal(log) {}
        ~Derived() override { journal.Add("~Derived"); }
        bdmvtest::Journal& journal;
    };
    {
        const ObjectPtr pointer(new Derived(journal));
    }

    EXPECT_EQ("~Derived\n~Base\n", journal.Take());
}

TEST_F(RefPtr, CopySharesTheObject)
{
    const ObjectPtr pointer(New("A"));
    const ObjectPtr copy(pointer);

    EXPECT_EQ(pointer.Get(), copy.Get());
    EXPECT_EQ(2, pointer.GetCount());
    EXPECT_EQ(2, copy.GetCount());
    EXPECT_FALSE(pointer.IsUnique());
    EXPECT_FALSE(copy.IsUnique());
}

TEST_F(RefPtr, CopyOfAnEmptyOneIsEmpty)
{
    const ObjectPtr empty;
    const ObjectPtr copy(empty);

    ExpectEmpty(copy);
}

TEST_F(RefPtr, ObjectLivesUntilTheLastOfManyReleasesIt)
{
    ObjectPtr first(New("A"));
    ObjectPtr second(first);
    ObjectPtr third(second);
    EXPECT_EQ(3, first.GetCount());

    first.Release();
    EXPECT_EQ(2, third.GetCount());
    third.Release();
    EXPECT_EQ("", journal.Take());
    EXPECT_TRUE(second.IsUnique());
    EXPECT_EQ("A", second->Name());
    second.Release();
    EXPECT_EQ("~A\n", journal.Take());
}

TEST_F(RefPtr, CopyMadeByACalleeKeepsTheObject)
{
    ObjectPtr kept;
    const auto listener = [&kept](ObjectPtr& pointer) { kept = pointer; };
    {
        ObjectPtr local(New("A"));
        listener(local);
    }

    EXPECT_EQ("", journal.Take());
    EXPECT_EQ("A", kept->Name());
    EXPECT_TRUE(kept.IsUnique());
}

TEST_F(RefPtr, IsEmptyAfterReleaseByTheLast)
{
    ObjectPtr pointer(New("A"));
    pointer.Release();

    ExpectEmpty(pointer);
}

TEST_F(RefPtr, IsEmptyAfterReleaseByOneOfMany)
{
    ObjectPtr pointer(New("A"));
    const ObjectPtr copy(pointer);
    pointer.Release();

    ExpectEmpty(pointer);
    EXPECT_TRUE(copy.IsUnique());
}

TEST_F(RefPtr, ReleasesWhenAnExceptionLeavesItsScope)
{
    try {
        const ObjectPtr pointer(New("A"));
        throw 1;
    } catch (int) {
    }

    EXPECT_EQ("~A\n", journal.Take());
}

// All calls of the platform, and the destructions between them.

TEST_F(RefPtrCalls, TakingARawPointerMakesNoCall)
{
    const ObjectPtr pointer(New("A"));

    EXPECT_EQ("", journal.Take());
}

TEST_F(RefPtrCalls, CopyingAddsOne)
{
    const ObjectPtr pointer(New("A"));
    const ObjectPtr copy(pointer);

    EXPECT_EQ("atomic add 1 -> 2\n", journal.Take());
}

TEST_F(RefPtrCalls, CopyingAnEmptyOneMakesNoCall)
{
    const ObjectPtr empty;
    const ObjectPtr copy(empty);

    EXPECT_EQ("", journal.Take());
}

TEST_F(RefPtrCalls, ReleasingAnEmptyOneMakesNoCall)
{
    ObjectPtr pointer;
    pointer.Release();

    EXPECT_EQ("", journal.Take());
    ExpectEmpty(pointer);
}

TEST_F(RefPtrCalls, ReleasingOneOfTwoSubtractsOneAndDestroysNothing)
{
    ObjectPtr pointer(New("A"));
    const ObjectPtr copy(pointer);
    journal.Take();
    pointer.Release();

    EXPECT_EQ("atomic add -1 -> 1\n", journal.Take());
}

TEST_F(RefPtrCalls, ReleasingTheLastSubtractsOneAndDestroysTheObject)
{
    ObjectPtr pointer(New("A"));
    pointer.Release();

    EXPECT_EQ("atomic add -1 -> 0\n~A\n", journal.Take());
}

TEST_F(RefPtrCalls, SecondReleaseMakesNoCall)
{
    ObjectPtr pointer(New("A"));
    const ObjectPtr copy(pointer);
    pointer.Release();
    journal.Take();
    pointer.Release();

    EXPECT_EQ("", journal.Take());
    EXPECT_EQ(1, copy.GetCount());
}

TEST_F(RefPtrCalls, DestructionReleases)
{
    {
        const ObjectPtr pointer(New("A"));
    }

    EXPECT_EQ("atomic add -1 -> 0\n~A\n", journal.Take());
}

TEST_F(RefPtrCalls, DestructionOfAnEmptyOneMakesNoCall)
{
    {
        const ObjectPtr pointer;
    }

    EXPECT_EQ("", journal.Take());
}

TEST_F(RefPtrCalls, MovingMakesNoCall)
{
    ObjectPtr pointer(New("A"));
    ObjectPtr other(std::move(pointer));
    ObjectPtr third;
    third = std::move(other);

    EXPECT_EQ("", journal.Take());
}

TEST_F(RefPtrCalls, AssigningToAnEmptyOneAddsOne)
{
    const ObjectPtr pointer(New("A"));
    ObjectPtr other;
    other = pointer;

    EXPECT_EQ("atomic add 1 -> 2\n", journal.Take());
}

TEST_F(RefPtrCalls, AssigningAnEmptyOneReleases)
{
    ObjectPtr pointer(New("A"));
    pointer = ObjectPtr();

    EXPECT_EQ("atomic add -1 -> 0\n~A\n", journal.Take());
}

TEST_F(RefPtrCalls, AssigningARawPointerReleases)
{
    ObjectPtr pointer(New("A"));
    pointer = New("B");

    EXPECT_EQ("atomic add -1 -> 0\n~A\n", journal.Take());
}

// Assignment

TEST_F(RefPtr, AssignmentReleasesAndShares)
{
    ObjectPtr pointer(New("A"));
    const ObjectPtr other(New("B"));
    pointer = other;

    EXPECT_EQ("~A\n", journal.Take());
    EXPECT_EQ(other.Get(), pointer.Get());
    EXPECT_EQ(2, other.GetCount());
}

TEST_F(RefPtr, AssignmentLeavesASharedObjectAlive)
{
    ObjectPtr pointer(New("A"));
    const ObjectPtr kept(pointer);
    const ObjectPtr other(New("B"));
    pointer = other;

    EXPECT_EQ("", journal.Take());
    EXPECT_TRUE(kept.IsUnique());
}

TEST_F(RefPtr, AssignmentOfAnEmptyOneEmpties)
{
    ObjectPtr pointer(New("A"));
    const ObjectPtr empty;
    pointer = empty;

    EXPECT_EQ("~A\n", journal.Take());
    ExpectEmpty(pointer);
}

TEST_F(RefPtr, AssignmentOfARawPointerTakesOwnership)
{
    ObjectPtr pointer(New("A"));
    Object* const object = New("B");
    pointer = object;

    EXPECT_EQ("~A\n", journal.Take());
    EXPECT_EQ(object, pointer.Get());
    EXPECT_EQ(1, pointer.GetCount());
    pointer.Release();
    EXPECT_EQ("~B\n", journal.Take());
}

TEST_F(RefPtr, AssignmentOfNullEmpties)
{
    ObjectPtr pointer(New("A"));
    pointer = nullptr;

    EXPECT_EQ("~A\n", journal.Take());
    ExpectEmpty(pointer);
}

TEST_F(RefPtr, AssignmentReturnsTheRefPtr)
{
    ObjectPtr pointer;
    const ObjectPtr other(New("A"));

    EXPECT_EQ(&pointer, &(pointer = other));
    EXPECT_EQ(&pointer, &(pointer = New("B")));
    EXPECT_EQ(&pointer, &(pointer = ObjectPtr()));
}

TEST_F(RefPtr, AssignmentToItselfChangesNothing)
{
    ObjectPtr pointer(New("A"));
    const ObjectPtr& itself = pointer;
    pointer = itself;

    EXPECT_EQ("", journal.Take());
    EXPECT_EQ("A", pointer->Name());
    EXPECT_EQ(1, pointer.GetCount());
}

TEST_F(RefPtr, AssignmentToItselfChangesNothingWhenShared)
{
    ObjectPtr pointer(New("A"));
    const ObjectPtr copy(pointer);
    const ObjectPtr& itself = pointer;
    pointer = itself;

    EXPECT_EQ("", journal.Take());
    EXPECT_EQ(copy.Get(), pointer.Get());
    EXPECT_EQ(2, pointer.GetCount());
}

TEST_F(RefPtr, AssignmentOfACopyOfItselfChangesNothing)
{
    ObjectPtr pointer(New("A"));
    const ObjectPtr copy(pointer);
    pointer = copy;

    EXPECT_EQ("", journal.Take());
    EXPECT_EQ(copy.Get(), pointer.Get());
    EXPECT_EQ(2, copy.GetCount());
}

TEST_F(RefPtr, AssignmentOfItsOwnRawPointerChangesNothing)
{
    ObjectPtr pointer(New("A"));
    pointer = pointer.Get();

    EXPECT_EQ("", journal.Take());
    EXPECT_EQ("A", pointer->Name());
    EXPECT_EQ(1, pointer.GetCount());
}

TEST_F(RefPtr, AssignmentOfItsOwnRawPointerChangesNothingWhenShared)
{
    ObjectPtr pointer(New("A"));
    const ObjectPtr copy(pointer);
    pointer = pointer.Get();

    EXPECT_EQ("", journal.Take());
    EXPECT_EQ(copy.Get(), pointer.Get());
    EXPECT_EQ(2, copy.GetCount());
}

TEST_F(RefPtr, AssignmentOfAnEmptyOneToItselfChangesNothing)
{
    ObjectPtr pointer;
    const ObjectPtr& itself = pointer;
    pointer = itself;
    pointer = pointer.Get();

    ExpectEmpty(pointer);
}

TEST_F(RefPtr, AssignmentKeepsASourceWithinTheReleasedObject)
{
    ObjectPtr pointer(New("A"));
    pointer->next = New("B");
    pointer->next->next = New("C");
    pointer = pointer->next;

    EXPECT_EQ("~A\n", journal.Take());
    EXPECT_EQ("B", pointer->Name());
    EXPECT_EQ(1, pointer.GetCount());
    EXPECT_EQ("C", pointer->next->Name());
}

TEST_F(RefPtr, MoveAssignmentKeepsASourceWithinTheReleasedObject)
{
    ObjectPtr pointer(New("A"));
    pointer->next = New("B");
    pointer = std::move(pointer->next);

    EXPECT_EQ("~A\n", journal.Take());
    EXPECT_EQ("B", pointer->Name());
    EXPECT_EQ(1, pointer.GetCount());
}

// Moving

TEST_F(RefPtr, MoveEmptiesTheSourceAndKeepsTheCount)
{
    ObjectPtr pointer(New("A"));
    const ObjectPtr copy(pointer);
    const ObjectPtr moved(std::move(pointer));

    ExpectEmpty(pointer);
    EXPECT_EQ(copy.Get(), moved.Get());
    EXPECT_EQ(2, moved.GetCount());
}

TEST_F(RefPtr, MoveAssignmentReleasesAndEmptiesTheSource)
{
    ObjectPtr pointer(New("A"));
    ObjectPtr other(New("B"));
    pointer = std::move(other);

    EXPECT_EQ("~A\n", journal.Take());
    ExpectEmpty(other);
    EXPECT_EQ("B", pointer->Name());
    EXPECT_EQ(1, pointer.GetCount());
}

TEST_F(RefPtr, MoveAssignmentToItselfChangesNothing)
{
    ObjectPtr pointer(New("A"));
    ObjectPtr& itself = pointer;
    pointer = std::move(itself);

    EXPECT_EQ("", journal.Take());
    EXPECT_EQ("A", pointer->Name());
    EXPECT_EQ(1, pointer.GetCount());
}

TEST_F(RefPtr, MoveAssignmentBetweenTwoThatShareLeavesOne)
{
    ObjectPtr pointer(New("A"));
    ObjectPtr other(pointer);
    pointer = std::move(other);

    EXPECT_EQ("", journal.Take());
    ExpectEmpty(other);
    EXPECT_EQ("A", pointer->Name());
    EXPECT_EQ(1, pointer.GetCount());
}

TEST_F(RefPtr, MovesDoNotThrow)
{
    EXPECT_TRUE(std::is_nothrow_move_constructible_v<ObjectPtr>);
    EXPECT_TRUE(std::is_nothrow_move_assignable_v<ObjectPtr>);
}

// Destructors of objects that use the RefPtr that is releasing them.

TEST_F(RefPtr, DestructorMayReadTheReleasingRefPtr)
{
    Object* const object = New("A");
    ObjectPtr pointer(object);
    const Object* seen = nullptr;
    KEVRO_Int32 count = -1;
    bool unique = true;
    bool valid = false;
    object->onDestruction = [&] {
        seen = pointer.Get();
        count = pointer.GetCount();
        unique = pointer.IsUnique();
        valid = pointer.IsValid();
    };
    pointer.Release();

    EXPECT_EQ(object, seen);
    EXPECT_EQ(0, count);
    EXPECT_FALSE(unique);
    EXPECT_TRUE(valid);
    EXPECT_EQ("~A\n", journal.Take());
}

TEST_F(RefPtr, DestructorMayReleaseTheReleasingRefPtr)
{
    ObjectPtr pointer(New("A"));
    pointer->onDestruction = [&pointer] { pointer.Release(); };
    pointer.Release();

    EXPECT_EQ("~A\n", journal.Take());
    ExpectEmpty(pointer);
}

TEST_F(RefPtr, DestructorMayReleaseTheDestroyedRefPtr)
{
    std::unique_ptr<ObjectPtr> pointer(new ObjectPtr(New("A")));
    ObjectPtr& releasing = *pointer;
    releasing->onDestruction = [&releasing] { releasing.Release(); };
    pointer.reset();

    EXPECT_EQ("~A\n", journal.Take());
}

TEST_F(RefPtr, DestructorMayAssignNullToTheReleasingRefPtr)
{
    ObjectPtr pointer(New("A"));
    pointer->onDestruction = [&pointer] { pointer = nullptr; };
    pointer.Release();

    EXPECT_EQ("~A\n", journal.Take());
    ExpectEmpty(pointer);
}

TEST_F(RefPtr, DestructorMayAssignToTheReleasingRefPtr)
{
    const ObjectPtr other(New("B"));
    ObjectPtr pointer(New("A"));
    pointer->onDestruction = [&pointer, &other] { pointer = other; };
    pointer.Release();

    EXPECT_EQ("~A\n", journal.Take());
    ExpectEmpty(pointer);
    EXPECT_TRUE(other.IsUnique());
}

TEST_F(RefPtr, DestructorMayAssignARawPointerToTheReleasingRefPtr)
{
    ObjectPtr pointer(New("A"));
    pointer->onDestruction = [this, &pointer] { pointer = New("B"); };
    pointer.Release();

    EXPECT_EQ("~A\n~B\n", journal.Take());
    ExpectEmpty(pointer);
}

TEST_F(RefPtr, DestructorMayAssignToTheDestroyedRefPtr)
{
    const ObjectPtr other(New("B"));
    std::unique_ptr<ObjectPtr> pointer(new ObjectPtr(New("A")));
    ObjectPtr& releasing = *pointer;
    releasing->onDestruction = [&releasing, &other] { releasing = other; };
    pointer.reset();

    EXPECT_EQ("~A\n", journal.Take());
    EXPECT_TRUE(other.IsUnique());
}

TEST_F(RefPtr, DestructorMayMoveIntoTheReleasingRefPtr)
{
    ObjectPtr other(New("B"));
    ObjectPtr pointer(New("A"));
    pointer->onDestruction = [&pointer, &other] { pointer = std::move(other); };
    pointer.Release();

    EXPECT_EQ("~A\n~B\n", journal.Take());
    ExpectEmpty(pointer);
    ExpectEmpty(other);
}

TEST_F(RefPtr, AssignmentOverridesThatOfTheDestructor)
{
    const ObjectPtr intruder(New("B"));
    const ObjectPtr other(New("C"));
    ObjectPtr pointer(New("A"));
    pointer->onDestruction = [&pointer, &intruder] { pointer = intruder; };
    pointer = other;

    EXPECT_EQ("~A\n", journal.Take());
    EXPECT_EQ("C", pointer->Name());
    EXPECT_EQ(2, other.GetCount());
    EXPECT_TRUE(intruder.IsUnique());
}

TEST_F(RefPtr, AssignmentOfARawPointerOverridesThatOfTheDestructor)
{
    const ObjectPtr intruder(New("B"));
    ObjectPtr pointer(New("A"));
    pointer->onDestruction = [&pointer, &intruder] { pointer = intruder; };
    pointer = New("C");

    EXPECT_EQ("~A\n", journal.Take());
    EXPECT_EQ("C", pointer->Name());
    EXPECT_EQ(1, pointer.GetCount());
    EXPECT_TRUE(intruder.IsUnique());
}

// Memory

namespace
{

/** Counts its objects; their memory is not among the counted blocks. */
struct Uncounted {
    Uncounted() { ++alive; }
    virtual ~Uncounted() { --alive; }
    Uncounted(const Uncounted&) = delete;
    Uncounted& operator=(const Uncounted&) = delete;

    static void* operator new(std::size_t size)
    {
        void* const block = std::malloc(size);
        if (block == nullptr) {
            throw std::bad_alloc();
        }
        return block;
    }

    static void operator delete(void* block)
    {
        std::free(block);
        blocksWhenFreed = bdmvtest::CountLiveBlocks();
    }

    static int alive;
    static long blocksWhenFreed; ///< number of blocks when the last object's memory was freed
};

int Uncounted::alive = 0;
long Uncounted::blocksWhenFreed = 0;

typedef bd::RefPtr<Uncounted> UncountedPtr;

class RefPtrMemory : public testing::Test
{
protected:
    RefPtrMemory() : blocks(bdmvtest::CountLiveBlocks()) { Uncounted::blocksWhenFreed = -1; }
    ~RefPtrMemory() override { bdmvtest::FailAllocationAfter(-1); }

    /** Whether the action throws when one block cannot be allocated. */
    template <typename Action> static bool LacksMemory(Action action)
    {
        bdmvtest::FailAllocationAfter(0);
        try {
            action();
        } catch (const std::bad_alloc&) {
            bdmvtest::FailAllocationAfter(-1);
            return true;
        }
        bdmvtest::FailAllocationAfter(-1);
        return false;
    }

    const long blocks; ///< number of blocks before the test
};

} // namespace

TEST_F(RefPtrMemory, CounterIsASeparateBlock)
{
    const UncountedPtr pointer(new Uncounted);

    EXPECT_EQ(blocks + 1, bdmvtest::CountLiveBlocks());
}

TEST_F(RefPtrMemory, EmptyOneHasNoCounter)
{
    const UncountedPtr empty;
    const UncountedPtr null(nullptr);
    UncountedPtr assigned;
    assigned = nullptr;

    EXPECT_EQ(blocks, bdmvtest::CountLiveBlocks());
}

TEST_F(RefPtrMemory, CopyAllocatesNothing)
{
    const UncountedPtr pointer(new Uncounted);
    const std::size_t before = bdmvtest::CountAllocations();
    const UncountedPtr copy(pointer);
    UncountedPtr assigned;
    assigned = pointer;
    const std::size_t after = bdmvtest::CountAllocations();

    EXPECT_EQ(3, pointer.GetCount());
    EXPECT_EQ(before, after);
}

TEST_F(RefPtrMemory, MoveAllocatesNothing)
{
    UncountedPtr pointer(new Uncounted);
    const std::size_t before = bdmvtest::CountAllocations();
    UncountedPtr moved(std::move(pointer));
    UncountedPtr assigned;
    assigned = std::move(moved);
    const std::size_t after = bdmvtest::CountAllocations();

    EXPECT_TRUE(assigned.IsUnique());
    EXPECT_EQ(before, after);
}

TEST_F(RefPtrMemory, CounterIsFreedAfterTheObject)
{
    UncountedPtr pointer(new Uncounted);
    pointer.Release();

    EXPECT_EQ(blocks + 1, Uncounted::blocksWhenFreed);
    EXPECT_EQ(blocks, bdmvtest::CountLiveBlocks());
    EXPECT_EQ(0, Uncounted::alive);
}

TEST_F(RefPtrMemory, CounterLivesUntilTheLastRelease)
{
    UncountedPtr pointer(new Uncounted);
    UncountedPtr copy(pointer);
    pointer.Release();

    EXPECT_EQ(blocks + 1, bdmvtest::CountLiveBlocks());
    copy.Release();
    EXPECT_EQ(blocks, bdmvtest::CountLiveBlocks());
}

TEST_F(RefPtrMemory, ReplacedCounterIsFreed)
{
    const UncountedPtr other(new Uncounted);
    UncountedPtr pointer(new Uncounted);
    pointer = new Uncounted;
    pointer = other;
    pointer = UncountedPtr();

    EXPECT_EQ(blocks + 1, bdmvtest::CountLiveBlocks());
    EXPECT_EQ(1, Uncounted::alive);
}

TEST_F(RefPtrMemory, ObjectIsDeletedWhenTheCounterCannotBeAllocated)
{
    EXPECT_TRUE(LacksMemory([] { const UncountedPtr pointer(new Uncounted); }));
    EXPECT_EQ(0, Uncounted::alive);
    EXPECT_EQ(blocks, bdmvtest::CountLiveBlocks());
}

TEST_F(RefPtrMemory, AssignedObjectIsDeletedWhenTheCounterCannotBeAllocated)
{
    UncountedPtr pointer;
    EXPECT_TRUE(LacksMemory([&pointer] { pointer = new Uncounted; }));
    EXPECT_EQ(0, Uncounted::alive);
    EXPECT_TRUE(pointer.Null());
    EXPECT_EQ(0, pointer.GetCount());
    EXPECT_EQ(blocks, bdmvtest::CountLiveBlocks());
}

TEST_F(RefPtrMemory, CurrentObjectStaysWhenTheNewCounterCannotBeAllocated)
{
    Uncounted* const object = new Uncounted;
    UncountedPtr pointer(object);
    EXPECT_TRUE(LacksMemory([&pointer] { pointer = new Uncounted; }));
    EXPECT_EQ(object, pointer.Get());
    EXPECT_EQ(1, Uncounted::alive);
    EXPECT_TRUE(pointer.IsUnique());
    EXPECT_EQ(blocks + 1, bdmvtest::CountLiveBlocks());
}
