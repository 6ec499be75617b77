// Zel_GetChildrenCB: a callback for child listings. Before the children
// arrive, one call of childrenCount says how many the request will deliver;
// then one answer per child. (Zel_GetChildrenReq itself answers through
// Zel_ResultCB by its Zel_GetChildrenRes.)
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error, finished after the last answer of the
// request) on the engine's delivery thread.
#ifndef ZEL_GETCHILDRENCB_H
#define ZEL_GETCHILDRENCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_Node;

class ZEL_EXPORT Zel_GetChildrenCB : public Orv_ResultsCB
{
public:
    Zel_GetChildrenCB();
    Zel_GetChildrenCB(const Zel_GetChildrenCB& other);
    virtual ~Zel_GetChildrenCB();

    // One answer: a child node.
    virtual void succeeded(boost::shared_ptr<Zel_Node> child) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;
    // The number of children the request is about to deliver.
    virtual void childrenCount(unsigned long count) = 0;

private:
    Zel_GetChildrenCB& operator=(const Zel_GetChildrenCB&) = delete;
};

#endif
