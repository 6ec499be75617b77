// Zel_CheckinRes: the outcomes of a check-in (Zel_CheckinReq), one per media
// object.
//
// The backend creates it with the request's Zel_CheckinCB and the final-result
// flag and adds one item per media object with addItem(descriptor, node, text,
// error). The engine then calls deliverNext() once per item, in the order
// added: succeeded(descriptor, node, text) for an item whose error record
// reports no error, failed(descriptor, error) for the others; finished()
// follows the last item of a final result (or comes alone when a final result
// has no items). deliverNext() answers true while items remain.
//
// An exception thrown by a handler is caught and discarded: the item counts as
// delivered and delivery goes on as if the handler had returned, so no item
// and no end notice is lost. Without a callback nothing is delivered and
// deliverNext() answers false. An empty error pointer given to addItem is
// stored as a "no error" record. Filled by one thread, then delivered; no lock.
#ifndef ZEL_CHECKINRES_H
#define ZEL_CHECKINRES_H

#include "zel_export.h"
#include "Orv_Result.h"
#include "Zel_CheckinCB.h"

#include <QString>
#include <QtGlobal>
#include <boost/shared_ptr.hpp>

#include <vector>

class Zel_Error;
class Zel_MobDesc;
class Zel_Node;

class ZEL_EXPORT Zel_CheckinRes : public Orv_Result
{
public:
    // One outcome: the descriptor, the error record, the node and a text.
    class ListItem
    {
    public:
        ListItem(boost::shared_ptr<Zel_MobDesc> mobDesc, boost::shared_ptr<Zel_Node> node,
                 boost::shared_ptr<QString> text, boost::shared_ptr<Zel_Error> error);
        ListItem(const ListItem& other) = default;
        ListItem(ListItem&& other) = default;
        ListItem& operator=(const ListItem& other) = default;
        ListItem& operator=(ListItem&& other) = default;
        virtual ~ListItem();

        boost::shared_ptr<Zel_MobDesc> mMobDesc;
        boost::shared_ptr<Zel_Error> mError;
        boost::shared_ptr<Zel_Node> mNode;
        boost::shared_ptr<QString> mText;
    };

    Zel_CheckinRes(boost::shared_ptr<Zel_CheckinCB> callback, bool finalResult);
    Zel_CheckinRes(const Zel_CheckinRes& other);
    Zel_CheckinRes& operator=(const Zel_CheckinRes& other);
    virtual ~Zel_CheckinRes();

    // Delivers one item; true while more items remain.
    bool deliverNext() override;
    // Appends one outcome.
    virtual void addItem(boost::shared_ptr<Zel_MobDesc> mobDesc, boost::shared_ptr<Zel_Node> node,
                         boost::shared_ptr<QString> text, boost::shared_ptr<Zel_Error> error);

protected:
    boost::shared_ptr<Zel_CheckinCB> mCallback;
    std::vector<ListItem> mItems;
    quint64 mCursor;
};

#endif
