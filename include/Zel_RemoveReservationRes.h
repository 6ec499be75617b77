// Zel_RemoveReservationRes: the answers to Zel_RemoveReservationReq, each only
// the outcome of the removal.
//
// The backend creates it with the request's Zel_RemoveReservationCB and the
// final-result flag and adds the answers in order with setResult(error). The
// engine then calls deliverNext() once per answer: succeeded() for a success,
// failed(error) for an error record that reports an error, and finished()
// after the last answer of a final result. An empty error pointer counts as
// "no error". Delivery is that of Zel_GenericRes. Filled by one thread, then
// delivered; no lock.
#ifndef ZEL_REMOVERESERVATIONRES_H
#define ZEL_REMOVERESERVATIONRES_H

#include "zel_export.h"
#include "Zel_GenericRes.h"
#include "Zel_RemoveReservationCB.h"

#include <QtGlobal>
#include <boost/shared_ptr.hpp>

#include <vector>

class Zel_Error;

class ZEL_EXPORT Zel_RemoveReservationRes
    : public Zel_GenericRes<Zel_RemoveReservationRes, Zel_RemoveReservationCB>
{
public:
    // One answer: its error record.
    class ResultItem
    {
    public:
        explicit ResultItem(boost::shared_ptr<Zel_Error> error);
        ResultItem(const ResultItem& other) = default;
        ResultItem(ResultItem&& other) = default;
        ResultItem& operator=(const ResultItem& other) = default;
        ResultItem& operator=(ResultItem&& other) = default;
        virtual ~ResultItem();

        boost::shared_ptr<Zel_Error> mError;
    };

    Zel_RemoveReservationRes(boost::shared_ptr<Zel_RemoveReservationCB> callback, bool finalResult);
    Zel_RemoveReservationRes(const Zel_RemoveReservationRes& other);
    Zel_RemoveReservationRes& operator=(const Zel_RemoveReservationRes& other);
    virtual ~Zel_RemoveReservationRes();

    // Appends one answer; an empty error pointer is stored as a "no error" record.
    virtual void setResult(boost::shared_ptr<Zel_Error> error);

protected:
    boost::shared_ptr<Zel_RemoveReservationCB> mCallback;
    std::vector<ResultItem> mItems;
    quint64 mCursor;

private:
    friend class Zel_GenericRes<Zel_RemoveReservationRes, Zel_RemoveReservationCB>;
    static void callSucceeded(Zel_RemoveReservationCB& callback, const ResultItem& item);
};

#endif
