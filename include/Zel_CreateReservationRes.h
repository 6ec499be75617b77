// Zel_CreateReservationRes: the answers to Zel_CreateReservationReq, each only
// the outcome of the reservation.
//
// The backend creates it with the request's Zel_CreateReservationCB and the
// final-result flag and adds the answers in order with setResult(error). The
// engine then calls deliverNext() once per answer: succeeded() for a success,
// failed(error) for an error record that reports an error, and finished()
// after the last answer of a final result. An empty error pointer counts as
// "no error". Delivery is that of Zel_GenericRes. Filled by one thread, then
// delivered; no lock.
#ifndef ZEL_CREATERESERVATIONRES_H
#define ZEL_CREATERESERVATIONRES_H

#include "zel_export.h"
#include "Zel_CreateReservationCB.h"
#include "Zel_GenericRes.h"

#include <QtGlobal>
#include <boost/shared_ptr.hpp>

#include <vector>

class Zel_Error;

class ZEL_EXPORT Zel_CreateReservationRes
    : public Zel_GenericRes<Zel_CreateReservationRes, Zel_CreateReservationCB>
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

    Zel_CreateReservationRes(boost::shared_ptr<Zel_CreateReservationCB> callback, bool finalResult);
    Zel_CreateReservationRes(const Zel_CreateReservationRes& other);
    Zel_CreateReservationRes& operator=(const Zel_CreateReservationRes& other);
    virtual ~Zel_CreateReservationRes();

    // Appends one answer; an empty error pointer is stored as a "no error" record.
    virtual void setResult(boost::shared_ptr<Zel_Error> error);

protected:
    boost::shared_ptr<Zel_CreateReservationCB> mCallback;
    std::vector<ResultItem> mItems;
    quint64 mCursor;

private:
    friend class Zel_GenericRes<Zel_CreateReservationRes, Zel_CreateReservationCB>;
    static void callSucceeded(Zel_CreateReservationCB& callback, const ResultItem& item);
};

#endif
