// Zel_StartupCB: the callback of Zel_StartupReq, answered by Zel_StartupRes
// with exactly one outcome and no end notice. There is no finished handler.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request; the result calls one handler per answer
// on the engine's delivery thread and catches and discards any exception a
// handler throws. The callback lives as long as a result holds it.
#ifndef ZEL_STARTUPCB_H
#define ZEL_STARTUPCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;

class ZEL_EXPORT Zel_StartupCB : public Orv_ResultsCB
{
public:
    Zel_StartupCB();
    Zel_StartupCB(const Zel_StartupCB& other);
    virtual ~Zel_StartupCB();

    // The start-up succeeded.
    virtual void succeeded() = 0;
    // The start-up failed: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;

private:
    Zel_StartupCB& operator=(const Zel_StartupCB&) = delete;
};

#endif
