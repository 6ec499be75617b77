// Zel_MonikerCB: the callback of Zel_MonikerReq. An answer is a node's
// moniker.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error, finished after the last answer of the
// request) on the engine's delivery thread.
#ifndef ZEL_MONIKERCB_H
#define ZEL_MONIKERCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <QString>
#include <boost/shared_ptr.hpp>

class Zel_Error;

class ZEL_EXPORT Zel_MonikerCB : public Orv_ResultsCB
{
public:
    Zel_MonikerCB();
    Zel_MonikerCB(const Zel_MonikerCB& other);
    virtual ~Zel_MonikerCB();

    // One answer: a moniker.
    virtual void succeeded(boost::shared_ptr<QString> moniker) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_MonikerCB& operator=(const Zel_MonikerCB&) = delete;
};

#endif
