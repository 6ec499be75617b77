#include "EventTestSupport.h"
#include "Orv_ResultQ.h"
#include "StubSession.h"
#include "Zel_NodeListener.h"

#include <gtest/gtest.h>

namespace {

class Zel_NodeListenerTest : public ::testing::Test
{
protected:
    // A registered listener under the key (nullptr: an empty key pointer).
    boost::shared_ptr<RecordingListener> listener(const char* name, const char* key)
    {
        boost::shared_ptr<RecordingListener> l(new RecordingListener(
            &log, QString::fromLatin1(name), key ? moniker(key) : boost::shared_ptr<QString>(), 7, session));
        session->RegisterListener(l);
        return l;
    }

    boost::shared_ptr<StubSession> session{new StubSession};
    boost::shared_ptr<Orv_ResultQ> queue{new Orv_ResultQ};
    Zel_NodeListener nodes{session->getEventCBSP(), queue};
    EventLog log;
};

} // namespace

TEST_F(Zel_NodeListenerTest, PushesOnlyForAnInterestedListenerAndTheResultsDeliverThroughTheHub)
{
    nodes.NodeAdded(moniker("/a"), moniker("/a/1"));
    nodes.NodeRemoved(moniker("/a"), moniker("/a/1"));
    listener("b", "/b");
    nodes.NodeAdded(moniker("/a"), moniker("/a/1"));
    EXPECT_EQ(queue->Size(), 0u);
    nodes.NodeAdded(moniker("/b"), moniker("/b/1"));
    EXPECT_EQ(queue->Size(), 1u);
    queue->TryPop()->deliverNext();
    EXPECT_EQ(log.lines(), QStringList({"b:Zel_EventChildAdded parent: /b child: /b/1"}));
    log.clear();

    listener("all", nullptr);
    listener("a", "/a");

    nodes.NodeAdded(moniker("/a"), moniker("/a/1"));
    nodes.NodeRemoved(moniker("/z"), moniker("/z/9"));
    nodes.NodeAdded(moniker("/q"), boost::shared_ptr<QString>()); // a null child still makes an event
    ASSERT_EQ(queue->Size(), 3u);
    EXPECT_TRUE(log.lines().isEmpty()); // nothing is delivered before the engine does it

    while (const boost::shared_ptr<Orv_Result> result = queue->TryPop()) {
        EXPECT_EQ(result->getCallback().get(), static_cast<Orv_ResultsCB*>(session->getEventCBSP().get()));
        EXPECT_FALSE(result->deliverNext());
    }
    EXPECT_EQ(log.lines(), QStringList({
                               "a:Zel_EventChildAdded parent: /a child: /a/1",
                               "all:Zel_EventChildAdded parent: /a child: /a/1",
                               "all:Zel_EventChildRemoved parent: /z child: /z/9",
                               "all:Zel_EventChildAdded parent: /q child: ",
                           }));
}

TEST_F(Zel_NodeListenerTest, KeyThatLostItsListenersStillPushesAndReceiversAreResolvedAtDelivery)
{
    const boost::shared_ptr<RecordingListener> a = listener("a", "/a");
    session->UnregisterListener(a);
    nodes.NodeRemoved(moniker("/a"), moniker("/a/1"));
    EXPECT_EQ(queue->Size(), 1u);

    // Registered after the report, before the delivery: it still hears it.
    listener("late", "/a");
    queue->TryPop()->deliverNext();
    EXPECT_EQ(log.lines(), QStringList({"late:Zel_EventChildRemoved parent: /a child: /a/1"}));
}

TEST_F(Zel_NodeListenerTest, NullHubOrQueueIgnoresReportsAndTheListenerKeepsTheHubAlive)
{
    listener("all", nullptr);
    Zel_NodeListener noHub(boost::shared_ptr<Zel_EventCB>(), queue);
    noHub.NodeAdded(moniker("/a"), moniker("/a/1"));
    Zel_NodeListener noQueue(session->getEventCBSP(), boost::shared_ptr<Orv_ResultQ>());
    noQueue.NodeAdded(moniker("/a"), moniker("/a/1"));
    noQueue.NodeRemoved(moniker("/a"), moniker("/a/1"));
    EXPECT_EQ(queue->Size(), 0u);

    Zel_NodeListener copy(nodes);
    const boost::weak_ptr<Zel_EventCB> watch = session->getEventCBSP();
    session.reset();
    EXPECT_FALSE(watch.expired());
    // The session's end emptied the hub: no listener is left, no event is made.
    copy.NodeAdded(moniker("/a"), moniker("/a/1"));
    EXPECT_EQ(queue->Size(), 0u);
}
