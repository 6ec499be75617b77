#include "Zel_CheckinUpdateRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_CheckinUpdateRes::ListItem::ListItem(boost::shared_ptr<Zel_Error> error)
    : mError(std::move(error))
{
}

Zel_CheckinUpdateRes::ListItem::~ListItem() = default;

Zel_CheckinUpdateRes::Zel_CheckinUpdateRes(boost::shared_ptr<Zel_CheckinUpdateCB> callback, bool finalResult)
    : Orv_Result(callback, finalResult)
    , mCallback(std::move(callback))
    , mCursor(0)
{
}

Zel_CheckinUpdateRes::Zel_CheckinUpdateRes(const Zel_CheckinUpdateRes& other) = default;
Zel_CheckinUpdateRes& Zel_CheckinUpdateRes::operator=(const Zel_CheckinUpdateRes& other) = default;
Zel_CheckinUpdateRes::~Zel_CheckinUpdateRes() = default;

bool Zel_CheckinUpdateRes::deliverNext()
{
    try {
        if (mCallback && mCursor < mItems.size()) {
            // The cursor moves before the handler runs: a handler that throws
            // has still had its item.
            const ListItem& item = mItems[static_cast<std::size_t>(mCursor++)];
            try {
                if (ZelResults::reportsError(item.mError))
                    mCallback->failed(item.mError);
                else
                    mCallback->succeeded();
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

void Zel_CheckinUpdateRes::addItem(boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(ZelResults::errorRecord(std::move(error)));
}
