// Zel_GetNodeRes: the answers to Zel_GetNodeReq, each a node.
//
// The backend creates it with the request's Zel_ResultCB and the final-result
// flag and adds the answers in order with setResult(node, error). The engine
// then calls deliverNext() once per answer: succeeded(node) for a success,
// failed(error) for an error record that reports an error, and finished()
// after the last answer of a final result. An empty error pointer counts as
// "no error". Delivery is that of Zel_GenericRes. Filled by one thread, then
// delivered; no lock.
#ifndef ZEL_GETNODERES_H
#define ZEL_GETNODERES_H

#include "zel_export.h"
#include "Zel_GenericRes.h"
#include "Zel_ResultCB.h"

#include <QtGlobal>
#include <boost/shared_ptr.hpp>

#include <vector>

class Zel_Error;
class Zel_Node;

class ZEL_EXPORT Zel_GetNodeRes : public Zel_GenericRes<Zel_GetNodeRes, Zel_ResultCB>
{
public:
    // One answer: the node, its error record.
    class ResultItem
    {
    public:
        ResultItem(boost::shared_ptr<Zel_Node> node, boost::shared_ptr<Zel_Error> error);
        ResultItem(const ResultItem& other) = default;
        ResultItem(ResultItem&& other) = default;
        ResultItem& operator=(const ResultItem& other) = default;
        ResultItem& operator=(ResultItem&& other) = default;
        virtual ~ResultItem();

        boost::shared_ptr<Zel_Node> mNode;
        boost::shared_ptr<Zel_Error> mError;
    };

    Zel_GetNodeRes(boost::shared_ptr<Zel_ResultCB> callback, bool finalResult);
    Zel_GetNodeRes(const Zel_GetNodeRes& other);
    Zel_GetNodeRes& operator=(const Zel_GetNodeRes& other);
    virtual ~Zel_GetNodeRes();

    // Appends one answer; an empty error pointer is stored as a "no error" record.
    virtual void setResult(boost::shared_ptr<Zel_Node> node, boost::shared_ptr<Zel_Error> error);

protected:
    boost::shared_ptr<Zel_ResultCB> mCallback;
    std::vector<ResultItem> mItems;
    quint64 mCursor;

private:
    friend class Zel_GenericRes<Zel_GetNodeRes, Zel_ResultCB>;
    static void callSucceeded(Zel_ResultCB& callback, const ResultItem& item);
};

#endif
