// Zel_CheckinUpdateRes: the outcomes of a check-in update
// (Zel_CheckinUpdateReq), each only a success or an error.
//
// The backend creates it with the request's Zel_CheckinUpdateCB and the
// final-result flag and adds one item per outcome with addItem(error). The
// engine then calls deliverNext() once per item, in the order added:
// succeeded() for an item whose error record reports no error, failed(error)
// for the others; finished() follows the last item of a final result (or comes
// alone when a final result has no items). deliverNext() answers true while
// items remain.
//
// An exception thrown by a handler is caught and discarded: the item counts as
// delivered and delivery goes on as if the handler had returned, so no item
// and no end notice is lost. Without a callback nothing is delivered and
// deliverNext() answers false. An empty error pointer given to addItem is
// stored as a "no error" record. Filled by one thread, then delivered; no lock.
#ifndef ZEL_CHECKINUPDATERES_H
#define ZEL_CHECKINUPDATERES_H

#include "zel_export.h"
#include "Orv_Result.h"
#include "Zel_CheckinUpdateCB.h"

#include <QtGlobal>
#include <boost/shared_ptr.hpp>

#include <vector>

class Zel_Error;

class ZEL_EXPORT Zel_CheckinUpdateRes : public Orv_Result
{
public:
    // One outcome: its error record.
    class ListItem
    {
    public:
        explicit ListItem(boost::shared_ptr<Zel_Error> error);
        ListItem(const ListItem& other) = default;
        ListItem(ListItem&& other) = default;
        ListItem& operator=(const ListItem& other) = default;
        ListItem& operator=(ListItem&& other) = default;
        virtual ~ListItem();

        boost::shared_ptr<Zel_Error> mError;
    };

    Zel_CheckinUpdateRes(boost::shared_ptr<Zel_CheckinUpdateCB> callback, bool finalResult);
    Zel_CheckinUpdateRes(const Zel_CheckinUpdateRes& other);
    Zel_CheckinUpdateRes& operator=(const Zel_CheckinUpdateRes& other);
    virtual ~Zel_CheckinUpdateRes();

    // Delivers one item; true while more items remain.
    bool deliverNext() override;
    // Appends one outcome.
    virtual void addItem(boost::shared_ptr<Zel_Error> error);

protected:
    boost::shared_ptr<Zel_CheckinUpdateCB> mCallback;
    std::vector<ListItem> mItems;
    quint64 mCursor;
};

#endif
