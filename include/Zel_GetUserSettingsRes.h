// Zel_GetUserSettingsRes: the answers to Zel_GetUserSettingsReq, each the kind
// of user settings (passed through unchanged) and their text.
//
// The backend creates it with the request's Zel_GetUserSettingsCB and the
// final-result flag and adds the answers in order with setResult(type, text,
// error). The engine then calls deliverNext() once per answer: succeeded(type,
// text) for a success, failed(error) for an error record that reports an
// error, and finished() after the last answer of a final result. An empty
// error pointer counts as "no error". Delivery is that of Zel_GenericRes.
// Filled by one thread, then delivered; no lock.
#ifndef ZEL_GETUSERSETTINGSRES_H
#define ZEL_GETUSERSETTINGSRES_H

#include "zel_export.h"
#include "Zel_GenericRes.h"
#include "Zel_GetUserSettingsCB.h"

#include <QString>
#include <QtGlobal>
#include <boost/shared_ptr.hpp>

#include <vector>

class Zel_Error;

class ZEL_EXPORT Zel_GetUserSettingsRes
    : public Zel_GenericRes<Zel_GetUserSettingsRes, Zel_GetUserSettingsCB>
{
public:
    // One answer: the settings type, the settings text, its error record.
    class ResultItem
    {
    public:
        ResultItem(Zel_GetUserSettingsCB::UserSettingsType type, QString text,
                   boost::shared_ptr<Zel_Error> error);
        ResultItem(const ResultItem& other) = default;
        ResultItem(ResultItem&& other) = default;
        ResultItem& operator=(const ResultItem& other) = default;
        ResultItem& operator=(ResultItem&& other) = default;
        virtual ~ResultItem();

        Zel_GetUserSettingsCB::UserSettingsType mType;
        QString mText;
        boost::shared_ptr<Zel_Error> mError;
    };

    Zel_GetUserSettingsRes(boost::shared_ptr<Zel_GetUserSettingsCB> callback, bool finalResult);
    Zel_GetUserSettingsRes(const Zel_GetUserSettingsRes& other);
    Zel_GetUserSettingsRes& operator=(const Zel_GetUserSettingsRes& other);
    virtual ~Zel_GetUserSettingsRes();

    // Appends one answer; an empty error pointer is stored as a "no error" record.
    virtual void setResult(Zel_GetUserSettingsCB::UserSettingsType type, QString text,
                           boost::shared_ptr<Zel_Error> error);

protected:
    boost::shared_ptr<Zel_GetUserSettingsCB> mCallback;
    std::vector<ResultItem> mItems;
    quint64 mCursor;

private:
    friend class Zel_GenericRes<Zel_GetUserSettingsRes, Zel_GetUserSettingsCB>;
    static void callSucceeded(Zel_GetUserSettingsCB& callback, const ResultItem& item);
};

#endif
