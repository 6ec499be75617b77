// Orv_Result: base of every result the engine delivers.
//
// A result is made by a request's work (or by a listener), pushed onto an
// Orv_ResultQ and later delivered by the engine, which calls deliverNext()
// until it returns false. The result holds its callback, so the callback lives
// as long as any result that will call it. Only the result that was built with
// the final-result flag tells the callback that its request has finished.
#ifndef ORV_RESULT_H
#define ORV_RESULT_H

#include "zel_platform_export.h"
#include "Orv_RequestID.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_PLATFORM_EXPORT Orv_Result
{
public:
    Orv_Result(boost::shared_ptr<Orv_ResultsCB> callback, bool finalResult);
    Orv_Result(const Orv_Result& other);
    Orv_Result& operator=(const Orv_Result& other);
    virtual ~Orv_Result();

    // The identifier of the callback this result is delivered to.
    virtual Orv_RequestID getRequestID() const;
    virtual bool isFinalResult() const;
    // Delivers the next item; true while more items remain.
    virtual bool deliverNext() = 0;

    const boost::shared_ptr<Orv_ResultsCB>& getCallback() const { return mCallback; }

private:
    boost::shared_ptr<Orv_ResultsCB> mCallback;
    bool mFinalResult;
};

#endif
