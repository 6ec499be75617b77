// Zel_ResultBoolCB: the callback of a node deletion (Zel_DeleteNodeReq),
// answered by Zel_DeleteNodeRes with the yes/no outcome of the deletion.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request; the result calls one handler per answer
// on the engine's delivery thread and catches and discards any exception a
// handler throws. The callback lives as long as a result holds it.
#ifndef ZEL_RESULTBOOLCB_H
#define ZEL_RESULTBOOLCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;

class ZEL_EXPORT Zel_ResultBoolCB : public Orv_ResultsCB
{
public:
    Zel_ResultBoolCB();
    Zel_ResultBoolCB(const Zel_ResultBoolCB& other);
    virtual ~Zel_ResultBoolCB();

    // One answer: the outcome of the deletion.
    virtual void succeeded(bool deleted) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_ResultBoolCB& operator=(const Zel_ResultBoolCB&) = delete;
};

#endif
