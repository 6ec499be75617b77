// Zel_SetApplicationSettingsRes: the answers to Zel_SetApplicationSettingsReq,
// each only whether the settings were stored.
//
// The backend creates it with the request's Zel_SetApplicationSettingsCB and
// the final-result flag and adds the answers in order with setResult(error).
// The engine then calls deliverNext() once per answer: succeeded() for a
// success, failed(error) for an error record that reports an error, and
// finished() after the last answer of a final result. An empty error pointer
// counts as "no error". Delivery is that of Zel_GenericRes. Filled by one
// thread, then delivered; no lock.
#ifndef ZEL_SETAPPLICATIONSETTINGSRES_H
#define ZEL_SETAPPLICATIONSETTINGSRES_H

#include "zel_export.h"
#include "Zel_GenericRes.h"
#include "Zel_SetApplicationSettingsCB.h"

#include <QtGlobal>
#include <boost/shared_ptr.hpp>

#include <vector>

class Zel_Error;

class ZEL_EXPORT Zel_SetApplicationSettingsRes
    : public Zel_GenericRes<Zel_SetApplicationSettingsRes, Zel_SetApplicationSettingsCB>
{
public:
    // One answer: its error record.
    class ResultItem
    {
    public:
        explicit ResultItem(boost::shared_ptr<Zel_Error> error);
        ResultItem(const ResultItem& other) = default;
        ResultItem(ResultItem&& other) = default;
        ResultItem& operator=(const ResultItem& other) = default;
        ResultItem& operator=(ResultItem&& other) = default;
        virtual ~ResultItem();

        boost::shared_ptr<Zel_Error> mError;
    };

    Zel_SetApplicationSettingsRes(boost::shared_ptr<Zel_SetApplicationSettingsCB> callback,
                                  bool finalResult);
    Zel_SetApplicationSettingsRes(const Zel_SetApplicationSettingsRes& other);
    Zel_SetApplicationSettingsRes& operator=(const Zel_SetApplicationSettingsRes& other);
    virtual ~Zel_SetApplicationSettingsRes();

    // Appends one answer; an empty error pointer is stored as a "no error" record.
    virtual void setResult(boost::shared_ptr<Zel_Error> error);

protected:
    boost::shared_ptr<Zel_SetApplicationSettingsCB> mCallback;
    std::vector<ResultItem> mItems;
    quint64 mCursor;

private:
    friend class Zel_GenericRes<Zel_SetApplicationSettingsRes, Zel_SetApplicationSettingsCB>;
    static void callSucceeded(Zel_SetApplicationSettingsCB& callback, const ResultItem& item);
};

#endif
