#include "Zel_DeleteRes.h"

#include "zel_resultitems_p.h"

#include <boost/make_shared.hpp>

#include <utility>

// ---- items

Zel_DeleteRes::ResultItem::ResultItem(boost::shared_ptr<Zel_Error> error)
    : mError(std::move(error))
{
}

Zel_DeleteRes::ResultItem::~ResultItem() = default;

void Zel_DeleteRes::ResultItem::deliver(boost::shared_ptr<Zel_DeleteCB> callback)
{
    if (callback)
        callback->errorResult(mError);
}

Zel_DeleteRes::RemoteAssetDeleteSuccessTotalResultItem::RemoteAssetDeleteSuccessTotalResultItem(
    long count, boost::shared_ptr<Zel_Error> error)
    : ResultItem(std::move(error))
    , mCount(count)
{
}

Zel_DeleteRes::RemoteAssetDeleteSuccessTotalResultItem::~RemoteAssetDeleteSuccessTotalResultItem() = default;

void Zel_DeleteRes::RemoteAssetDeleteSuccessTotalResultItem::deliver(boost::shared_ptr<Zel_DeleteCB> callback)
{
    if (callback)
        callback->remoteAssetDeleteSuccessTotalResult(mCount);
}

Zel_DeleteRes::RemoteMetadataDeleteSuccessTotalResultItem::RemoteMetadataDeleteSuccessTotalResultItem(
    long count, boost::shared_ptr<Zel_Error> error)
    : ResultItem(std::move(error))
    , mCount(count)
{
}

Zel_DeleteRes::RemoteMetadataDeleteSuccessTotalResultItem::~RemoteMetadataDeleteSuccessTotalResultItem() = default;

void Zel_DeleteRes::RemoteMetadataDeleteSuccessTotalResultItem::deliver(boost::shared_ptr<Zel_DeleteCB> callback)
{
    if (callback)
        callback->remoteMetadataDeleteSuccessTotalResult(mCount);
}

Zel_DeleteRes::RemoteMetadataDeleteErrorPartialResultItem::RemoteMetadataDeleteErrorPartialResultItem(
    boost::shared_ptr<Zel_MobID> mobID, boost::shared_ptr<Zel_Error> error)
    : ResultItem(std::move(error))
    , mMobID(std::move(mobID))
{
}

Zel_DeleteRes::RemoteMetadataDeleteErrorPartialResultItem::~RemoteMetadataDeleteErrorPartialResultItem() = default;

void Zel_DeleteRes::RemoteMetadataDeleteErrorPartialResultItem::deliver(boost::shared_ptr<Zel_DeleteCB> callback)
{
    if (callback)
        callback->remoteMetadataDeleteErrorPartialResult(mMobID, mError);
}

Zel_DeleteRes::RemoteMediaDeleteSuccessPartialResultItem::RemoteMediaDeleteSuccessPartialResultItem(
    boost::shared_ptr<Zel_MobID> mobID, boost::shared_ptr<Zel_Error> error)
    : ResultItem(std::move(error))
    , mMobID(std::move(mobID))
{
}

Zel_DeleteRes::RemoteMediaDeleteSuccessPartialResultItem::~RemoteMediaDeleteSuccessPartialResultItem() = default;

void Zel_DeleteRes::RemoteMediaDeleteSuccessPartialResultItem::deliver(boost::shared_ptr<Zel_DeleteCB> callback)
{
    if (callback)
        callback->remoteMediaDeleteSuccessPartialResult(mMobID);
}

Zel_DeleteRes::RemoteMediaDeleteErrorPartialResultItem::RemoteMediaDeleteErrorPartialResultItem(
    boost::shared_ptr<QString> text1, boost::shared_ptr<QString> text2, boost::shared_ptr<QString> text3,
    boost::shared_ptr<QString> text4, boost::shared_ptr<QString> text5, boost::shared_ptr<Zel_Error> error)
    : ResultItem(std::move(error))
    , mText1(std::move(text1))
    , mText2(std::move(text2))
    , mText3(std::move(text3))
    , mText4(std::move(text4))
    , mText5(std::move(text5))
{
}

Zel_DeleteRes::RemoteMediaDeleteErrorPartialResultItem::~RemoteMediaDeleteErrorPartialResultItem() = default;

void Zel_DeleteRes::RemoteMediaDeleteErrorPartialResultItem::deliver(boost::shared_ptr<Zel_DeleteCB> callback)
{
    if (callback)
        callback->remoteMediaDeleteErrorPartialResult(mText1, mText2, mText3, mText4, mText5, mError);
}

Zel_DeleteRes::LocalDeleteMediaSuccessPartialResultItem::LocalDeleteMediaSuccessPartialResultItem(
    boost::shared_ptr<Zel_MobID> mobID, boost::shared_ptr<Zel_Error> error)
    : ResultItem(std::move(error))
    , mMobID(std::move(mobID))
{
}

Zel_DeleteRes::LocalDeleteMediaSuccessPartialResultItem::~LocalDeleteMediaSuccessPartialResultItem() = default;

void Zel_DeleteRes::LocalDeleteMediaSuccessPartialResultItem::deliver(boost::shared_ptr<Zel_DeleteCB> callback)
{
    if (callback)
        callback->localDeleteMediaSuccessPartialResult(mMobID);
}

Zel_DeleteRes::LocalDeleteMediaErrorPartialResultItem::LocalDeleteMediaErrorPartialResultItem(
    boost::shared_ptr<QString> text1, boost::shared_ptr<QString> text2, boost::shared_ptr<QString> text3,
    boost::shared_ptr<QString> text4, boost::shared_ptr<Zel_Error> error)
    : ResultItem(std::move(error))
    , mText1(std::move(text1))
    , mText2(std::move(text2))
    , mText3(std::move(text3))
    , mText4(std::move(text4))
{
}

Zel_DeleteRes::LocalDeleteMediaErrorPartialResultItem::~LocalDeleteMediaErrorPartialResultItem() = default;

void Zel_DeleteRes::LocalDeleteMediaErrorPartialResultItem::deliver(boost::shared_ptr<Zel_DeleteCB> callback)
{
    if (callback)
        callback->localDeleteMediaErrorPartialResult(mText1, mText2, mText3, mText4, mError);
}

Zel_DeleteRes::LocalDeleteMobNotFoundErrorPartialResultItem::LocalDeleteMobNotFoundErrorPartialResultItem(
    boost::shared_ptr<Zel_MobID> mobID, boost::shared_ptr<Zel_Error> error)
    : ResultItem(std::move(error))
    , mMobID(std::move(mobID))
{
}

Zel_DeleteRes::LocalDeleteMobNotFoundErrorPartialResultItem::~LocalDeleteMobNotFoundErrorPartialResultItem() = default;

void Zel_DeleteRes::LocalDeleteMobNotFoundErrorPartialResultItem::deliver(boost::shared_ptr<Zel_DeleteCB> callback)
{
    if (callback)
        callback->localDeleteMobNotFoundErrorPartialResult(mMobID, mError);
}

// ---- result

Zel_DeleteRes::Zel_DeleteRes(boost::shared_ptr<Zel_DeleteCB> callback, bool finalResult)
    : Zel_Res(callback, finalResult)
    , mCallback(std::move(callback))
    , mCursor(0)
{
}

Zel_DeleteRes::Zel_DeleteRes(const Zel_DeleteRes& other) = default;
Zel_DeleteRes& Zel_DeleteRes::operator=(const Zel_DeleteRes& other) = default;
Zel_DeleteRes::~Zel_DeleteRes() = default;

bool Zel_DeleteRes::deliverNext()
{
    return deliverNextStep([](Zel_Res& result, bool skip) {
        Zel_DeleteRes& self = static_cast<Zel_DeleteRes&>(result);
        const bool inRange = self.mCursor >= 0 && self.mCursor < self.mItems.size();
        if (skip && inRange)
            ++self.mCursor;
        return self.mCursor >= 0 && self.mCursor < self.mItems.size();
    });
}

bool Zel_DeleteRes::haveResults()
{
    return mItems.size() > mCursor;
}

bool Zel_DeleteRes::isCurrentResultError()
{
    if (mCursor < 0 || mCursor >= mItems.size())
        return true;
    return ZelResults::reportsError(mItems.at(mCursor)->mError);
}

void Zel_DeleteRes::doFailed()
{
    deliverCurrent();
}

void Zel_DeleteRes::doSucceeded()
{
    deliverCurrent();
}

void Zel_DeleteRes::doFinished()
{
    if (mCallback)
        mCallback->finished();
}

// The item, not the success-or-failure verdict, picks the handler. The item is
// consumed even without a callback, so that delivery comes to an end.
void Zel_DeleteRes::deliverCurrent()
{
    if (mCursor < 0 || mCursor >= mItems.size())
        return;
    const boost::shared_ptr<ResultItem>& item = mItems.at(mCursor++);
    if (mCallback && item)
        item->deliver(mCallback);
}

void Zel_DeleteRes::setRemoteAssetDeleteSuccessTotalResult(long count, boost::shared_ptr<Zel_Error> error)
{
    mItems.append(boost::make_shared<RemoteAssetDeleteSuccessTotalResultItem>(
        count, ZelResults::errorRecord(std::move(error))));
}

void Zel_DeleteRes::setRemoteMetadataDeleteSuccessTotalResult(long count, boost::shared_ptr<Zel_Error> error)
{
    mItems.append(boost::make_shared<RemoteMetadataDeleteSuccessTotalResultItem>(
        count, ZelResults::errorRecord(std::move(error))));
}

void Zel_DeleteRes::setRemoteMetadataDeleteErrorPartialResult(boost::shared_ptr<Zel_MobID> mobID,
                                                              boost::shared_ptr<Zel_Error> error)
{
    mItems.append(boost::make_shared<RemoteMetadataDeleteErrorPartialResultItem>(
        std::move(mobID), ZelResults::errorRecord(std::move(error))));
}

void Zel_DeleteRes::setRemoteMediaDeleteSuccessPartialResult(boost::shared_ptr<Zel_MobID> mobID,
                                                             boost::shared_ptr<Zel_Error> error)
{
    mItems.append(boost::make_shared<RemoteMediaDeleteSuccessPartialResultItem>(
        std::move(mobID), ZelResults::errorRecord(std::move(error))));
}

void Zel_DeleteRes::setRemoteMediaDeleteErrorPartialResult(boost::shared_ptr<QString> text1,
                                                           boost::shared_ptr<QString> text2,
                                                           boost::shared_ptr<QString> text3,
                                                           boost::shared_ptr<QString> text4,
                                                           boost::shared_ptr<QString> text5,
                                                           boost::shared_ptr<Zel_Error> error)
{
    mItems.append(boost::make_shared<RemoteMediaDeleteErrorPartialResultItem>(
        std::move(text1), std::move(text2), std::move(text3), std::move(text4), std::move(text5),
        ZelResults::errorRecord(std::move(error))));
}

void Zel_DeleteRes::setLocalDeleteMediaSuccessPartialResult(boost::shared_ptr<Zel_MobID> mobID,
                                                            boost::shared_ptr<Zel_Error> error)
{
    mItems.append(boost::make_shared<LocalDeleteMediaSuccessPartialResultItem>(
        std::move(mobID), ZelResults::errorRecord(std::move(error))));
}

void Zel_DeleteRes::setLocalDeleteMediaErrorPartialResult(boost::shared_ptr<QString> text1,
                                                          boost::shared_ptr<QString> text2,
                                                          boost::shared_ptr<QString> text3,
                                                          boost::shared_ptr<QString> text4,
                                                          boost::shared_ptr<Zel_Error> error)
{
    mItems.append(boost::make_shared<LocalDeleteMediaErrorPartialResultItem>(
        std::move(text1), std::move(text2), std::move(text3), std::move(text4),
        ZelResults::errorRecord(std::move(error))));
}

void Zel_DeleteRes::setLocalDeleteMobNotFoundErrorPartialResult(boost::shared_ptr<Zel_MobID> mobID,
                                                                boost::shared_ptr<Zel_Error> error)
{
    mItems.append(boost::make_shared<LocalDeleteMobNotFoundErrorPartialResultItem>(
        std::move(mobID), ZelResults::errorRecord(std::move(error))));
}

void Zel_DeleteRes::setErrorResult(boost::shared_ptr<Zel_Error> error)
{
    mItems.append(boost::make_shared<ResultItem>(ZelResults::errorRecord(std::move(error))));
}
