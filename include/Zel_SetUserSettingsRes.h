// Zel_SetUserSettingsRes: the answers to Zel_SetUserSettingsReq, each only
// whether the settings were stored.
//
// The backend creates it with the request's Zel_SetUserSettingsCB and the
// final-result flag and adds the answers in order with setResult(error). The
// engine then calls deliverNext() once per answer: succeeded() for a success,
// failed(error) for an error record that reports an error, and finished()
// after the last answer of a final result. An empty error pointer counts as
// "no error". Delivery is that of Zel_GenericRes. Filled by one thread, then
// delivered; no lock.
#ifndef ZEL_SETUSERSETTINGSRES_H
#define ZEL_SETUSERSETTINGSRES_H

#include "zel_export.h"
#include "Zel_GenericRes.h"
#include "Zel_SetUserSettingsCB.h"

#include <QtGlobal>
#include <boost/shared_ptr.hpp>

#include <vector>

class Zel_Error;

class ZEL_EXPORT Zel_SetUserSettingsRes
    : public Zel_GenericRes<Zel_SetUserSettingsRes, Zel_SetUserSettingsCB>
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

    Zel_SetUserSettingsRes(boost::shared_ptr<Zel_SetUserSettingsCB> callback, bool finalResult);
    Zel_SetUserSettingsRes(const Zel_SetUserSettingsRes& other);
    Zel_SetUserSettingsRes& operator=(const Zel_SetUserSettingsRes& other);
    virtual ~Zel_SetUserSettingsRes();

    // Appends one answer; an empty error pointer is stored as a "no error" record.
    virtual void setResult(boost::shared_ptr<Zel_Error> error);

protected:
    boost::shared_ptr<Zel_SetUserSettingsCB> mCallback;
    std::vector<ResultItem> mItems;
    quint64 mCursor;

private:
    friend class Zel_GenericRes<Zel_SetUserSettingsRes, Zel_SetUserSettingsCB>;
    static void callSucceeded(Zel_SetUserSettingsCB& callback, const ResultItem& item);
};

#endif
