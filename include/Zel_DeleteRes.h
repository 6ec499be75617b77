// Zel_DeleteRes: the outcomes of a deletion (Zel_DeleteReq), each delivered to
// its own handler of Zel_DeleteCB.
//
// The backend creates it with the request's Zel_DeleteCB and the final-result
// flag and reports the outcomes in order through the nine setters: totals of
// remote assets and metadata records deleted, per-media-object successes and
// failures on the server (remote) and on this machine (local), and failures of
// the whole deletion (setErrorResult). Each setter appends one item; there is
// no merging and no limit. The engine then calls deliverNext() once per item,
// in storage order: the item itself picks its handler and hands it its stored
// values, so a success or total item reaches its success handler even when
// its error record reports an error (the record decides only the bookkeeping of
// Zel_Res). finished() follows the last item of a final result.
//
// Every item carries an error record; an empty error pointer given to a setter
// is stored as a "no error" record. Copies of the result share the item
// objects. Filled by one thread, then delivered; no lock.
#ifndef ZEL_DELETERES_H
#define ZEL_DELETERES_H

#include "zel_export.h"
#include "Zel_DeleteCB.h"
#include "Zel_Res.h"

#include <QList>
#include <QString>
#include <QtGlobal>
#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_MobID;

class ZEL_EXPORT Zel_DeleteRes : public Zel_Res
{
public:
    // The item of setErrorResult and the base of every other kind: an error
    // record, delivered to errorResult.
    class ZEL_EXPORT ResultItem
    {
    public:
        explicit ResultItem(boost::shared_ptr<Zel_Error> error);
        virtual ~ResultItem();

        // Calls this item's handler with its stored values; nothing when the
        // callback is empty.
        virtual void deliver(boost::shared_ptr<Zel_DeleteCB> callback);

        boost::shared_ptr<Zel_Error> mError;
    };

    // A total of remote assets deleted: remoteAssetDeleteSuccessTotalResult(count).
    class ZEL_EXPORT RemoteAssetDeleteSuccessTotalResultItem : public ResultItem
    {
    public:
        RemoteAssetDeleteSuccessTotalResultItem(long count, boost::shared_ptr<Zel_Error> error);
        virtual ~RemoteAssetDeleteSuccessTotalResultItem();
        void deliver(boost::shared_ptr<Zel_DeleteCB> callback) override;

        long mCount;
    };

    // A total of remote metadata records deleted:
    // remoteMetadataDeleteSuccessTotalResult(count).
    class ZEL_EXPORT RemoteMetadataDeleteSuccessTotalResultItem : public ResultItem
    {
    public:
        RemoteMetadataDeleteSuccessTotalResultItem(long count, boost::shared_ptr<Zel_Error> error);
        virtual ~RemoteMetadataDeleteSuccessTotalResultItem();
        void deliver(boost::shared_ptr<Zel_DeleteCB> callback) override;

        long mCount;
    };

    // Metadata not deleted on the server:
    // remoteMetadataDeleteErrorPartialResult(mobID, error).
    class ZEL_EXPORT RemoteMetadataDeleteErrorPartialResultItem : public ResultItem
    {
    public:
        RemoteMetadataDeleteErrorPartialResultItem(boost::shared_ptr<Zel_MobID> mobID,
                                                   boost::shared_ptr<Zel_Error> error);
        virtual ~RemoteMetadataDeleteErrorPartialResultItem();
        void deliver(boost::shared_ptr<Zel_DeleteCB> callback) override;

        boost::shared_ptr<Zel_MobID> mMobID;
    };

    // Media deleted on the server: remoteMediaDeleteSuccessPartialResult(mobID).
    class ZEL_EXPORT RemoteMediaDeleteSuccessPartialResultItem : public ResultItem
    {
    public:
        RemoteMediaDeleteSuccessPartialResultItem(boost::shared_ptr<Zel_MobID> mobID,
                                                  boost::shared_ptr<Zel_Error> error);
        virtual ~RemoteMediaDeleteSuccessPartialResultItem();
        void deliver(boost::shared_ptr<Zel_DeleteCB> callback) override;

        boost::shared_ptr<Zel_MobID> mMobID;
    };

    // Media not deleted on the server:
    // remoteMediaDeleteErrorPartialResult(text1, ..., text5, error).
    class ZEL_EXPORT RemoteMediaDeleteErrorPartialResultItem : public ResultItem
    {
    public:
        RemoteMediaDeleteErrorPartialResultItem(boost::shared_ptr<QString> text1, boost::shared_ptr<QString> text2,
                                                boost::shared_ptr<QString> text3, boost::shared_ptr<QString> text4,
                                                boost::shared_ptr<QString> text5, boost::shared_ptr<Zel_Error> error);
        virtual ~RemoteMediaDeleteErrorPartialResultItem();
        void deliver(boost::shared_ptr<Zel_DeleteCB> callback) override;

        boost::shared_ptr<QString> mText1;
        boost::shared_ptr<QString> mText2;
        boost::shared_ptr<QString> mText3;
        boost::shared_ptr<QString> mText4;
        boost::shared_ptr<QString> mText5;
    };

    // Media deleted on this machine: localDeleteMediaSuccessPartialResult(mobID).
    class ZEL_EXPORT LocalDeleteMediaSuccessPartialResultItem : public ResultItem
    {
    public:
        LocalDeleteMediaSuccessPartialResultItem(boost::shared_ptr<Zel_MobID> mobID,
                                                 boost::shared_ptr<Zel_Error> error);
        virtual ~LocalDeleteMediaSuccessPartialResultItem();
        void deliver(boost::shared_ptr<Zel_DeleteCB> callback) override;

        boost::shared_ptr<Zel_MobID> mMobID;
    };

    // Media not deleted on this machine:
    // localDeleteMediaErrorPartialResult(text1, ..., text4, error).
    class ZEL_EXPORT LocalDeleteMediaErrorPartialResultItem : public ResultItem
    {
    public:
        LocalDeleteMediaErrorPartialResultItem(boost::shared_ptr<QString> text1, boost::shared_ptr<QString> text2,
                                               boost::shared_ptr<QString> text3, boost::shared_ptr<QString> text4,
                                               boost::shared_ptr<Zel_Error> error);
        virtual ~LocalDeleteMediaErrorPartialResultItem();
        void deliver(boost::shared_ptr<Zel_DeleteCB> callback) override;

        boost::shared_ptr<QString> mText1;
        boost::shared_ptr<QString> mText2;
        boost::shared_ptr<QString> mText3;
        boost::shared_ptr<QString> mText4;
    };

    // A media object not found on this machine:
    // localDeleteMobNotFoundErrorPartialResult(mobID, error).
    class ZEL_EXPORT LocalDeleteMobNotFoundErrorPartialResultItem : public ResultItem
    {
    public:
        LocalDeleteMobNotFoundErrorPartialResultItem(boost::shared_ptr<Zel_MobID> mobID,
                                                     boost::shared_ptr<Zel_Error> error);
        virtual ~LocalDeleteMobNotFoundErrorPartialResultItem();
        void deliver(boost::shared_ptr<Zel_DeleteCB> callback) override;

        boost::shared_ptr<Zel_MobID> mMobID;
    };

    Zel_DeleteRes(boost::shared_ptr<Zel_DeleteCB> callback, bool finalResult);
    Zel_DeleteRes(const Zel_DeleteRes& other);
    Zel_DeleteRes& operator=(const Zel_DeleteRes& other);
    virtual ~Zel_DeleteRes();

    // The delivery of Zel_Res; when a question about the current item throws,
    // the next call goes on with the item after it.
    bool deliverNext() override;
    // True while the cursor is below the number of items.
    bool haveResults() override;
    // True when there is no current item or its error record reports an error.
    bool isCurrentResultError() override;
    // Both consume the current item and let it call its own handler.
    void doFailed() override;
    void doSucceeded() override;
    // Calls finished() when there is a callback.
    void doFinished() override;

    // Each appends one item of its kind, built from the arguments in order.
    virtual void setRemoteAssetDeleteSuccessTotalResult(long count, boost::shared_ptr<Zel_Error> error);
    virtual void setRemoteMetadataDeleteSuccessTotalResult(long count, boost::shared_ptr<Zel_Error> error);
    virtual void setRemoteMetadataDeleteErrorPartialResult(boost::shared_ptr<Zel_MobID> mobID,
                                                           boost::shared_ptr<Zel_Error> error);
    virtual void setRemoteMediaDeleteSuccessPartialResult(boost::shared_ptr<Zel_MobID> mobID,
                                                          boost::shared_ptr<Zel_Error> error);
    virtual void setRemoteMediaDeleteErrorPartialResult(boost::shared_ptr<QString> text1,
                                                        boost::shared_ptr<QString> text2,
                                                        boost::shared_ptr<QString> text3,
                                                        boost::shared_ptr<QString> text4,
                                                        boost::shared_ptr<QString> text5,
                                                        boost::shared_ptr<Zel_Error> error);
    virtual void setLocalDeleteMediaSuccessPartialResult(boost::shared_ptr<Zel_MobID> mobID,
                                                         boost::shared_ptr<Zel_Error> error);
    virtual void setLocalDeleteMediaErrorPartialResult(boost::shared_ptr<QString> text1,
                                                       boost::shared_ptr<QString> text2,
                                                       boost::shared_ptr<QString> text3,
                                                       boost::shared_ptr<QString> text4,
                                                       boost::shared_ptr<Zel_Error> error);
    virtual void setLocalDeleteMobNotFoundErrorPartialResult(boost::shared_ptr<Zel_MobID> mobID,
                                                             boost::shared_ptr<Zel_Error> error);
    virtual void setErrorResult(boost::shared_ptr<Zel_Error> error);

protected:
    boost::shared_ptr<Zel_DeleteCB> mCallback;
    QList<boost::shared_ptr<Zel_DeleteRes::ResultItem>> mItems;
    qint32 mCursor;

private:
    void deliverCurrent();
};

#endif
