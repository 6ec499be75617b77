// Zel_CreatePropertyCB: the callback of Zel_CreatePropertyReq. The answer is
// the description of the property key created, as the server now knows it.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error, finished after the last answer of the
// request) on the engine's delivery thread.
#ifndef ZEL_CREATEPROPERTYCB_H
#define ZEL_CREATEPROPERTYCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"
#include "Zel_PropertyKeyInfo.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;

class ZEL_EXPORT Zel_CreatePropertyCB : public Orv_ResultsCB
{
public:
    Zel_CreatePropertyCB();
    Zel_CreatePropertyCB(const Zel_CreatePropertyCB& other);
    virtual ~Zel_CreatePropertyCB();

    // One answer: the description of the created key.
    virtual void succeeded(Zel_PropertyKeyInfo keyInfo) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_CreatePropertyCB& operator=(const Zel_CreatePropertyCB&) = delete;
};

#endif
