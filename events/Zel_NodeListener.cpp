#include "Zel_NodeListener.h"

#include "Orv_ResultQ.h"
#include "Zel_EventCB.h"
#include "Zel_EventChildAdded.h"
#include "Zel_EventChildRemoved.h"
#include "Zel_EventRes.h"

Zel_NodeListener::Zel_NodeListener(boost::shared_ptr<Zel_EventCB> hub, boost::shared_ptr<Orv_ResultQ> resultQ)
    : mHub(std::move(hub))
    , mResultQ(std::move(resultQ))
{
}

Zel_NodeListener::Zel_NodeListener(const Zel_NodeListener& other) = default;

Zel_NodeListener& Zel_NodeListener::operator=(const Zel_NodeListener& other) = default;

Zel_NodeListener::~Zel_NodeListener() = default;

void Zel_NodeListener::NodeAdded(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker)
{
    if (!mHub || !mHub->hasRegisteredListener(parentMoniker))
        return;
    sendEvent(boost::shared_ptr<Zel_Event>(new Zel_EventChildAdded(std::move(parentMoniker), std::move(childMoniker))));
}

void Zel_NodeListener::NodeRemoved(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker)
{
    if (!mHub || !mHub->hasRegisteredListener(parentMoniker))
        return;
    sendEvent(boost::shared_ptr<Zel_Event>(new Zel_EventChildRemoved(std::move(parentMoniker), std::move(childMoniker))));
}

boost::shared_ptr<Zel_EventCB> Zel_NodeListener::getEventCBSP()
{
    return mHub;
}

boost::shared_ptr<Orv_ResultQ> Zel_NodeListener::getResultQSP()
{
    return mResultQ;
}

void Zel_NodeListener::sendEvent(boost::shared_ptr<Zel_Event> event)
{
    if (!mHub || !mResultQ || !event)
        return;
    mResultQ->Push(boost::shared_ptr<Orv_Result>(new Zel_EventRes(mHub, std::move(event))));
}
