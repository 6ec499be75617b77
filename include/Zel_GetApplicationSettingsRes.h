// Zel_GetApplicationSettingsRes: the answers to Zel_GetApplicationSettingsReq,
// each the application settings as one text.
//
// The backend creates it with the request's Zel_GetApplicationSettingsCB and
// the final-result flag and adds the answers in order with setResult(text,
// error). The engine then calls deliverNext() once per answer: succeeded(text)
// for a success, failed(error) for an error record that reports an error, and
// finished() after the last answer of a final result. An empty error pointer
// counts as "no error". Delivery is that of Zel_GenericRes. Filled by one
// thread, then delivered; no lock.
#ifndef ZEL_GETAPPLICATIONSETTINGSRES_H
#define ZEL_GETAPPLICATIONSETTINGSRES_H

#include "zel_export.h"
#include "Zel_GenericRes.h"
#include "Zel_GetApplicationSettingsCB.h"

#include <QString>
#include <QtGlobal>
#include <boost/shared_ptr.hpp>

#include <vector>

class Zel_Error;

class ZEL_EXPORT Zel_GetApplicationSettingsRes
    : public Zel_GenericRes<Zel_GetApplicationSettingsRes, Zel_GetApplicationSettingsCB>
{
public:
    // One answer: the settings text, its error record.
    class ResultItem
    {
    public:
        ResultItem(QString text, boost::shared_ptr<Zel_Error> error);
        ResultItem(const ResultItem& other) = default;
        ResultItem(ResultItem&& other) = default;
        ResultItem& operator=(const ResultItem& other) = default;
        ResultItem& operator=(ResultItem&& other) = default;
        virtual ~ResultItem();

        QString mText;
        boost::shared_ptr<Zel_Error> mError;
    };

    Zel_GetApplicationSettingsRes(boost::shared_ptr<Zel_GetApplicationSettingsCB> callback,
                                  bool finalResult);
    Zel_GetApplicationSettingsRes(const Zel_GetApplicationSettingsRes& other);
    Zel_GetApplicationSettingsRes& operator=(const Zel_GetApplicationSettingsRes& other);
    virtual ~Zel_GetApplicationSettingsRes();

    // Appends one answer; an empty error pointer is stored as a "no error" record.
    virtual void setResult(QString text, boost::shared_ptr<Zel_Error> error);

protected:
    boost::shared_ptr<Zel_GetApplicationSettingsCB> mCallback;
    std::vector<ResultItem> mItems;
    quint64 mCursor;

private:
    friend class Zel_GenericRes<Zel_GetApplicationSettingsRes, Zel_GetApplicationSettingsCB>;
    static void callSucceeded(Zel_GetApplicationSettingsCB& callback, const ResultItem& item);
};

#endif
