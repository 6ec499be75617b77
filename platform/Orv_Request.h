// Orv_Request: base of every request the engine runs.
//
// A request has a name, a callback (which its results are delivered to) and a
// unique identifier. The engine calls process() on one of its worker threads
// with the queue that the request pushes its results onto. A request is
// cancelled when setCanceled(true) was called or its callback asked for it
// (Orv_ResultsCB::cancelRequest); the engine then does not run it.
#ifndef ORV_REQUEST_H
#define ORV_REQUEST_H

#include "zel_platform_export.h"
#include "Orv_RequestID.h"

#include <boost/shared_ptr.hpp>

#include <atomic>
#include <string>

class Orv_ResultQ;
class Orv_Result;
class Orv_ResultsCB;

class ZEL_PLATFORM_EXPORT Orv_Request
{
public:
    Orv_Request(std::string name, boost::shared_ptr<Orv_ResultsCB> callback);
    Orv_Request(const Orv_Request& other);
    virtual ~Orv_Request();

    // The name given at construction.
    virtual const std::string& name() const;
    virtual Orv_RequestID getRequestID() const;
    virtual bool isCanceled() const;
    // Runs the request; results go onto the queue. Called by the engine.
    virtual bool process(boost::shared_ptr<Orv_ResultQ> resultQ) = 0;

    // The callback given at construction (may be empty).
    const boost::shared_ptr<Orv_ResultsCB>& getCallback() const { return mCallback; }

protected:
    // The result the engine delivers instead of running a cancelled request;
    // empty (nothing delivered) unless a derived request says otherwise.
    virtual boost::shared_ptr<Orv_Result> makeCanceledResult();
    virtual void setCanceled(bool canceled);

private:
    friend class Orv_Engine;
    Orv_Request& operator=(const Orv_Request&) = delete;

    std::string mName;
    boost::shared_ptr<Orv_ResultsCB> mCallback;
    Orv_RequestID mID;
    std::atomic<bool> mCanceled;
};

#endif
