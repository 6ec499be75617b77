// Zel_MobNodeCB: the callback of Zel_MobNodeReq. The node of a media object.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error, finished after the last answer of the
// request) on the engine's delivery thread.
#ifndef ZEL_MOBNODECB_H
#define ZEL_MOBNODECB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_Node;

class ZEL_EXPORT Zel_MobNodeCB : public Orv_ResultsCB
{
public:
    Zel_MobNodeCB();
    Zel_MobNodeCB(const Zel_MobNodeCB& other);
    virtual ~Zel_MobNodeCB();

    // One answer: the node of the media object.
    virtual void succeeded(boost::shared_ptr<Zel_Node> node) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_MobNodeCB& operator=(const Zel_MobNodeCB&) = delete;
};

#endif
