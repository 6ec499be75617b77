// Zel_QueryCB: the callback of Zel_QueryReq (named "Zel_Query"). One answer
// per node that matches the query. The callback carries the query
// specification: setQuerySpec, a virtual slot after the three handlers, stores
// a shared reference (no copy), getQuerySpec returns it; empty until set, and
// set before the request is submitted.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error, finished after the last answer of the
// request) on the engine's delivery thread.
#ifndef ZEL_QUERYCB_H
#define ZEL_QUERYCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_Node;
class Zel_QuerySpec;

class ZEL_EXPORT Zel_QueryCB : public Orv_ResultsCB
{
public:
    Zel_QueryCB();
    Zel_QueryCB(const Zel_QueryCB& other);
    virtual ~Zel_QueryCB();

    // One answer: a node that matches the query.
    virtual void succeeded(boost::shared_ptr<Zel_Node> node) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

    // Stores the query specification (shared, not copied).
    virtual void setQuerySpec(boost::shared_ptr<Zel_QuerySpec> querySpec);
    // The stored specification; empty until set.
    const boost::shared_ptr<Zel_QuerySpec>& getQuerySpec() const;

private:
    Zel_QueryCB& operator=(const Zel_QueryCB&) = delete;

    boost::shared_ptr<Zel_QuerySpec> mQuerySpec;
};

#endif
