// Zel_GetLinkedProjectsRes: the answers to Zel_GetLinkedProjectsReq, each a
// linked project.
//
// The backend creates it with the request's Zel_ResultCB and the final-result
// flag and adds the answers in order with setResult(node, error). The engine
// then calls deliverNext() once per answer: succeeded(node) for a success,
// failed(error) for an error record that reports an error, and finished()
// after the last answer of a final result. An empty error pointer counts as
// "no error". Delivery is that of Zel_GenericRes. Filled by one thread, then
// delivered; no lock.
#ifndef ZEL_GETLINKEDPROJECTSRES_H
#define ZEL_GETLINKEDPROJECTSRES_H

#include "zel_export.h"
#include "Zel_GenericRes.h"
#include "Zel_ResultCB.h"

#include <QtGlobal>
#include <boost/shared_ptr.hpp>

#include <vector>

class Zel_Error;
class Zel_Node;

class ZEL_EXPORT Zel_GetLinkedProjectsRes
    : public Zel_GenericRes<Zel_GetLinkedProjectsRes, Zel_ResultCB>
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

    Zel_GetLinkedProjectsRes(boost::shared_ptr<Zel_ResultCB> callback, bool finalResult);
    Zel_GetLinkedProjectsRes(const Zel_GetLinkedProjectsRes& other);
    Zel_GetLinkedProjectsRes& operator=(const Zel_GetLinkedProjectsRes& other);
    virtual ~Zel_GetLinkedProjectsRes();

    // Appends one answer; an empty error pointer is stored as a "no error" record.
    virtual void setResult(boost::shared_ptr<Zel_Node> node, boost::shared_ptr<Zel_Error> error);

protected:
    boost::shared_ptr<Zel_ResultCB> mCallback;
    std::vector<ResultItem> mItems;
    quint64 mCursor;

private:
    friend class Zel_GenericRes<Zel_GetLinkedProjectsRes, Zel_ResultCB>;
    static void callSucceeded(Zel_ResultCB& callback, const ResultItem& item);
};

#endif
