// Zel_DeleteNodeRes: the answers to Zel_DeleteNodeReq, each the yes/no outcome
// of deleting one node.
//
// The backend creates it with the request's Zel_ResultBoolCB and the final-
// result flag and adds the answers in order with setResult(deleted, error).
// The engine then calls deliverNext() once per answer: succeeded(deleted) for
// a success, failed(error) for an error record that reports an error, and
// finished() after the last answer of a final result. An empty error pointer
// counts as "no error". Delivery is that of Zel_GenericRes. Filled by one
// thread, then delivered; no lock.
#ifndef ZEL_DELETENODERES_H
#define ZEL_DELETENODERES_H

#include "zel_export.h"
#include "Zel_GenericRes.h"
#include "Zel_ResultBoolCB.h"

#include <QtGlobal>
#include <boost/shared_ptr.hpp>

#include <vector>

class Zel_Error;

class ZEL_EXPORT Zel_DeleteNodeRes : public Zel_GenericRes<Zel_DeleteNodeRes, Zel_ResultBoolCB>
{
public:
    // One answer: the outcome, its error record.
    class ResultItem
    {
    public:
        ResultItem(bool deleted, boost::shared_ptr<Zel_Error> error);
        ResultItem(const ResultItem& other) = default;
        ResultItem(ResultItem&& other) = default;
        ResultItem& operator=(const ResultItem& other) = default;
        ResultItem& operator=(ResultItem&& other) = default;
        virtual ~ResultItem();

        bool mDeleted;
        boost::shared_ptr<Zel_Error> mError;
    };

    Zel_DeleteNodeRes(boost::shared_ptr<Zel_ResultBoolCB> callback, bool finalResult);
    Zel_DeleteNodeRes(const Zel_DeleteNodeRes& other);
    Zel_DeleteNodeRes& operator=(const Zel_DeleteNodeRes& other);
    virtual ~Zel_DeleteNodeRes();

    // Appends one answer; an empty error pointer is stored as a "no error" record.
    virtual void setResult(bool deleted, boost::shared_ptr<Zel_Error> error);

protected:
    boost::shared_ptr<Zel_ResultBoolCB> mCallback;
    std::vector<ResultItem> mItems;
    quint64 mCursor;

private:
    friend class Zel_GenericRes<Zel_DeleteNodeRes, Zel_ResultBoolCB>;
    static void callSucceeded(Zel_ResultBoolCB& callback, const ResultItem& item);
};

#endif
