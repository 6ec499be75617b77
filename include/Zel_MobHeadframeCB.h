// Zel_MobHeadframeCB: the callback of Zel_MobHeadframeReq. An answer is the
// head-frame image of a media object, as bytes, with the identifier of the
// media object. The callback holds one opaque context pointer for the
// application's own use (protected, empty until set): copies of the callback
// share it and it is released with the callback; the library never reads or
// writes it.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error, finished after the last answer of the
// request) on the engine's delivery thread.
#ifndef ZEL_MOBHEADFRAMECB_H
#define ZEL_MOBHEADFRAMECB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <QByteArray>
#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_MobID;

class ZEL_EXPORT Zel_MobHeadframeCB : public Orv_ResultsCB
{
public:
    Zel_MobHeadframeCB();
    Zel_MobHeadframeCB(const Zel_MobHeadframeCB& other);
    virtual ~Zel_MobHeadframeCB();

    // One answer: the media object and the head-frame image.
    virtual void succeeded(boost::shared_ptr<Zel_MobID> mobID, QByteArray image) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

protected:
    // Opaque context of the application; never touched by the library.
    boost::shared_ptr<void> mContext;

private:
    Zel_MobHeadframeCB& operator=(const Zel_MobHeadframeCB&) = delete;
};

#endif
