// Zel_AnalyzeReq: the request named "Zel_AnalyzeReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_AnalyzeCB, by a result class of the backend.
#ifndef ZEL_ANALYZEREQ_H
#define ZEL_ANALYZEREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_AnalyzeReq : public Zel_Req
{
public:
    explicit Zel_AnalyzeReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_AnalyzeReq(const Zel_AnalyzeReq& other);
    virtual ~Zel_AnalyzeReq();

private:
    Zel_AnalyzeReq& operator=(const Zel_AnalyzeReq&) = delete;
};

#endif
