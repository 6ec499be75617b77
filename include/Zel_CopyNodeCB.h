// Zel_CopyNodeCB: the callback of Zel_CopyNodeReq. An answer pairs a source
// node with its new copy; progress reports may arrive between answers.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error, finished after the last answer of the
// request) on the engine's delivery thread.
#ifndef ZEL_COPYNODECB_H
#define ZEL_COPYNODECB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_Node;

class ZEL_EXPORT Zel_CopyNodeCB : public Orv_ResultsCB
{
public:
    Zel_CopyNodeCB();
    Zel_CopyNodeCB(const Zel_CopyNodeCB& other);
    virtual ~Zel_CopyNodeCB();

    // One answer: a source node and its copy.
    virtual void succeeded(boost::shared_ptr<Zel_Node> source, boost::shared_ptr<Zel_Node> copy) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;
    // How far the copy has got: nodes copied so far out of the total.
    virtual void progress(unsigned long copied, unsigned long total) = 0;

private:
    Zel_CopyNodeCB& operator=(const Zel_CopyNodeCB&) = delete;
};

#endif
