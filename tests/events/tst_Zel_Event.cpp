#include "EventTestSupport.h"
#include "VtableSlot.h"

#include <gtest/gtest.h>

namespace {

// The base class is abstract; this event keeps its rendering.
class PlainEvent : public Zel_Event
{
public:
    explicit PlainEvent(boost::shared_ptr<QString> m)
        : Zel_Event(m)
    {
    }
    const unsigned long getEventType() const override { return 1; }
};

// An event whose moniker comes from an override: the rendering must use it.
class RedirectedEvent : public Zel_EventChildRemoved
{
public:
    RedirectedEvent()
        : Zel_EventChildRemoved(moniker("stored"), moniker("kid"))
    {
    }
    const boost::shared_ptr<QString> getMonikerSP() const override { return moniker("overridden"); }
};

} // namespace

TEST(Zel_EventTest, RendersClassNameParentAndChild)
{
    Zel_EventChildAdded added(moniker("/proj/bin"), moniker("/proj/bin/clip"));
    Zel_EventChildRemoved removed(moniker("p"), moniker("c"));
    Zel_EventChildUpdated updated(moniker("P Q"), moniker(""));

    EXPECT_EQ(added.toZelString(), QStringLiteral("Zel_EventChildAdded parent: /proj/bin child: /proj/bin/clip"));
    EXPECT_EQ(removed.toZelString(), QStringLiteral("Zel_EventChildRemoved parent: p child: c"));
    EXPECT_EQ(updated.toZelString(), QStringLiteral("Zel_EventChildUpdated parent: P Q child: "));
}

TEST(Zel_EventTest, NullMonikersRenderAsEmptyTextWithTwoBlanksBetweenLabels)
{
    const boost::shared_ptr<QString> none;
    EXPECT_EQ(Zel_EventChildAdded(none, none).toZelString(), QStringLiteral("Zel_EventChildAdded parent:  child: "));
    EXPECT_EQ(Zel_EventChildRemoved(none, moniker("c")).toZelString(), QStringLiteral("Zel_EventChildRemoved parent:  child: c"));
    EXPECT_EQ(Zel_EventChildUpdated(moniker("p"), none).toZelString(), QStringLiteral("Zel_EventChildUpdated parent: p child: "));
}

TEST(Zel_EventTest, BaseRendersItsNameAndRenderingReadsMonikerThroughVirtualSlot)
{
    EXPECT_EQ(PlainEvent(moniker("anything")).toZelString(), QStringLiteral("Zel_Event"));
    EXPECT_EQ(PlainEvent(boost::shared_ptr<QString>()).toZelString(), QStringLiteral("Zel_Event"));

    RedirectedEvent redirected;
    EXPECT_EQ(redirected.toZelString(), QStringLiteral("Zel_EventChildRemoved parent: overridden child: kid"));
    // Through a base pointer the derived rendering is used.
    Zel_Event& asBase = redirected;
    EXPECT_EQ(asBase.toZelString(), QStringLiteral("Zel_EventChildRemoved parent: overridden child: kid"));
}

TEST(Zel_EventTest, TypeCodesAreSingleBitsOneTwoFour)
{
    const boost::shared_ptr<QString> none;
    const Zel_EventChildAdded added(none, none);
    const Zel_EventChildRemoved removed(none, none);
    const Zel_EventChildUpdated updated(none, none);
    EXPECT_EQ(added.getEventType(), 1ul);
    EXPECT_EQ(removed.getEventType(), 2ul);
    EXPECT_EQ(updated.getEventType(), 4ul);
    EXPECT_EQ(added.getEventType() | removed.getEventType() | updated.getEventType(), 7ul);
}

TEST(Zel_EventTest, CopiesShareTheMonikerStrings)
{
    const boost::shared_ptr<QString> parent = moniker("parent");
    const boost::shared_ptr<QString> child = moniker("child");
    Zel_EventChildAdded original(parent, child);
    Zel_EventChildAdded copy(original);

    EXPECT_EQ(copy.getMonikerSP().get(), parent.get());
    EXPECT_EQ(copy.getChildMoniker().get(), child.get());
    EXPECT_EQ(original.getMonikerSP().get(), copy.getMonikerSP().get());
    EXPECT_EQ(copy.getEventType(), 1ul);

    Zel_EventChildUpdated updated(parent, child);
    Zel_EventChildUpdated updatedCopy(updated);
    EXPECT_EQ(updatedCopy.getChildMoniker().get(), child.get());
    EXPECT_EQ(updatedCopy.toZelString(), QStringLiteral("Zel_EventChildUpdated parent: parent child: child"));
}

TEST(Zel_EventTest, VirtualSlotOrderIsFixed)
{
    // Slots 0 and 1 are the destructor.
    EXPECT_EQ(vtableSlot(&Zel_Event::toZelString), 2);
    EXPECT_EQ(vtableSlot(&Zel_Event::getEventType), 3);
    EXPECT_EQ(vtableSlot(&Zel_Event::getMonikerSP), 4);
    EXPECT_EQ(vtableSlot(&Zel_EventChildAdded::toZelString), 2);
    EXPECT_EQ(vtableSlot(&Zel_EventChildAdded::getEventType), 3);
    EXPECT_EQ(vtableSlot(&Zel_EventChildAdded::getChildMoniker), 5);
    EXPECT_EQ(vtableSlot(&Zel_EventChildRemoved::getChildMoniker), 5);
    EXPECT_EQ(vtableSlot(&Zel_EventChildUpdated::getChildMoniker), 5);
}
