// Zel_EventListenerSPList: a list of shared listener pointers.
//
// The value type of the event hub's table: the listeners filed under one
// moniker, in registration order. A plain Qt list (copies share their data
// until one of them changes); no locking of its own.
#ifndef ZEL_EVENTLISTENERSPLIST_H
#define ZEL_EVENTLISTENERSPLIST_H

#include "zel_export.h"

#include <QList>
#include <boost/shared_ptr.hpp>

class Zel_EventListener;

class ZEL_EXPORT Zel_EventListenerSPList : public QList<boost::shared_ptr<Zel_EventListener>>
{
public:
    Zel_EventListenerSPList();
    Zel_EventListenerSPList(const Zel_EventListenerSPList& other);
    Zel_EventListenerSPList& operator=(const Zel_EventListenerSPList& other);
    virtual ~Zel_EventListenerSPList();
};

#endif
