// Zel_GetReservationsRes: the answers to Zel_GetReservationsReq, each a
// reservation's text and date-time.
//
// The backend creates it with the request's Zel_GetReservationsCB and the
// final-result flag and adds the answers in order with setResult(text,
// dateTime, error). The engine then calls deliverNext() once per answer:
// succeeded(text, dateTime) for a success, failed(error) for an error record
// that reports an error, and finished() after the last answer of a final
// result. An empty error pointer counts as "no error". Delivery is that of
// Zel_GenericRes. Filled by one thread, then delivered; no lock.
#ifndef ZEL_GETRESERVATIONSRES_H
#define ZEL_GETRESERVATIONSRES_H

#include "zel_export.h"
#include "Zel_GenericRes.h"
#include "Zel_GetReservationsCB.h"

#include <QDateTime>
#include <QString>
#include <QtGlobal>
#include <boost/shared_ptr.hpp>

#include <vector>

class Zel_Error;

class ZEL_EXPORT Zel_GetReservationsRes
    : public Zel_GenericRes<Zel_GetReservationsRes, Zel_GetReservationsCB>
{
public:
    // One answer: the text, the date-time, its error record.
    class ResultItem
    {
    public:
        ResultItem(QString text, QDateTime dateTime, boost::shared_ptr<Zel_Error> error);
        ResultItem(const ResultItem& other) = default;
        ResultItem(ResultItem&& other) = default;
        ResultItem& operator=(const ResultItem& other) = default;
        ResultItem& operator=(ResultItem&& other) = default;
        virtual ~ResultItem();

        QString mText;
        QDateTime mDateTime;
        boost::shared_ptr<Zel_Error> mError;
    };

    Zel_GetReservationsRes(boost::shared_ptr<Zel_GetReservationsCB> callback, bool finalResult);
    Zel_GetReservationsRes(const Zel_GetReservationsRes& other);
    Zel_GetReservationsRes& operator=(const Zel_GetReservationsRes& other);
    virtual ~Zel_GetReservationsRes();

    // Appends one answer; an empty error pointer is stored as a "no error" record.
    virtual void setResult(QString text, QDateTime dateTime, boost::shared_ptr<Zel_Error> error);

protected:
    boost::shared_ptr<Zel_GetReservationsCB> mCallback;
    std::vector<ResultItem> mItems;
    quint64 mCursor;

private:
    friend class Zel_GenericRes<Zel_GetReservationsRes, Zel_GetReservationsCB>;
    static void callSucceeded(Zel_GetReservationsCB& callback, const ResultItem& item);
};

#endif
