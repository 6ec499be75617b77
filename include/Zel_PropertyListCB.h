// Zel_PropertyListCB: the callback of Zel_PropertyListReq. An answer is a list
// of properties.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error, finished after the last answer of the
// request) on the engine's delivery thread.
#ifndef ZEL_PROPERTYLISTCB_H
#define ZEL_PROPERTYLISTCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"
#include "Zel_PropertyList.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;

class ZEL_EXPORT Zel_PropertyListCB : public Orv_ResultsCB
{
public:
    Zel_PropertyListCB();
    Zel_PropertyListCB(const Zel_PropertyListCB& other);
    virtual ~Zel_PropertyListCB();

    // One answer: the properties.
    virtual void succeeded(Zel_PropertyList properties) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_PropertyListCB& operator=(const Zel_PropertyListCB&) = delete;
};

#endif
