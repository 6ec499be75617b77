// Zel_CreateFolderUniqueRes: the answers to Zel_CreateFolderUniqueReq, each
// the folder created.
//
// The backend creates it with the request's Zel_CreateFolderUniqueCB and the
// final-result flag and adds the answers in order with setResult(folder,
// error). The engine then calls deliverNext() once per answer:
// succeeded(folder) for a success, failed(error) for an error record that
// reports an error, and finished() after the last answer of a final result. An
// empty error pointer counts as "no error". Delivery is that of
// Zel_GenericRes. Filled by one thread, then delivered; no lock.
#ifndef ZEL_CREATEFOLDERUNIQUERES_H
#define ZEL_CREATEFOLDERUNIQUERES_H

#include "zel_export.h"
#include "Zel_CreateFolderUniqueCB.h"
#include "Zel_GenericRes.h"

#include <QtGlobal>
#include <boost/shared_ptr.hpp>

#include <vector>

class Zel_Error;
class Zel_Node;

class ZEL_EXPORT Zel_CreateFolderUniqueRes
    : public Zel_GenericRes<Zel_CreateFolderUniqueRes, Zel_CreateFolderUniqueCB>
{
public:
    // One answer: the folder, its error record.
    class ResultItem
    {
    public:
        ResultItem(boost::shared_ptr<Zel_Node> folder, boost::shared_ptr<Zel_Error> error);
        ResultItem(const ResultItem& other) = default;
        ResultItem(ResultItem&& other) = default;
        ResultItem& operator=(const ResultItem& other) = default;
        ResultItem& operator=(ResultItem&& other) = default;
        virtual ~ResultItem();

        boost::shared_ptr<Zel_Node> mNode;
        boost::shared_ptr<Zel_Error> mError;
    };

    Zel_CreateFolderUniqueRes(boost::shared_ptr<Zel_CreateFolderUniqueCB> callback, bool finalResult);
    Zel_CreateFolderUniqueRes(const Zel_CreateFolderUniqueRes& other);
    Zel_CreateFolderUniqueRes& operator=(const Zel_CreateFolderUniqueRes& other);
    virtual ~Zel_CreateFolderUniqueRes();

    // Appends one answer; an empty error pointer is stored as a "no error" record.
    virtual void setResult(boost::shared_ptr<Zel_Node> folder, boost::shared_ptr<Zel_Error> error);

protected:
    boost::shared_ptr<Zel_CreateFolderUniqueCB> mCallback;
    std::vector<ResultItem> mItems;
    quint64 mCursor;

private:
    friend class Zel_GenericRes<Zel_CreateFolderUniqueRes, Zel_CreateFolderUniqueCB>;
    static void callSucceeded(Zel_CreateFolderUniqueCB& callback, const ResultItem& item);
};

#endif
