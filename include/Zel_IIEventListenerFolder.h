// Zel_IIEventListenerFolder: the three notifications of a folder listener.
//
// Each receives the parent's moniker and the child's moniker (either may be
// null). Implemented by the folder listener (Zel_EventListenerFolder) and by
// the application's facade (Zel_IEventListenerFolder). A pure interface
// without data; it is never deleted through (its destructor is protected).
#ifndef ZEL_IIEVENTLISTENERFOLDER_H
#define ZEL_IIEVENTLISTENERFOLDER_H

#include "zel_export.h"

#include <QString>
#include <boost/shared_ptr.hpp>

class ZEL_EXPORT Zel_IIEventListenerFolder
{
public:
    virtual void childAdded(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker) = 0;
    virtual void childRemoved(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker) = 0;
    virtual void childUpdated(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker) = 0;

protected:
    Zel_IIEventListenerFolder() = default;
    Zel_IIEventListenerFolder(const Zel_IIEventListenerFolder&) = default;
    Zel_IIEventListenerFolder& operator=(const Zel_IIEventListenerFolder&) = default;
    ~Zel_IIEventListenerFolder() = default;
};

#endif
