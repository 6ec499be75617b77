// Zel_AddDependencyRes: the answers to Zel_AddDependencyReq, each a node with
// its dependencies (the list is copied into the answer).
//
// The backend creates it with the request's Zel_DependencyCB and the final-
// result flag and adds the answers in order with setResult(node, dependencies,
// error). The engine then calls deliverNext() once per answer: succeeded(node,
// dependencies) for a success, failed(error) for an error record that reports
// an error, and finished() after the last answer of a final result. An empty
// error pointer counts as "no error". Delivery is that of Zel_GenericRes.
// Filled by one thread, then delivered; no lock.
#ifndef ZEL_ADDDEPENDENCYRES_H
#define ZEL_ADDDEPENDENCYRES_H

#include "zel_export.h"
#include "Zel_DependencyCB.h"
#include "Zel_DependencySPList.h"
#include "Zel_GenericRes.h"

#include <QtGlobal>
#include <boost/shared_ptr.hpp>

#include <vector>

class Zel_Error;
class Zel_Node;

class ZEL_EXPORT Zel_AddDependencyRes
    : public Zel_GenericRes<Zel_AddDependencyRes, Zel_DependencyCB>
{
public:
    // One answer: the node, the dependency list, its error record.
    class ResultItem
    {
    public:
        ResultItem(boost::shared_ptr<Zel_Node> node, Zel_DependencySPList dependencies,
                   boost::shared_ptr<Zel_Error> error);
        ResultItem(const ResultItem& other) = default;
        ResultItem(ResultItem&& other) = default;
        ResultItem& operator=(const ResultItem& other) = default;
        ResultItem& operator=(ResultItem&& other) = default;
        virtual ~ResultItem();

        boost::shared_ptr<Zel_Node> mNode;
        Zel_DependencySPList mDependencies;
        boost::shared_ptr<Zel_Error> mError;
    };

    Zel_AddDependencyRes(boost::shared_ptr<Zel_DependencyCB> callback, bool finalResult);
    Zel_AddDependencyRes(const Zel_AddDependencyRes& other);
    Zel_AddDependencyRes& operator=(const Zel_AddDependencyRes& other);
    virtual ~Zel_AddDependencyRes();

    // Appends one answer; an empty error pointer is stored as a "no error" record.
    virtual void setResult(boost::shared_ptr<Zel_Node> node, Zel_DependencySPList dependencies,
                           boost::shared_ptr<Zel_Error> error);

protected:
    std::vector<ResultItem> mItems;
    quint64 mCursor;
    boost::shared_ptr<Zel_DependencyCB> mCallback;

private:
    friend class Zel_GenericRes<Zel_AddDependencyRes, Zel_DependencyCB>;
    static void callSucceeded(Zel_DependencyCB& callback, const ResultItem& item);
};

#endif
