// Zel_AnalyzeCB: the callback of Zel_AnalyzeReq. The analysis of media reports
// each media object it found by its descriptor (identifier and media file
// paths).
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error, finished after the last answer of the
// request) on the engine's delivery thread.
#ifndef ZEL_ANALYZECB_H
#define ZEL_ANALYZECB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_MobDesc;

class ZEL_EXPORT Zel_AnalyzeCB : public Orv_ResultsCB
{
public:
    Zel_AnalyzeCB();
    Zel_AnalyzeCB(const Zel_AnalyzeCB& other);
    virtual ~Zel_AnalyzeCB();

    // One media object found by the analysis.
    virtual void succeeded(boost::shared_ptr<Zel_MobDesc> mobDesc) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_AnalyzeCB& operator=(const Zel_AnalyzeCB&) = delete;
};

#endif
