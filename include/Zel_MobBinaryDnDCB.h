// Zel_MobBinaryDnDCB: the callback of Zel_MobBinaryDnDReq. An answer is the
// binary form of a media object for drag and drop, as bytes, with the
// identifier of the media object. The callback holds one opaque context
// pointer for the application's own use (protected, empty until set): copies
// of the callback share it and it is released with the callback; the library
// never reads or writes it.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error, finished after the last answer of the
// request) on the engine's delivery thread.
#ifndef ZEL_MOBBINARYDNDCB_H
#define ZEL_MOBBINARYDNDCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <QByteArray>
#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_MobID;

class ZEL_EXPORT Zel_MobBinaryDnDCB : public Orv_ResultsCB
{
public:
    Zel_MobBinaryDnDCB();
    Zel_MobBinaryDnDCB(const Zel_MobBinaryDnDCB& other);
    virtual ~Zel_MobBinaryDnDCB();

    // One answer: the media object and the binary form for drag and drop.
    virtual void succeeded(boost::shared_ptr<Zel_MobID> mobID, QByteArray binary) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

protected:
    // Opaque context of the application; never touched by the library.
    boost::shared_ptr<void> mContext;

private:
    Zel_MobBinaryDnDCB& operator=(const Zel_MobBinaryDnDCB&) = delete;
};

#endif
