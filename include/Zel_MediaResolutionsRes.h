// Zel_MediaResolutionsRes: the answers to Zel_MediaResolutionsReq, each a list
// of media resolutions described as property keys; each handler call receives
// its own copy.
//
// The backend creates it with the request's Zel_MediaResolutionsCB and the
// final-result flag and adds the answers in order with setResult(resolutions,
// error). The engine then calls deliverNext() once per answer:
// succeeded(resolutions) for a success, failed(error) for an error record that
// reports an error, and finished() after the last answer of a final result. An
// empty error pointer counts as "no error". Delivery is that of
// Zel_GenericRes. Filled by one thread, then delivered; no lock.
#ifndef ZEL_MEDIARESOLUTIONSRES_H
#define ZEL_MEDIARESOLUTIONSRES_H

#include "zel_export.h"
#include "Zel_GenericRes.h"
#include "Zel_MediaResolutionsCB.h"
#include "Zel_PropertyKeyInfoList.h"

#include <QtGlobal>
#include <boost/shared_ptr.hpp>

#include <vector>

class Zel_Error;

class ZEL_EXPORT Zel_MediaResolutionsRes
    : public Zel_GenericRes<Zel_MediaResolutionsRes, Zel_MediaResolutionsCB>
{
public:
    // One answer: the key description list, its error record.
    class ResultItem
    {
    public:
        ResultItem(Zel_PropertyKeyInfoList resolutions, boost::shared_ptr<Zel_Error> error);
        ResultItem(const ResultItem& other) = default;
        ResultItem(ResultItem&& other) = default;
        ResultItem& operator=(const ResultItem& other) = default;
        ResultItem& operator=(ResultItem&& other) = default;
        virtual ~ResultItem();

        Zel_PropertyKeyInfoList mResolutions;
        boost::shared_ptr<Zel_Error> mError;
    };

    Zel_MediaResolutionsRes(boost::shared_ptr<Zel_MediaResolutionsCB> callback, bool finalResult);
    Zel_MediaResolutionsRes(const Zel_MediaResolutionsRes& other);
    Zel_MediaResolutionsRes& operator=(const Zel_MediaResolutionsRes& other);
    virtual ~Zel_MediaResolutionsRes();

    // Appends one answer; an empty error pointer is stored as a "no error" record.
    virtual void setResult(Zel_PropertyKeyInfoList resolutions, boost::shared_ptr<Zel_Error> error);

protected:
    boost::shared_ptr<Zel_MediaResolutionsCB> mCallback;
    std::vector<ResultItem> mItems;
    quint64 mCursor;

private:
    friend class Zel_GenericRes<Zel_MediaResolutionsRes, Zel_MediaResolutionsCB>;
    static void callSucceeded(Zel_MediaResolutionsCB& callback, const ResultItem& item);
};

#endif
