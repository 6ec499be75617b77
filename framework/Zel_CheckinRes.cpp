#include "Zel_CheckinRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_CheckinRes::ListItem::ListItem(boost::shared_ptr<Zel_MobDesc> mobDesc, boost::shared_ptr<Zel_Node> node,
                                   boost::shared_ptr<QString> text, boost::shared_ptr<Zel_Error> error)
    : mMobDesc(std::move(mobDesc))
    , mError(std::move(error))
    , mNode(std::move(node))
    , mText(std::move(text))
{
}

Zel_CheckinRes::ListItem::~ListItem() = default;

Zel_CheckinRes::Zel_CheckinRes(boost::shared_ptr<Zel_CheckinCB> callback, bool finalResult)
    : Orv_Result(callback, finalResult)
    , mCallback(std::move(callback))
    , mCursor(0)
{
}

Zel_CheckinRes::Zel_CheckinRes(const Zel_CheckinRes& other) = default;
Zel_CheckinRes& Zel_CheckinRes::operator=(const Zel_CheckinRes& other) = default;
Zel_CheckinRes::~Zel_CheckinRes() = default;

bool Zel_CheckinRes::deliverNext()
{
    try {
        if (mCallback && mCursor < mItems.size()) {
            // The cursor moves before the handler runs: a handler that throws
            // has still had its item.
            const ListItem& item = mItems[static_cast<std::size_t>(mCursor++)];
            try {
                if (ZelResults::reportsError(item.mError))
                    mCallback->failed(item.mMobDesc, item.mError);
                else
                    mCallback->succeeded(item.mMobDesc, item.mNode, item.mText);
            } catch (...) {
                // Discarded: the remaining items and the end notice still follow.
            }
            if (mCursor < mItems.size())
                return true;
        }
        if (mCallback && isFinalResult()) {
            try {
                mCallback->finished();
            } catch (...) {
            }
        }
    } catch (...) {
        // Nothing thrown inside delivery passes to the engine.
    }
    return false;
}

void Zel_CheckinRes::addItem(boost::shared_ptr<Zel_MobDesc> mobDesc, boost::shared_ptr<Zel_Node> node,
                             boost::shared_ptr<QString> text, boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(std::move(mobDesc), std::move(node), std::move(text),
                        ZelResults::errorRecord(std::move(error)));
}
