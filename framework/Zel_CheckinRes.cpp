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
    return ZelResults::deliverListItem(*this, mCallback, mItems, mCursor,
                                       [](Zel_CheckinCB& callback, const ListItem& item) {
                                           if (ZelResults::reportsError(item.mError))
                                               callback.failed(item.mMobDesc, item.mError);
                                           else
                                               callback.succeeded(item.mMobDesc, item.mNode, item.mText);
                                       });
}

void Zel_CheckinRes::addItem(boost::shared_ptr<Zel_MobDesc> mobDesc, boost::shared_ptr<Zel_Node> node,
                             boost::shared_ptr<QString> text, boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(std::move(mobDesc), std::move(node), std::move(text),
                        ZelResults::errorRecord(std::move(error)));
}
