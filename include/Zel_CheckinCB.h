// Zel_CheckinCB: the callback of Zel_CheckinReq, answered by Zel_CheckinRes
// with one outcome per media object checked in.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request; the result calls one handler per answer
// on the engine's delivery thread and catches and discards any exception a
// handler throws. The callback lives as long as a result holds it.
#ifndef ZEL_CHECKINCB_H
#define ZEL_CHECKINCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <QString>
#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_MobDesc;
class Zel_Node;

class ZEL_EXPORT Zel_CheckinCB : public Orv_ResultsCB
{
public:
    Zel_CheckinCB();
    Zel_CheckinCB(const Zel_CheckinCB& other);
    virtual ~Zel_CheckinCB();

    // A media object checked in: its descriptor, its node and the backend's text.
    virtual void succeeded(boost::shared_ptr<Zel_MobDesc> mobDesc, boost::shared_ptr<Zel_Node> node,
                           boost::shared_ptr<QString> text) = 0;
    // A media object that failed: its descriptor and the error record.
    virtual void failed(boost::shared_ptr<Zel_MobDesc> mobDesc, boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_CheckinCB& operator=(const Zel_CheckinCB&) = delete;
};

#endif
