// Zel_ServerCheckCB: the callback of a server check. Each answer only says
// whether the server answered and is usable.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error, finished after the last answer of the
// request) on the engine's delivery thread.
#ifndef ZEL_SERVERCHECKCB_H
#define ZEL_SERVERCHECKCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;

class ZEL_EXPORT Zel_ServerCheckCB : public Orv_ResultsCB
{
public:
    Zel_ServerCheckCB();
    Zel_ServerCheckCB(const Zel_ServerCheckCB& other);
    virtual ~Zel_ServerCheckCB();

    // One answer: the server is usable.
    virtual void succeeded() = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_ServerCheckCB& operator=(const Zel_ServerCheckCB&) = delete;
};

#endif
