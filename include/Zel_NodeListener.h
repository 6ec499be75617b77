// Zel_NodeListener: where the backend reports children added to or removed
// from a node of the server's tree.
//
// Built from the session's event hub (Zel_Session::getEventCBSP) and the
// engine's result queue. Each report becomes a change event only when the
// hub has listeners that could want it (filed under the parent's moniker or
// under ""); the event travels in a Zel_EventRes pushed onto the queue and
// reaches the listeners when the engine delivers it, on the delivering thread.
//
//     Zel_NodeListener nodes(getEventCBSP(), engine.getResultQ());
//     nodes.NodeAdded(parentMoniker, childMoniker);
//
// Takes no lock of its own (the hub's query locks briefly); may be called
// from any thread. Holds the hub and the queue; a null hub or queue makes
// every report a no-op.
#ifndef ZEL_NODELISTENER_H
#define ZEL_NODELISTENER_H

#include "zel_export.h"

#include <QString>
#include <boost/shared_ptr.hpp>

class Orv_ResultQ;
class Zel_Event;
class Zel_EventCB;

class ZEL_EXPORT Zel_NodeListener
{
public:
    Zel_NodeListener(boost::shared_ptr<Zel_EventCB> hub, boost::shared_ptr<Orv_ResultQ> resultQ);
    Zel_NodeListener(const Zel_NodeListener& other);
    Zel_NodeListener& operator=(const Zel_NodeListener& other);
    ~Zel_NodeListener();

    // The child (named by the second moniker) was added to the parent.
    void NodeAdded(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker);
    // The child was removed from the parent.
    void NodeRemoved(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker);

private:
    boost::shared_ptr<Zel_EventCB> getEventCBSP();
    boost::shared_ptr<Orv_ResultQ> getResultQSP();
    void sendEvent(boost::shared_ptr<Zel_Event> event);

    boost::shared_ptr<Zel_EventCB> mHub;
    boost::shared_ptr<Orv_ResultQ> mResultQ;
};

#endif
