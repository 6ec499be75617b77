// Zel_DeleteCB: the callback of Zel_DeleteReq, answered by Zel_DeleteRes. A
// deletion has outcomes of several kinds, each with its own handler. Totals of
// remote assets and metadata records deleted, and per-media-object successes
// and failures on the server (remote) and on this machine (local). The
// handlers are called in the order in which the backend reported the outcomes;
// a success handler never receives an error record.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request; the result calls one handler per answer
// on the engine's delivery thread and catches and discards any exception a
// handler throws. The callback lives as long as a result holds it.
#ifndef ZEL_DELETECB_H
#define ZEL_DELETECB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <QString>
#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_MobID;

class ZEL_EXPORT Zel_DeleteCB : public Orv_ResultsCB
{
public:
    Zel_DeleteCB();
    Zel_DeleteCB(const Zel_DeleteCB& other);
    virtual ~Zel_DeleteCB();

    // Number of remote assets deleted.
    virtual void remoteAssetDeleteSuccessTotalResult(long count) = 0;
    // Number of remote metadata records deleted.
    virtual void remoteMetadataDeleteSuccessTotalResult(long count) = 0;
    // The metadata of a media object could not be deleted on the server.
    virtual void remoteMetadataDeleteErrorPartialResult(boost::shared_ptr<Zel_MobID> mobID,
                                                        boost::shared_ptr<Zel_Error> error) = 0;
    // The media of a media object were deleted on the server.
    virtual void remoteMediaDeleteSuccessPartialResult(boost::shared_ptr<Zel_MobID> mobID) = 0;
    // Media could not be deleted on the server: the backend's five texts, in
    // the order it gave them, and the error record.
    virtual void remoteMediaDeleteErrorPartialResult(boost::shared_ptr<QString> text1,
                                                     boost::shared_ptr<QString> text2,
                                                     boost::shared_ptr<QString> text3,
                                                     boost::shared_ptr<QString> text4,
                                                     boost::shared_ptr<QString> text5,
                                                     boost::shared_ptr<Zel_Error> error) = 0;
    // The media of a media object were deleted on this machine.
    virtual void localDeleteMediaSuccessPartialResult(boost::shared_ptr<Zel_MobID> mobID) = 0;
    // Media could not be deleted on this machine: the backend's four texts, in
    // the order it gave them, and the error record.
    virtual void localDeleteMediaErrorPartialResult(boost::shared_ptr<QString> text1,
                                                    boost::shared_ptr<QString> text2,
                                                    boost::shared_ptr<QString> text3,
                                                    boost::shared_ptr<QString> text4,
                                                    boost::shared_ptr<Zel_Error> error) = 0;
    // A media object to delete was not found on this machine.
    virtual void localDeleteMobNotFoundErrorPartialResult(boost::shared_ptr<Zel_MobID> mobID,
                                                          boost::shared_ptr<Zel_Error> error) = 0;
    // The deletion failed as a whole: its error record.
    virtual void errorResult(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_DeleteCB& operator=(const Zel_DeleteCB&) = delete;
};

#endif
