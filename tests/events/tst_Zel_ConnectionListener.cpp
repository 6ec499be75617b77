#include "EventTestSupport.h"
#include "Orv_Engine.h"
#include "Orv_ResultQ.h"
#include "VtableSlot.h"
#include "Zel_ConnectionListener.h"
#include "Zel_StatusNotificationCB.h"
#include "Zel_StatusNotificationRes.h"

#include <gtest/gtest.h>

#include <QList>
#include <QStringList>
#include <type_traits>
#include <stdexcept>

namespace {

struct RecordingStatusCB : Zel_StatusNotificationCB {
    void connected() override
    {
        calls << QStringLiteral("connected");
        if (throwing)
            throw std::runtime_error("handler failed");
    }
    void disconnected() override
    {
        calls << QStringLiteral("disconnected");
        if (throwing)
            throw 1;
    }
    QStringList calls;
    bool throwing = false;
};

struct ProbeStatusRes : Zel_StatusNotificationRes {
    using Zel_StatusNotificationRes::Zel_StatusNotificationRes;
    using Zel_StatusNotificationRes::isConnectedResult;
    using Zel_StatusNotificationRes::isDisconnectedResult;
};

// Overrides the private virtual to see which notification each report asks for.
struct SpyConnectionListener : Zel_ConnectionListener {
    SpyConnectionListener()
        : Zel_ConnectionListener(boost::shared_ptr<Zel_StatusNotificationCB>(), boost::shared_ptr<Orv_ResultQ>())
    {
    }
    void sendConnectedNotification(bool connected) override { sent << connected; }
    QList<bool> sent;
};

} // namespace

TEST(Zel_ConnectionListenerTest, WillReconnectThenReconnectedDeliverDisconnectedThenConnectedThroughTheVirtualSlot)
{
    SpyConnectionListener spy;
    spy.ConnectionWillReconnect();
    spy.ConnectionReconnected();
    EXPECT_EQ(spy.sent, QList<bool>({false, true}));

    Orv_Engine engine(1);
    boost::shared_ptr<RecordingStatusCB> callback(new RecordingStatusCB);
    Zel_ConnectionListener listener(callback, engine.getResultQ());
    listener.ConnectionWillReconnect();
    listener.ConnectionReconnected();
    EXPECT_EQ(engine.getResultQ()->Size(), 2u);
    EXPECT_TRUE(callback->calls.isEmpty());
    EXPECT_EQ(engine.DeliverPending(), 2u);
    EXPECT_EQ(callback->calls, QStringList({"disconnected", "connected"}));
    // Notifications are not final results: the callback never finishes.
    EXPECT_FALSE(callback->isFinished());
}

TEST(Zel_ConnectionListenerTest, NullCallbackOrQueueDropsTheNews)
{
    boost::shared_ptr<Orv_ResultQ> queue(new Orv_ResultQ);
    Zel_ConnectionListener noCallback(boost::shared_ptr<Zel_StatusNotificationCB>(), queue);
    noCallback.ConnectionWillReconnect();
    noCallback.ConnectionReconnected();

    boost::shared_ptr<RecordingStatusCB> callback(new RecordingStatusCB);
    Zel_ConnectionListener noQueue(callback, boost::shared_ptr<Orv_ResultQ>());
    noQueue.ConnectionReconnected();
    Zel_ConnectionListener copy(noQueue);
    copy.ConnectionWillReconnect();
    Zel_ConnectionListener assigned(callback, queue);
    assigned = noQueue;
    assigned.ConnectionReconnected();
    EXPECT_EQ(queue->Size(), 0u);
    EXPECT_TRUE(callback->calls.isEmpty());
}

TEST(Zel_StatusNotificationResTest, DeliversOnceByTypeAndAlwaysAnswersFalse)
{
    boost::shared_ptr<RecordingStatusCB> callback(new RecordingStatusCB);
    ProbeStatusRes connected(callback, Zel_StatusNotificationRes::Connected);
    ProbeStatusRes disconnected(callback, Zel_StatusNotificationRes::Disconnected);
    EXPECT_TRUE(connected.isConnectedResult() && !connected.isDisconnectedResult());
    EXPECT_TRUE(disconnected.isDisconnectedResult() && !disconnected.isConnectedResult());
    EXPECT_EQ(int(Zel_StatusNotificationRes::Connected), 1);
    EXPECT_EQ(int(Zel_StatusNotificationRes::Disconnected), 2);

    EXPECT_FALSE(connected.deliverNext());
    EXPECT_FALSE(disconnected.deliverNext());
    EXPECT_EQ(callback->calls, QStringList({"connected", "disconnected"}));

    // Other values deliver nothing.
    for (int odd : {0, 3, -1, 4}) {
        ProbeStatusRes other(callback, static_cast<Zel_StatusNotificationRes::NotificationType>(odd));
        EXPECT_FALSE(other.isConnectedResult() || other.isDisconnectedResult() || other.deliverNext()) << odd;
    }
    EXPECT_EQ(callback->calls.size(), 2);

    // Throwing handlers are contained.
    callback->throwing = true;
    EXPECT_FALSE(connected.deliverNext());
    EXPECT_FALSE(disconnected.deliverNext());
    EXPECT_EQ(callback->calls, QStringList({"connected", "disconnected", "connected", "disconnected"}));
    Zel_StatusNotificationRes noCallback(boost::shared_ptr<Zel_StatusNotificationCB>(), Zel_StatusNotificationRes::Connected);
    EXPECT_FALSE(noCallback.deliverNext());

    // Copies keep the callback and the type.
    callback->throwing = false;
    callback->calls.clear();
    Zel_StatusNotificationRes copy(disconnected);
    EXPECT_FALSE(copy.isFinalResult());
    EXPECT_EQ(copy.getCallback().get(), static_cast<Orv_ResultsCB*>(callback.get()));
    copy.deliverNext();
    EXPECT_EQ(callback->calls, QStringList({"disconnected"}));
    EXPECT_EQ(callback->getCallbackID().getValue(), -2);
}

TEST(Zel_StatusNotificationResTest, AThreadEndedInsideTheHandlerUnwindsThroughDelivery)
{
    // pthread_exit and cancellation unwind the thread with an exception that
    // must not be swallowed (glibc aborts the process if it is).
    struct EndingStatusCB : Zel_StatusNotificationCB {
        void connected() override { pthread_exit(reinterpret_cast<void*>(42)); }
        void disconnected() override
        {
            pthread_cancel(pthread_self());
            pthread_testcancel();
        }
    };
    boost::shared_ptr<EndingStatusCB> callback(new EndingStatusCB);
    Zel_StatusNotificationRes connected(callback, Zel_StatusNotificationRes::Connected);
    Zel_StatusNotificationRes disconnected(callback, Zel_StatusNotificationRes::Disconnected);
    void* const delivered = reinterpret_cast<void*>(1);
    EXPECT_EQ(runOnPosixThread([&] { connected.deliverNext(); return delivered; }), reinterpret_cast<void*>(42));
    EXPECT_EQ(runOnPosixThread([&] { disconnected.deliverNext(); return delivered; }), PTHREAD_CANCELED);
}

TEST(Zel_StatusNotificationSlotTest, CallbackAndResultSlotOrder)
{
    EXPECT_EQ(slotsOutOfOrder(2, {ZEL_SLOT_ROW(Zel_StatusNotificationCB, cancelRequest),
                                  ZEL_SLOT_ROW(Zel_StatusNotificationCB, isFinished),
                                  ZEL_SLOT_ROW(Zel_StatusNotificationCB, connected),
                                  ZEL_SLOT_ROW(Zel_StatusNotificationCB, disconnected)}),
              "");
    EXPECT_EQ(slotsOutOfOrder(4, {ZEL_SLOT_ROW(ProbeStatusRes, deliverNext), ZEL_SLOT_ROW(ProbeStatusRes, isConnectedResult),
                                  ZEL_SLOT_ROW(ProbeStatusRes, isDisconnectedResult)}),
              "");
    // No virtual destructor: the one virtual is slot 0.
    EXPECT_FALSE(std::has_virtual_destructor<Zel_ConnectionListener>::value);
    EXPECT_EQ(vtableSlot(&SpyConnectionListener::sendConnectedNotification), 0);
}
