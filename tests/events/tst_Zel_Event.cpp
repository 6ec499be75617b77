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

TEST(Zel_EventTest, RendersTypeNameParentAndChildWithNullMonikersAsEmptyText)
{
    const boost::shared_ptr<QString> none;
    EXPECT_EQ(Zel_EventChildAdded(moniker("/proj/bin"), moniker("/proj/bin/clip")).toZelString(),
              QStringLiteral("Zel_EventChildAdded parent: /proj/bin child: /proj/bin/clip"));
    EXPECT_EQ(Zel_EventChildRemoved(moniker("p"), moniker("c")).toZelString(), QStringLiteral("Zel_EventChildRemoved parent: p child: c"));
    EXPECT_EQ(Zel_EventChildUpdated(moniker("P Q"), moniker("")).toZelString(), QStringLiteral("Zel_EventChildUpdated parent: P Q child: "));
    EXPECT_EQ(Zel_EventChildAdded(none, none).toZelString(), QStringLiteral("Zel_EventChildAdded parent:  child: "));
    EXPECT_EQ(Zel_EventChildRemoved(none, moniker("c")).toZelString(), QStringLiteral("Zel_EventChildRemoved parent:  child: c"));
    EXPECT_EQ(Zel_EventChildUpdated(moniker("p"), none).toZelString(), QStringLiteral("Zel_EventChildUpdated parent: p child: "));
}

TEST(Zel_EventTest, BaseRendersItsNameAndRenderingReadsMonikerThroughVirtualSlot)
{
    EXPECT_EQ(PlainEvent(moniker("anything")).toZelString(), QStringLiteral("Zel_Event"));
    EXPECT_EQ(PlainEvent(boost::shared_ptr<QString>()).toZelString(), QStringLiteral("Zel_Event"));

    RedirectedEvent redirected;
    // Through a base reference the derived rendering is used.
    Zel_Event& asBase = redirected;
    EXPECT_EQ(asBase.toZelString(), QStringLiteral("Zel_EventChildRemoved parent: overridden child: kid"));
}

TEST(Zel_EventTest, TypeCodesAreSingleBitsOneTwoFourAndCopiesShareTheMonikerStrings)
{
    const boost::shared_ptr<QString> parent = moniker("parent");
    const boost::shared_ptr<QString> child = moniker("child");
    const Zel_EventChildAdded added(parent, child);
    const Zel_EventChildRemoved removed(parent, child);
    const Zel_EventChildUpdated updated(parent, child);
    EXPECT_EQ(added.getEventType(), 1ul);
    EXPECT_EQ(removed.getEventType(), 2ul);
    EXPECT_EQ(updated.getEventType(), 4ul);

    Zel_EventChildAdded copy(added);
    EXPECT_EQ(copy.getMonikerSP().get(), parent.get());
    EXPECT_EQ(copy.getChildMoniker().get(), child.get());
    EXPECT_EQ(copy.getEventType(), 1ul);
    Zel_EventChildUpdated updatedCopy(updated);
    EXPECT_EQ(updatedCopy.getChildMoniker().get(), child.get());
    EXPECT_EQ(updatedCopy.toZelString(), QStringLiteral("Zel_EventChildUpdated parent: parent child: child"));
}

TEST(Zel_EventTest, VirtualSlotOrderIsFixed)
{
    EXPECT_EQ(slotsOutOfOrder(2, {ZEL_SLOT_ROW(Zel_Event, toZelString), ZEL_SLOT_ROW(Zel_Event, getEventType),
                                  ZEL_SLOT_ROW(Zel_Event, getMonikerSP), ZEL_SLOT_ROW(Zel_EventChildAdded, getChildMoniker)}),
              "");
    EXPECT_EQ(vtableSlot(&Zel_EventChildAdded::getEventType), 3);
    EXPECT_EQ(vtableSlot(&Zel_EventChildRemoved::getChildMoniker), 5);
    EXPECT_EQ(vtableSlot(&Zel_EventChildUpdated::getChildMoniker), 5);
}
