// Zel_StartupRes: the one outcome of a start-up (Zel_StartupReq).
//
// The backend creates it with the request's Zel_StartupCB and sets the outcome
// with setError(error): a record that reports no error is a success. Each
// deliverNext() call hands that outcome to succeeded() or failed(error) and
// answers false; there is no end notice, the final-result flag is not
// consulted, and a second call delivers the same outcome again. Before
// setError, or without a callback, nothing is delivered. setError with an
// empty pointer removes the record, so that nothing is delivered (a failure
// set earlier is not turned into a success). An exception thrown by a handler
// is caught and discarded. Filled by one thread, then delivered; no lock.
#ifndef ZEL_STARTUPRES_H
#define ZEL_STARTUPRES_H

#include "zel_export.h"
#include "Orv_Result.h"
#include "Zel_StartupCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;

class ZEL_EXPORT Zel_StartupRes : public Orv_Result
{
public:
    Zel_StartupRes(boost::shared_ptr<Zel_StartupCB> callback, bool finalResult);
    Zel_StartupRes(const Zel_StartupRes& other);
    Zel_StartupRes& operator=(const Zel_StartupRes& other);
    virtual ~Zel_StartupRes();

    // Delivers the outcome, if set; always answers false.
    bool deliverNext() override;
    // Replaces the outcome; an empty pointer leaves none.
    virtual void setError(boost::shared_ptr<Zel_Error> error);

protected:
    boost::shared_ptr<Zel_StartupCB> mCallback;
    boost::shared_ptr<Zel_Error> mError;
};

#endif
