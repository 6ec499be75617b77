// Zel_Req: base of the library's requests.
//
// A request has a name and a callback and keeps the result queue the engine
// hands to process(). process() runs a fixed sequence: trace the start (when
// tracing is on), run the backend's work doProcess(), push the result object
// the work produced onto the queue, trace the end with the time taken:
//
//     ZEL: Zel_GetNodeReq: processing request ID:12)
//     ZEL: Zel_GetNodeReq: processed request ID:12) (0.015 seconds)
//
// A backend derives from the concrete request classes (Zel_GetNodeReq, ...)
// and supplies doProcess(); the request reaches its callback through
// Orv_Request::getCallback(). process() runs on an engine worker thread and
// takes no lock. Exceptions from doProcess() or Push() pass to the engine.
#ifndef ZEL_REQ_H
#define ZEL_REQ_H

#include "zel_export.h"
#include "Orv_Request.h"

#include <QString>
#include <boost/shared_ptr.hpp>

class Orv_Result;
class Orv_ResultQ;
class Orv_ResultsCB;

class ZEL_EXPORT Zel_Req : public Orv_Request
{
public:
    Zel_Req(QString name = QString(), boost::shared_ptr<Orv_ResultsCB> callback = boost::shared_ptr<Orv_ResultsCB>());
    Zel_Req(const Zel_Req& other);
    virtual ~Zel_Req();

    // Stores the queue, runs doProcess() and pushes its result; answers what
    // doProcess() answered, or false when there is no queue to push onto.
    virtual bool process(boost::shared_ptr<Orv_ResultQ> resultQ) override;
    // The name given at construction.
    virtual const QString getName() const;
    // The request's work: leave result empty or set it to the filled result
    // object; the answer is passed back to the engine.
    virtual bool doProcess(boost::shared_ptr<Orv_Result>& result) = 0;

protected:
    boost::shared_ptr<Orv_ResultQ> getORVResultQ() const;

private:
    Zel_Req& operator=(const Zel_Req&) = delete;

    boost::shared_ptr<Orv_ResultQ> mResultQ;
};

#endif
