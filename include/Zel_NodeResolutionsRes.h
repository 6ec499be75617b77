// Zel_NodeResolutionsRes: the answers to Zel_NodeResolutionsReq, each a media
// object identifier with its text.
//
// The backend creates it with the request's Zel_NodeResolutionsCB and the
// final-result flag and adds the answers in order with setResult(mobID, text,
// error). The engine then calls deliverNext() once per answer:
// succeeded(mobID, text) for a success, failed(error) for an error record that
// reports an error, and finished() after the last answer of a final result. An
// empty error pointer counts as "no error". Delivery is that of
// Zel_GenericRes. Filled by one thread, then delivered; no lock.
#ifndef ZEL_NODERESOLUTIONSRES_H
#define ZEL_NODERESOLUTIONSRES_H

#include "zel_export.h"
#include "Zel_GenericRes.h"
#include "Zel_NodeResolutionsCB.h"

#include <QString>
#include <QtGlobal>
#include <boost/shared_ptr.hpp>

#include <vector>

class Zel_Error;
class Zel_MobID;

class ZEL_EXPORT Zel_NodeResolutionsRes
    : public Zel_GenericRes<Zel_NodeResolutionsRes, Zel_NodeResolutionsCB>
{
public:
    // One answer: the text, its error record, the media object identifier.
    class ResultItem
    {
    public:
        ResultItem(boost::shared_ptr<Zel_MobID> mobID, boost::shared_ptr<QString> text,
                   boost::shared_ptr<Zel_Error> error);
        ResultItem(const ResultItem& other) = default;
        ResultItem(ResultItem&& other) = default;
        ResultItem& operator=(const ResultItem& other) = default;
        ResultItem& operator=(ResultItem&& other) = default;
        virtual ~ResultItem();

        boost::shared_ptr<QString> mText;
        boost::shared_ptr<Zel_Error> mError;
        boost::shared_ptr<Zel_MobID> mMobID;
    };

    Zel_NodeResolutionsRes(boost::shared_ptr<Zel_NodeResolutionsCB> callback, bool finalResult);
    Zel_NodeResolutionsRes(const Zel_NodeResolutionsRes& other);
    Zel_NodeResolutionsRes& operator=(const Zel_NodeResolutionsRes& other);
    virtual ~Zel_NodeResolutionsRes();

    // Appends one answer; an empty error pointer is stored as a "no error" record.
    virtual void setResult(boost::shared_ptr<Zel_MobID> mobID, boost::shared_ptr<QString> text,
                           boost::shared_ptr<Zel_Error> error);

protected:
    boost::shared_ptr<Zel_NodeResolutionsCB> mCallback;
    std::vector<ResultItem> mItems;
    quint64 mCursor;

private:
    friend class Zel_GenericRes<Zel_NodeResolutionsRes, Zel_NodeResolutionsCB>;
    static void callSucceeded(Zel_NodeResolutionsCB& callback, const ResultItem& item);
};

#endif
