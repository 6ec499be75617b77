// Zel_AssociationsRes: the answers to Zel_AssociationsReq, each an associated
// directory.
//
// The backend creates it with the request's Zel_AssociationsCB and the final-
// result flag and adds the answers in order with setResult(directory, error).
// The engine then calls deliverNext() once per answer: succeeded(directory)
// for a success, failed(error) for an error record that reports an error, and
// finished() after the last answer of a final result. An empty error pointer
// counts as "no error". Delivery is that of Zel_GenericRes. Filled by one
// thread, then delivered; no lock.
#ifndef ZEL_ASSOCIATIONSRES_H
#define ZEL_ASSOCIATIONSRES_H

#include "zel_export.h"
#include "Zel_AssociationsCB.h"
#include "Zel_GenericRes.h"

#include <QtGlobal>
#include <boost/shared_ptr.hpp>

#include <vector>

class Zel_Directory;
class Zel_Error;

class ZEL_EXPORT Zel_AssociationsRes
    : public Zel_GenericRes<Zel_AssociationsRes, Zel_AssociationsCB>
{
public:
    // One answer: the directory, its error record.
    class ResultItem
    {
    public:
        ResultItem(boost::shared_ptr<Zel_Directory> directory, boost::shared_ptr<Zel_Error> error);
        ResultItem(const ResultItem& other) = default;
        ResultItem(ResultItem&& other) = default;
        ResultItem& operator=(const ResultItem& other) = default;
        ResultItem& operator=(ResultItem&& other) = default;
        virtual ~ResultItem();

        boost::shared_ptr<Zel_Directory> mDirectory;
        boost::shared_ptr<Zel_Error> mError;
    };

    Zel_AssociationsRes(boost::shared_ptr<Zel_AssociationsCB> callback, bool finalResult);
    Zel_AssociationsRes(const Zel_AssociationsRes& other);
    Zel_AssociationsRes& operator=(const Zel_AssociationsRes& other);
    virtual ~Zel_AssociationsRes();

    // Appends one answer; an empty error pointer is stored as a "no error" record.
    virtual void setResult(boost::shared_ptr<Zel_Directory> directory,
                           boost::shared_ptr<Zel_Error> error);

protected:
    std::vector<ResultItem> mItems;
    quint64 mCursor;
    boost::shared_ptr<Zel_AssociationsCB> mCallback;

private:
    friend class Zel_GenericRes<Zel_AssociationsRes, Zel_AssociationsCB>;
    static void callSucceeded(Zel_AssociationsCB& callback, const ResultItem& item);
};

#endif
