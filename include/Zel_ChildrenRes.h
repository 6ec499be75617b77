// Zel_ChildrenRes: the answers to Zel_ChildrenReq, each either a node with a
// flag or a pair of nodes.
//
// The backend creates it with the request's Zel_ChildrenCB and the final-result
// flag and adds the answers in order with the two setResult overloads. The
// engine then calls deliverNext() once per answer: a node-and-flag answer goes
// to succeeded(node, flag), a node-pair answer to succeeded(first, second), an
// answer whose error record reports an error to failed(first node, error), and
// finished() follows the last answer of a final result. An empty error pointer
// counts as "no error". Delivery is otherwise that of Zel_GenericRes. Filled by
// one thread, then delivered; no lock.
#ifndef ZEL_CHILDRENRES_H
#define ZEL_CHILDRENRES_H

#include "zel_export.h"
#include "Zel_ChildrenCB.h"
#include "Zel_GenericRes.h"

#include <QtGlobal>
#include <boost/shared_ptr.hpp>

#include <vector>

class Zel_Error;
class Zel_Node;

class ZEL_EXPORT Zel_ChildrenRes : public Zel_GenericRes<Zel_ChildrenRes, Zel_ChildrenCB>
{
public:
    // One answer: the first and second node, the error record, the kind (true
    // for a node-and-flag answer, false for a node pair) and the flag.
    class ResultItem
    {
    public:
        ResultItem(boost::shared_ptr<Zel_Node> firstNode, boost::shared_ptr<Zel_Node> secondNode,
                   boost::shared_ptr<Zel_Error> error, bool nodeAndFlag, bool flag);
        ResultItem(const ResultItem& other) = default;
        ResultItem(ResultItem&& other) = default;
        ResultItem& operator=(const ResultItem& other) = default;
        ResultItem& operator=(ResultItem&& other) = default;
        virtual ~ResultItem();

        boost::shared_ptr<Zel_Node> mFirstNode;
        boost::shared_ptr<Zel_Node> mSecondNode;
        boost::shared_ptr<Zel_Error> mError;
        bool mNodeAndFlag;
        bool mFlag;
    };

    Zel_ChildrenRes(boost::shared_ptr<Zel_ChildrenCB> callback, bool finalResult);
    Zel_ChildrenRes(const Zel_ChildrenRes& other);
    Zel_ChildrenRes& operator=(const Zel_ChildrenRes& other);
    virtual ~Zel_ChildrenRes();

    // Appends a node-and-flag answer. The first bool is accepted for the
    // backend's convenience and neither stored nor delivered; the second is
    // the flag. An empty error pointer is stored as a "no error" record.
    virtual void setResult(boost::shared_ptr<Zel_Node> node, bool unused, bool flag,
                           boost::shared_ptr<Zel_Error> error);
    // Appends a node-pair answer; an empty error pointer is stored as a
    // "no error" record.
    virtual void setResult(boost::shared_ptr<Zel_Node> firstNode, boost::shared_ptr<Zel_Node> secondNode,
                           boost::shared_ptr<Zel_Error> error);

protected:
    boost::shared_ptr<Zel_ChildrenCB> mCallback;
    std::vector<ResultItem> mItems;
    quint64 mCursor;

private:
    friend class Zel_GenericRes<Zel_ChildrenRes, Zel_ChildrenCB>;
    static void callSucceeded(Zel_ChildrenCB& callback, const ResultItem& item);
    static void callFailed(Zel_ChildrenCB& callback, const ResultItem& item);
};

#endif
